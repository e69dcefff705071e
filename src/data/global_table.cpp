// The table of the global values: one row a keyword, in file order.
#include "data/global_var.h"

namespace {

using G = HD_Global_Var;
using U = UnitGroup;

constexpr Field resisZone[] = {Integer<&G::ResisZone>("ResisZone"), Number<&G::ZoneResistance1>("ZoneResistance1"),
                               Number<&G::ZoneResistance2>("ZoneResistance2"),
                               Number<&G::ZoneResistance3>("ZoneResistance3")};
constexpr GlobalKeyword globalValues[] = {
    Number<&G::G_waterlevel>("G_waterlevel", U::WaterLevel),
    Choice<&G::iLevelDepth>("iLevelDepth"),
    Number<&G::G_discharge>("G_discharge", U::Discharge),
    Number<&G::G_wind_factor>("G_wind_factor", U::Factor),
    Number<&G::G_resistance>("G_resistance"),
    Number<&G::G_S_max>("G_S_max"),
    Number<&G::G_f>("G_f"),
    Number<&G::G_k_100>("G_k_100"),
    Number<&G::G_min_width>("G_min_width"),
    Number<&G::G_flood_plan_res>("G_flood_plan_res", U::FloodPlainResistance),
    Choice<&G::G_wave>("G_wave"),
    {"ResisZone", resisZone},
};

constexpr GlobalKeyword defaultValues[] = {
    Number<&G::delta>("delta", U::Factor),
    Number<&G::delhs>("delhs", U::WaterLevel),
    Number<&G::delh>("delh", U::WaterLevel),
    Number<&G::alpha>("alpha", U::Factor),
    Number<&G::theta>("theta", U::Factor),
    Number<&G::eps>("eps", U::Factor),
    Number<&G::dh_node>("dh_node", U::WaterLevel),
    Number<&G::zeta_min>("zeta_min", U::Factor),
    Number<&G::struc_fac>("struc_fac", U::Factor),
    Number<&G::froude_exp>("froude_exp", U::Factor),
    Number<&G::froude_max>("froude_max", U::Factor),
    Integer<&G::no_iter>("no_iter"),
    Integer<&G::max_iter>("max_iter"),
    Integer<&G::inter1_max>("inter1_max"),
    Boolean<&G::wind_shear_stress>("wind_shear_stress"),
    Integer<&G::resist_num>("resist_num"),
    Number<&G::spilfc>("spilfc"),
    Number<&G::storfc>("storfc"),
};

constexpr Field energyEquation[] = {Boolean<&G::EnergyEquation>("EnergyEquation"),
                                    Choice<&G::FrictionSlope>("FrictionSlope")};
constexpr Field contractExpansion[] = {Number<&G::G_Contraction>("G_Contraction", U::Factor),
                                       Number<&G::G_Expansion>("G_Expansion", U::Factor)};
constexpr GlobalKeyword quasiSteady[] = {
    Number<&G::relax>("relax", U::Factor),
    Number<&G::beta_limit>("beta_limit", U::Factor),
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
constexpr GlobalKeyword Switch(std::string_view name)
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
constexpr Field mixingCoef[] = {
    Group<&G::Mixing, &X::CoefPairs>("CoefPairs", MixingPairs), Number<&G::Mixing, &X::MixCoef1>("MixCoef1"),
    Number<&G::Mixing, &X::MixCoef2>("MixCoef2"), Number<&G::Mixing, &X::MixCoef3>("MixCoef3"),
    Number<&G::Mixing, &X::MixCoef4>("MixCoef4")};
constexpr GlobalKeyword mixingCoefficients[] = {{"MixingCoef", mixingCoef}};

// A count alone would leave these two keywords with a single parameter, which readers take for a value.
constexpr Field title[] = {Plain(FieldKind::Text, "Title")};
constexpr Field interpolate[] = {Plain(FieldKind::Boolean, "Interpolate")};
constexpr GroupAccess titles = GroupOf<std::vector<std::string>>(title, true);
} // namespace
constexpr GroupAccess HDMarkFlags = GroupOf<std::deque<bool>>(interpolate, true);
namespace {
constexpr GlobalKeyword markTitles[] = {Group<&G::MarkTitles>("MarkTitles", titles),
                                        Group<&G::MarkInterpolate>("MarkInterpolate", HDMarkFlags)};

using B = HDBedResistTools;
constexpr Field bedResist[] = {Integer<&G::BedResist, &B::Method>("Method"),
                               Boolean<&G::BedResist, &B::Option1>("Option1"),
                               Boolean<&G::BedResist, &B::Option2>("Option2"),
                               Boolean<&G::BedResist, &B::Option3>("Option3"),
                               Group<&G::BedResist, &B::VeloRes>("VeloRes", VelocityResistances),
                               Number<&G::BedResist, &B::CoefA>("CoefA"),
                               Number<&G::BedResist, &B::CoefB>("CoefB"),
                               Number<&G::BedResist, &B::MinRes>("MinRes"),
                               Number<&G::BedResist, &B::MaxRes>("MaxRes")};
constexpr GlobalKeyword bedResistTools[] = {{"BRTools", bedResist}};

using C = HDCurveIncrement;
constexpr Field curve[] = {Boolean<&G::CurveIncrement, &C::Enabled>("Enabled"),
                           Boolean<&G::CurveIncrement, &C::SystemRange>("SystemRange"),
                           Boolean<&G::CurveIncrement, &C::SystemWidth>("SystemWidth"),
                           Boolean<&G::CurveIncrement, &C::SystemRadius>("SystemRadius"),
                           Boolean<&G::CurveIncrement, &C::SystemVelocity>("SystemVelocity"),
                           Choice<&G::CurveIncrement, &C::Range>("Range"),
                           Number<&G::CurveIncrement, &C::Width>("Width", U::Width),
                           Number<&G::CurveIncrement, &C::Radius>("Radius", U::Radius),
                           Number<&G::CurveIncrement, &C::Velocity>("Velocity", U::Velocity)};
constexpr GlobalKeyword waterLevelCurve[] = {{"WLDueToCurve", curve}};

using S = HDSandBarIncrement;
constexpr Field sand[] = {Boolean<&G::SandBarIncrement, &S::Enabled>("Enabled"),
                          Choice<&G::SandBarIncrement, &S::Method>("Method"),
                          Number<&G::SandBarIncrement, &S::Slope>("Slope", U::Slope),
                          Number<&G::SandBarIncrement, &S::Width>("Width", U::Width),
                          Number<&G::SandBarIncrement, &S::Area>("Area", U::Area),
                          Number<&G::SandBarIncrement, &S::Observed>("Observed", U::WaterLevel)};
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
    Number<&G::Klr, &K::maxvol>("maxvol", U::Volume),
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
    Number<&G::KlrInit, &I::h1>("h1", U::WaterLevel),
    Number<&G::KlrInit, &I::h0>("h0", U::WaterLevel),
    Number<&G::KlrInit, &I::Q1>("Q1", U::Discharge),
    Number<&G::KlrInit, &I::Q0>("Q0", U::Discharge),
    Number<&G::G_friction_factor>("G_friction_factor", U::Factor),
};

using O = HDTextOutput;
constexpr Field summaryInfo[] = {BooleanAt<0, &G::TextOutput, &O::SummaryInfo>("Minimum"),
                                 BooleanAt<1, &G::TextOutput, &O::SummaryInfo>("Maximum"),
                                 BooleanAt<2, &G::TextOutput, &O::SummaryInfo>("TimeOfMinimum"),
                                 BooleanAt<3, &G::TextOutput, &O::SummaryInfo>("TimeOfMaximum")};
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
constexpr Field textOutItem[] = {Choice<&CTextOutItem::Item>("Item"), Text<&CTextOutItem::UserName>("UserName"),
                                 Integer<&CTextOutItem::Decimals>("Decimals")};
constexpr Field textAutoFile[] = {Text<&CTextAutoFile::Format>("Format"), Boolean<&CTextAutoFile::AutoName>("AutoName"),
                                  FileName<&CTextAutoFile::FileName>("FileName")};

} // namespace
constexpr GroupAccess TextOutItems = GroupOf<std::vector<CTextOutItem>>(textOutItem);
constexpr GroupAccess TextAutoFiles = GroupOf<std::vector<CTextAutoFile>>(textAutoFile);
namespace {

constexpr Field textLists[] = {Group<&G::TextOutput, &O::OutputItems>("OutputItems", TextOutItems),
                               Group<&G::TextOutput, &O::OutputFiles>("OutputFiles", TextAutoFiles)};

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
using R = CMapsOutput;
constexpr Field mapsOutput[] = {Number<&R::XOrigin>("XOrigin", U::Coordinate),
                                Number<&R::YOrigin>("YOrigin", U::Coordinate),
                                Number<&R::Rotation>("Rotation", U::Rotation),
                                Number<&R::GridSize>("GridSize", U::GridSize),
                                Integer<&R::JCells>("JCells"),
                                Integer<&R::KCells>("KCells"),
                                Integer<&R::Reserved>("Reserved"),
                                FileName<&R::FileName>("FileName"),
                                Choice<&R::Type>("Type"),
                                Integer<&R::StoringFrequency>("StoringFrequency"),
                                Choice<&R::Item>("Item"),
                                Integer<&R::ComponentNo>("ComponentNo"),
                                Boolean<&R::DefaultPeriod>("DefaultPeriod"),
                                DateTime<&R::StartTime>("StartTime"),
                                DateTime<&R::EndTime>("EndTime")};
constexpr Field mapsInput[] = {FileName<&CMapsInput::FileName>("FileName"), Integer<&CMapsInput::ItemNo>("ItemNo"),
                               Integer<&CMapsInput::Order>("Order")};

} // namespace
constexpr GroupAccess MapsOutputs = GroupOf<std::vector<CMapsOutput>>(mapsOutput);
constexpr GroupAccess MapsInputs = GroupOf<std::vector<CMapsInput>>(mapsInput);
namespace {

constexpr Field mapLists[] = {Group<&G::MapOutput, &M::MapOutputFiles>("MapOutputFiles", MapsOutputs),
                              Group<&G::MapOutput, &M::DemInputFiles>("DemInputFiles", MapsInputs)};

using L = HDLeakageGlobal;
constexpr GlobalKeyword leakage[] = {
    Boolean<&G::Leakage, &L::IncludeLeakage>("IncludeLeakage"),
    Number<&G::Leakage, &L::LeakageCoefficient>("LeakageCoefficient", U::LeakageCoefficient),
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
