// The table of the global values: one row a keyword, in file order.
#include "data/global_var.h"
#include "files/declare_field.h"
#include "texts/text_numbers.h"

namespace {

using G = HD_Global_Var;
using U = UnitGroup;

constexpr auto resisZone =
    FieldsOf<G>({Integer<&G::ResisZone>("ResisZone"), Number<&G::ZoneResistance1>("ZoneResistance1"),
                 Number<&G::ZoneResistance2>("ZoneResistance2"), Number<&G::ZoneResistance3>("ZoneResistance3")});
constexpr GlobalKeyword globalValues[] = {
    Number<&G::G_waterlevel>("G_waterlevel", U::WaterLevel),
    Choice<&G::iLevelDepth>("iLevelDepth"),
    Number<&G::G_discharge>("G_discharge", U::Discharge),
    Number<&G::G_wind_factor>("G_wind_factor", U::Factor).Digits(3),
    Number<&G::G_resistance>("G_resistance"),
    Number<&G::G_S_max>("G_S_max"),
    Number<&G::G_f>("G_f"),
    Number<&G::G_k_100>("G_k_100"),
    Number<&G::G_min_width>("G_min_width"),
    Number<&G::G_flood_plan_res>("G_flood_plan_res", U::FloodPlainResistance).Digits(2),
    Choice<&G::G_wave>("G_wave").Choices(Str::WaveApproximations),
    {"ResisZone", resisZone},
};

constexpr GlobalKeyword defaultValues[] = {
    Number<&G::delta>("delta", U::Factor).Digits(2).Range(0.5, 1),
    Number<&G::delhs>("delhs", U::WaterLevel).Digits(7),
    Number<&G::delh>("delh", U::WaterLevel).Digits(3),
    Number<&G::alpha>("alpha", U::Factor).Digits(2),
    Number<&G::theta>("theta", U::Factor).Digits(2),
    Number<&G::eps>("eps", U::Factor).Digits(5),
    Number<&G::dh_node>("dh_node", U::WaterLevel).Digits(3),
    Number<&G::zeta_min>("zeta_min", U::Factor).Digits(3).Range(0),
    Number<&G::struc_fac>("struc_fac", U::Factor).Digits(1),
    Number<&G::froude_exp>("froude_exp", U::Factor).Digits(1),
    Number<&G::froude_max>("froude_max", U::Factor).Digits(2),
    Integer<&G::no_iter>("no_iter"),
    Integer<&G::max_iter>("max_iter"),
    Integer<&G::inter1_max>("inter1_max"),
    Boolean<&G::wind_shear_stress>("wind_shear_stress"),
    Integer<&G::resist_num>("resist_num"),
    Number<&G::spilfc>("spilfc"),
    Number<&G::storfc>("storfc"),
};

constexpr auto energyEquation =
    FieldsOf<G>({Boolean<&G::EnergyEquation>("EnergyEquation"), Choice<&G::FrictionSlope>("FrictionSlope")});
constexpr auto contractExpansion = FieldsOf<G>(
    {Number<&G::G_Contraction>("G_Contraction", U::Factor), Number<&G::G_Expansion>("G_Expansion", U::Factor)});
constexpr GlobalKeyword quasiSteady[] = {
    Number<&G::relax>("relax", U::Factor),
    Number<&G::beta_limit>("beta_limit", U::Factor).Digits(8),
    Number<&G::fac_0>("fac_0", U::Factor),
    Number<&G::qconv_factor>("qconv_factor", U::Factor),
    Number<&G::hconv_factor>("hconv_factor", U::Factor),
    Number<&G::min_hconv>("min_hconv", U::WaterLevel),
    Number<&G::qstruc_factor>("qstruc_factor", U::Factor),
    Number<&G::hstop>("hstop", U::WaterLevel),
    {"EnergyEquation", energyEquation},
    Boolean<&G::ContractExpansion>("ContractExpansion"),
    Boolean<&G::SlopeUpstream>("SlopeUpstream"),
    Boolean<&G::VelocityCoefficient>("VelocityCoefficient"),
    Boolean<&G::NoConvectiveSuppression>("NoConvectiveSuppression"),
    {"G_ContractExpansion", contractExpansion},
};

template <bool HDAddOutput::*Flag>
constexpr Field Switch(std::string_view name)
{
    return Boolean<&G::AddOutput, Flag>(name);
}
using A = HDAddOutput;
constexpr GlobalKeyword addOutput[] = {
    Integer<&G::AddOutput, &A::ReducedOut>("ReducedOut"),
    Switch<&A::Velo_H>("Velo_H"),
    Switch<&A::Velo_struc>("Velo_struc"),
    Switch<&A::Discharge_H>("Discharge_H"),
    Switch<&A::CrossSec_H>("CrossSec_H"),
    Switch<&A::FlowWidth_H>("FlowWidth_H"),
    Switch<&A::Radius_H>("Radius_H"),
    Switch<&A::Resistance_H>("Resistance_H"),
    Switch<&A::Conveyance_H>("Conveyance_H"),
    Switch<&A::FroudeNum_H>("FroudeNum_H"),
    Switch<&A::Volume_H>("Volume_H"),
    Switch<&A::Volume_Total>("Volume_Total"),
    Switch<&A::FloodArea_H>("FloodArea_H"),
    Switch<&A::FloodArea_Total>("FloodArea_Total"),
    Switch<&A::MassError_H>("MassError_H"),
    Switch<&A::MassError_Total>("MassError_Total"),
    Switch<&A::AcumMassError_Total>("AcumMassError_Total"),
    Switch<&A::Topo_print>("Topo_print"),
    Switch<&A::Coef_print>("Coef_print"),
    Switch<&A::Test_print>("Test_print"),
    Switch<&A::LatInflows_H>("LatInflows_H"),
    Switch<&A::EnergyLevel>("EnergyLevel"),
    Switch<&A::EnergySlope>("EnergySlope"),
    Switch<&A::WaterSlope>("WaterSlope"),
    Switch<&A::BedShearStress>("BedShearStress"),
    Switch<&A::GroundwaterHead>("GroundwaterHead"),
    Switch<&A::TimeStep>("TimeStep"),
};

using X = HDMixingCoefficients;
constexpr auto mixingCoef =
    FieldsOf<G>({Group<&G::Mixing, &X::CoefPairs>("CoefPairs"), Number<&G::Mixing, &X::MixCoef1>("MixCoef1"),
                 Number<&G::Mixing, &X::MixCoef2>("MixCoef2"), Number<&G::Mixing, &X::MixCoef3>("MixCoef3"),
                 Number<&G::Mixing, &X::MixCoef4>("MixCoef4")});
constexpr GlobalKeyword mixingCoefficients[] = {{"MixingCoef", mixingCoef}};

// A count alone would leave these two keywords with a single parameter, which readers take for a value.
constexpr Field title = Plain<std::string>("Title");
constexpr Field interpolate = Plain<bool>("Interpolate");
constexpr GlobalKeyword markTitles[] = {PlainGroup<title, &G::MarkTitles>("MarkTitles").PadWhenEmpty(),
                                        PlainGroup<interpolate, &G::MarkInterpolate>("MarkInterpolate").PadWhenEmpty()};

using B = HDBedResistTools;
constexpr auto bedResist =
    FieldsOf<G>({Integer<&G::BedResist, &B::Method>("Method"), Boolean<&G::BedResist, &B::Option1>("Option1"),
                 Boolean<&G::BedResist, &B::Option2>("Option2"), Boolean<&G::BedResist, &B::Option3>("Option3"),
                 Group<&G::BedResist, &B::VeloRes>("VeloRes"), Number<&G::BedResist, &B::CoefA>("CoefA"),
                 Number<&G::BedResist, &B::CoefB>("CoefB"), Number<&G::BedResist, &B::MinRes>("MinRes"),
                 Number<&G::BedResist, &B::MaxRes>("MaxRes")});
constexpr GlobalKeyword bedResistTools[] = {{"BRTools", bedResist}};

using C = HDCurveIncrement;
constexpr auto curve = FieldsOf<G>({Boolean<&G::CurveIncrement, &C::Enabled>("Enabled"),
                                    Boolean<&G::CurveIncrement, &C::SystemRange>("SystemRange"),
                                    Boolean<&G::CurveIncrement, &C::SystemWidth>("SystemWidth"),
                                    Boolean<&G::CurveIncrement, &C::SystemRadius>("SystemRadius"),
                                    Boolean<&G::CurveIncrement, &C::SystemVelocity>("SystemVelocity"),
                                    Choice<&G::CurveIncrement, &C::Range>("Range").Choices(Str::AverageRanges),
                                    Number<&G::CurveIncrement, &C::Width>("Width", U::Width),
                                    Number<&G::CurveIncrement, &C::Radius>("Radius", U::Radius),
                                    Number<&G::CurveIncrement, &C::Velocity>("Velocity", U::Velocity)});
constexpr GlobalKeyword waterLevelCurve[] = {{"WLDueToCurve", curve}};

using S = HDSandBarIncrement;
constexpr auto sand = FieldsOf<G>({Boolean<&G::SandBarIncrement, &S::Enabled>("Enabled"),
                                   Choice<&G::SandBarIncrement, &S::Method>("Method"),
                                   Number<&G::SandBarIncrement, &S::Slope>("Slope", U::Slope),
                                   Number<&G::SandBarIncrement, &S::Width>("Width", U::Width),
                                   Number<&G::SandBarIncrement, &S::Area>("Area", U::Area),
                                   Number<&G::SandBarIncrement, &S::Observed>("Observed", U::WaterLevel)});
constexpr GlobalKeyword waterLevelSandBars[] = {{"WLDueToSand", sand}};

constexpr GlobalKeyword encroachment[] = {Integer<&G::Max_no_iter>("Max_no_iter")};

using H = HDHeatBalance;
constexpr GlobalKeyword heatBalance[] = {
    Boolean<&G::HeatBalance, &H::Calc>("Calc"),
    Number<&G::HeatBalance, &H::Latitude>("Latitude", U::GeoAngle),
    Number<&G::HeatBalance, &H::Longitude>("Longitude", U::GeoAngle),
    Number<&G::HeatBalance, &H::TimeZone>("TimeZone", U::TimeDisplacement),
    Number<&G::HeatBalance, &H::DisTime>("DisTime", U::TimeDisplacement),
    Number<&G::HeatBalance, &H::LightAtt>("LightAtt", U::LightAttenuation),
    Number<&G::HeatBalance, &H::betaBeer>("betaBeer", U::Factor),
    Number<&G::HeatBalance, &H::RadA>("RadA", U::Factor),
    Number<&G::HeatBalance, &H::RadB>("RadB", U::Factor),
    Number<&G::HeatBalance, &H::VapA>("VapA", U::Factor),
    Number<&G::HeatBalance, &H::VapB>("VapB", U::Factor),
};

using T = HDStratification;
constexpr GlobalKeyword stratification[] = {
    Integer<&G::Stratification, &T::npv>("npv"),
    Boolean<&G::Stratification, &T::dens>("dens"),
    Number<&G::Stratification, &T::visc>("visc", U::Viscosity),
    Choice<&G::Stratification, &T::vmf>("vmf"),
    Choice<&G::Stratification, &T::vmb>("vmb"),
    Boolean<&G::Stratification, &T::Rich>("Rich"),
    Number<&G::Stratification, &T::bpr1>("bpr1", U::Factor),
    Number<&G::Stratification, &T::bpr2>("bpr2", U::Factor),
    Number<&G::Stratification, &T::uu>("uu", U::Factor),
    Number<&G::Stratification, &T::uw>("uw", U::Factor),
    Number<&G::Stratification, &T::uwc>("uwc", U::Factor),
    Number<&G::Stratification, &T::dfx>("dfx", U::Factor),
    Number<&G::Stratification, &T::dfz>("dfz", U::Factor),
};

using K = HDKlrConstants;
constexpr GlobalKeyword klrParam[] = {
    Number<&G::Klr, &K::fricfac>("fricfac", U::Factor),
    Number<&G::Klr, &K::maxvol>("maxvol", U::Volume).Digits(8),
    Number<&G::Klr, &K::maxvelo>("maxvelo", U::Velocity),
    Number<&G::Klr, &K::minthick>("minthick", U::WaterLevel),
    Number<&G::Klr, &K::densdiff>("densdiff", U::Factor),
    Choice<&G::Klr, &K::action>("action"),
    Number<&G::Klr, &K::R1>("R1", U::Factor),
    Number<&G::Klr, &K::R2>("R2", U::Factor),
    Number<&G::Klr, &K::Rs>("Rs", U::Factor),
};

using I = HDKlrInitial;
constexpr GlobalKeyword klrInit[] = {
    Number<&G::KlrInit, &I::h1>("h1", U::WaterLevel).Digits(8),
    Number<&G::KlrInit, &I::h0>("h0", U::WaterLevel).Digits(8),
    Number<&G::KlrInit, &I::Q1>("Q1", U::Discharge).Digits(8),
    Number<&G::KlrInit, &I::Q0>("Q0", U::Discharge).Digits(8),
    Number<&G::G_friction_factor>("G_friction_factor", U::Factor).Digits(3),
};

using O = HDTextOutput;
constexpr auto summaryInfo = FieldsOf<G>({BooleanAt<0, &G::TextOutput, &O::SummaryInfo>("Minimum"),
                                          BooleanAt<1, &G::TextOutput, &O::SummaryInfo>("Maximum"),
                                          BooleanAt<2, &G::TextOutput, &O::SummaryInfo>("TimeOfMinimum"),
                                          BooleanAt<3, &G::TextOutput, &O::SummaryInfo>("TimeOfMaximum")});
constexpr GlobalKeyword textOutput[] = {
    Boolean<&G::TextOutput, &O::GenerateOutput>("GenerateOutput"),
    Text<&G::TextOutput, &O::Delimiter>("Delimiter"),
    Integer<&G::TextOutput, &O::ColumnWidth>("ColumnWidth"),
    {"SummaryInfo", summaryInfo},
    Choice<&G::TextOutput, &O::GridPointOutputType>("GridPointOutputType"),
    Boolean<&G::TextOutput, &O::LimitedPeriod>("LimitedPeriod"),
    DateTime<&G::TextOutput, &O::LimitedPeriodStart>("LimitedPeriodStart"),
    DateTime<&G::TextOutput, &O::LimitedPeriodEnd>("LimitedPeriodEnd"),
};
constexpr auto textLists = FieldsOf<G>(
    {Group<&G::TextOutput, &O::OutputItems>("OutputItems"), Group<&G::TextOutput, &O::OutputFiles>("OutputFiles")});

// Files from before ground elevations could come from a DEM have no use for the three keywords that refine it.
constexpr std::string_view groundElevation = "ApplyDemGroundElevation";
using M = HDMapOutput;
constexpr GlobalKeyword mapOutput[] = {
    Boolean<&G::MapOutput, &M::GenerateOutput>("GenerateOutput"),
    Boolean<&G::MapOutput, &M::ApplyDemInRiverXsec>("ApplyDemInRiverXsec"),
    Boolean<&G::MapOutput, &M::ApplyDemGroundElevation>(groundElevation),
    {Boolean<&G::MapOutput, &M::MapAreaGeoDb>("MapAreaGeoDb"), groundElevation},
    {FileName<&G::MapOutput, &M::GeoDb>("GeoDb"), groundElevation},
    {Boolean<&G::MapOutput, &M::AddToCalculation>("AddToCalculation"), groundElevation},
};
constexpr auto mapLists = FieldsOf<G>({Group<&G::MapOutput, &M::MapOutputFiles>("MapOutputFiles"),
                                       Group<&G::MapOutput, &M::DemInputFiles>("DemInputFiles")});

using L = HDLeakageGlobal;
constexpr GlobalKeyword leakage[] = {
    Boolean<&G::Leakage, &L::IncludeLeakage>("IncludeLeakage"),
    Number<&G::Leakage, &L::LeakageCoefficient>("LeakageCoefficient", U::LeakageCoefficient).Digits(3),
};

constexpr GlobalSection sections[] = {
    {"Global_Values", globalValues},
    {"Defalt_Values", defaultValues}, // spelled so in every file
    {"Quasi_steady", quasiSteady},
    {"Add_Output", addOutput},
    {"MixingCoefficients", mixingCoefficients},
    {"WaterLevelMarkTitles", markTitles},
    {"BedResistTools", bedResistTools},
    {"WaterLevelCurve", waterLevelCurve},
    {"WaterLevelSandBars", waterLevelSandBars},
    {"Encroachment", encroachment},
    {"Heat_Balance", heatBalance},
    {"Stratification", stratification},
    {"KlrParam", klrParam},
    {"KlrInit", klrInit},
    {"TextOutput", textOutput, textLists},
    {"MapOutput", mapOutput, mapLists},
    {"Leakage", leakage},
};

} // namespace

std::span<const GlobalSection> HDGlobalSections()
{
    return sections;
}

FieldList CTextOutItem::DeclaredFields()
{
    using I = CTextOutItem;
    static constexpr auto fields =
        FieldsOf<I>({Choice<&I::Item>("Item").Title(Str::OutputItemColumns, 0).Choices(Str::OutputItems),
                     Text<&I::UserName>("UserName").Title(Str::OutputItemColumns, 1),
                     Integer<&I::Decimals>("Decimals").Title(Str::OutputItemColumns, 2)});
    return fields;
}

FieldList CTextAutoFile::DeclaredFields()
{
    using F = CTextAutoFile;
    static constexpr auto fields =
        FieldsOf<F>({Text<&F::Format>("Format").Title(Str::OutputFileColumns, 0).Choices(Str::OutputFormats),
                     Boolean<&F::AutoName>("AutoName").Title(Str::OutputFileColumns, 1),
                     ::FileName<&F::FileName>("FileName").Title(Str::OutputFileColumns, 2)});
    return fields;
}

FieldList CMapsOutput::DeclaredFields()
{
    using R = CMapsOutput;
    constexpr Str titles = Str::MapColumns; // among them, behind the file, one for a button
    static constexpr auto fields = FieldsOf<R>(
        {Number<&R::XOrigin>("XOrigin", U::Coordinate).Title(titles, 0),
         Number<&R::YOrigin>("YOrigin", U::Coordinate).Title(titles, 1),
         Number<&R::Rotation>("Rotation", U::Rotation).Title(titles, 2),
         Number<&R::GridSize>("GridSize", U::GridSize).Title(titles, 3), Integer<&R::JCells>("JCells").Title(titles, 4),
         Integer<&R::KCells>("KCells").Title(titles, 5), Integer<&R::Reserved>("Reserved"),
         ::FileName<&R::FileName>("FileName").Title(titles, 6),
         Choice<&R::Type>("Type").Title(titles, 8).Choices(Str::MapTypes),
         Integer<&R::StoringFrequency>("StoringFrequency").Title(titles, 11),
         Choice<&R::Item>("Item").Title(titles, 9).Choices(Str::MapItems),
         Integer<&R::ComponentNo>("ComponentNo").Title(titles, 10),
         Boolean<&R::DefaultPeriod>("DefaultPeriod").Title(titles, 12),
         DateTime<&R::StartTime>("StartTime").Title(titles, 13), DateTime<&R::EndTime>("EndTime").Title(titles, 14)});
    return fields;
}

FieldList CMapsInput::DeclaredFields()
{
    using M = CMapsInput;
    static constexpr auto fields = FieldsOf<M>({::FileName<&M::FileName>("FileName").Title(Str::DemColumns, 0),
                                                Integer<&M::ItemNo>("ItemNo").Title(Str::DemColumns, 2),
                                                Integer<&M::Order>("Order").Title(Str::DemColumns, 3)});
    return fields;
}
