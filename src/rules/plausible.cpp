#include "rules/plausible.h"

namespace {

using G = HD_Global_Var;

#define TQL_TEXT(context, english) english
// Chow, Open-Channel Hydraulics (1959), table 5-6: Manning's n from 0.008 (glass) to 0.2 (brush); over land up to 0.8
// (Engman 1986). M is 1/n, and Chezy's C is R^(1/6)/n with a hydraulic radius of 0.1 to 30 m.
constexpr const char* formulaN = TQL_TEXT("HDRules", "Manning's n is 0.008 for glass and 0.8 for dense grass");
constexpr const char* formulaM = TQL_TEXT("HDRules", "Manning's M, 1/n, is 125 for glass and 1 for dense grass");
constexpr const char* formulaC = TQL_TEXT("HDRules", "Chezy's C is between 1 and 220 m^½/s for all beds and depths");
// The largest flood that left traces, that of glacial Lake Missoula, had some 10 million m³/s.
constexpr const char* discharge = TQL_TEXT("HDRules", "the largest flood known had 10 million m³/s");
// The shore of the Dead Sea and the highest lakes; the deepest lake has 1,642 m.
constexpr const char* level =
    TQL_TEXT("HDRules", "no water stands lower than the Dead Sea or higher than the highest lakes");
constexpr const char* depth = TQL_TEXT("HDRules", "a depth is not negative, and the deepest lake has 1,642 m");
constexpr const char* angle = TQL_TEXT("HDRules", "beyond it there is no place on the Earth");
constexpr const char* wind =
    TQL_TEXT("HDRules", "the factor is 1 in open terrain and less where something shelters the river");
constexpr const char* loss = TQL_TEXT("HDRules", "a loss is a part of the velocity head");
constexpr const char* notNegative = TQL_TEXT("HDRules", "it cannot be negative");
constexpr const char* leakage = TQL_TEXT("HDRules", "beyond it all the water would be gone within a second");
constexpr const char* velocity = TQL_TEXT("HDRules", "no river flows as fast");
constexpr const char* slope = TQL_TEXT("HDRules", "a river bed is not as steep");
constexpr const char* none = TQL_TEXT("HDRules", "there has to be one at least");
constexpr const char* weight = TQL_TEXT("HDRules", "it weights two points in time or place");
#undef TQL_TEXT

constexpr double any = 1e9; // that is no bound of a river

template <int formula, int zones>
bool With(const G& global)
{
    return global.resist_num == formula && (zones < 0 || (global.ResisZone != 0) == (zones != 0));
}
/// 0 and -99 stand for "none" and "not set".
bool IsNoResistance(double value)
{
    return value == 0 || value == -99;
}
template <int depths>
bool InitialAre(const G& global)
{
    return (global.iLevelDepth != 0) == (depths != 0);
}
bool HasHeat(const G& global)
{
    return global.HeatBalance.Calc;
}

/// A resistance, which is of the formula that the file chooses. `zones`: 1 of three zones, 0 of a uniform section, -1
/// of both.
#define RESISTANCE(section, field, zones)                                                                              \
    {section, field, 1, 200, formulaM, &With<0, zones>, &IsNoResistance},                                              \
        {section, field, 0.005, 1, formulaN, &With<1, zones>, &IsNoResistance},                                        \
    {                                                                                                                  \
        section, field, 1, 220, formulaC, &With<2, zones>, &IsNoResistance                                             \
    }

constexpr Plausible values[] = {
    {"InitList", "InitialH", -500, 7000, level, &InitialAre<0>},
    {"InitList", "InitialH", 0, 2000, depth, &InitialAre<1>},
    {"InitList", "InitialQ", -1e7, 1e7, discharge},
    {"Global_Values", "G_waterlevel", -500, 7000, level, &InitialAre<0>},
    {"Global_Values", "G_waterlevel", 0, 2000, depth, &InitialAre<1>},
    {"Global_Values", "G_discharge", -1e7, 1e7, discharge},
    {"WindList", "WindFactor", 0, 10, wind},
    {"Global_Values", "G_wind_factor", 0, 10, wind},
    RESISTANCE("BedList", "Resistance", 0),
    RESISTANCE("BedList", "ZoneResistance1", 1),
    RESISTANCE("BedList", "ZoneResistance2", 1),
    RESISTANCE("BedList", "ZoneResistance3", 1),
    RESISTANCE("Global_Values", "G_resistance", 0),
    RESISTANCE("Global_Values", "ZoneResistance1", 1),
    RESISTANCE("Global_Values", "ZoneResistance2", 1),
    RESISTANCE("Global_Values", "ZoneResistance3", 1),
    RESISTANCE("FloodList", "FloodPlainResistance", -1),
    RESISTANCE("Global_Values", "G_flood_plan_res", -1),
    RESISTANCE("BedResistanceToolboxList", "ResValue", -1),
    RESISTANCE("BedResistTools", "ResValue", -1),
    {"BedResistanceToolboxList", "Velocity", 0, 50, velocity},
    {"BedResistTools", "Velocity", 0, 50, velocity},
    {"QSSContractionExpansionList", "Contraction", 0, 1, loss},
    {"QSSContractionExpansionList", "Expansion", 0, 1, loss},
    {"Quasi_steady", "G_Contraction", 0, 1, loss},
    {"Quasi_steady", "G_Expansion", 0, 1, loss},
    {"QSSReachLengthsList", "ReachLength1", 0, any, notNegative},
    {"QSSReachLengthsList", "ReachLength2", 0, any, notNegative},
    {"LeakageList", "LeakageCoefficient", 0, 1, leakage},
    {"Leakage", "LeakageCoefficient", 0, 1, leakage},
    {"WLCurveList", "CurveValue1", 0, any, notNegative},
    {"WLCurveList", "CurveValue2", 0, any, notNegative},
    {"WLCurveList", "CurveValue3", 0, 50, velocity},
    {"WLSandBarsList", "SandBarValue1", 0, 1, slope},
    {"WLSandBarsList", "SandBarValue2", 0, any, notNegative},
    {"WLSandBarsList", "SandBarValue3", 0, any, notNegative},
    {"KlrInitList", "h1", -500, 7000, level},
    {"KlrInitList", "h0", -500, 7000, level},
    {"KlrInitList", "Q1", -1e7, 1e7, discharge},
    {"KlrInitList", "Q0", -1e7, 1e7, discharge},
    {"KlrInit", "h1", -500, 7000, level},
    {"KlrInit", "h0", -500, 7000, level},
    {"KlrInit", "Q1", -1e7, 1e7, discharge},
    {"KlrInit", "Q0", -1e7, 1e7, discharge},
    {"Defalt_Values", "theta", 0, 1, weight},
    {"Defalt_Values", "max_iter", 1, any, none},
    {"Defalt_Values", "no_iter", 1, any, none},
    {"Heat_Balance", "Latitude", -90, 90, angle, &HasHeat},
    {"Heat_Balance", "Longitude", -180, 180, angle, &HasHeat},
    {"Stratification", "npv", 1, any, none},
    {"MapOutputFiles", "GridSize", 1e-3, any, notNegative},
    {"MapOutputFiles", "JCells", 1, any, none},
    {"MapOutputFiles", "KCells", 1, any, none},
    {"MapOutputFiles", "StoringFrequency", 1, any, none},
};
#undef RESISTANCE

} // namespace

std::span<const Plausible> PlausibleValues()
{
    return values;
}
