// The table of the global values: one row a keyword, in file order.
#include "data/global_var.h"
#include "texts/text_numbers.h"

#include <iterator>

namespace {

using G = HD_Global_Var;
using U = UnitGroup;
constexpr KeptAccess kept = Keeps<&G::Kept>();

constexpr auto resisZone = FieldsOf<G>(
    {Integer<&G::ResisZone>("ResisZone").Choices(Str::BedApproaches).Means(Str::MeansBedApproach),
     Number<&G::ZoneResistance1>("ZoneResistance1").Title(Str::MainChannelResistance).Means(Str::MeansZone1),
     Number<&G::ZoneResistance2>("ZoneResistance2").Title(Str::TransitionResistance).Means(Str::MeansZone2),
     Number<&G::ZoneResistance3>("ZoneResistance3").Title(Str::FloodPlainZoneResistance).Means(Str::MeansZone3)});
constexpr DeclaredKeyword globalValues[] = {
    Number<&G::G_waterlevel>("G_waterlevel", U::WaterLevel).Title(Str::GlobalWaterLevel).Means(Str::MeansGlobalLevel),
    Integer<&G::iLevelDepth>("iLevelDepth").Choices(Str::LevelOrDepth).Means(Str::MeansLevelOrDepth),
    Number<&G::G_discharge>("G_discharge", U::Discharge).Title(Str::GlobalDischarge).Means(Str::MeansGlobalDischarge),
    Number<&G::G_wind_factor>("G_wind_factor", U::Factor)
        .Digits(3)
        .Title(Str::GlobalWindFactor)
        .Means(Str::MeansWindFactor),
    Number<&G::G_resistance>("G_resistance").Title(Str::GlobalResistance).Means(Str::MeansResistance),
    Number<&G::G_S_max>("G_S_max"),
    Number<&G::G_f>("G_f"),
    Number<&G::G_k_100>("G_k_100"),
    Number<&G::G_min_width>("G_min_width"),
    Number<&G::G_flood_plan_res>("G_flood_plan_res", U::FloodPlainResistance)
        .Digits(2)
        .Title(Str::GlobalFloodPlainResistance)
        .Means(Str::MeansFloodPlainResistance),
    Integer<&G::G_wave>("G_wave").Choices(Str::WaveApproximations).Title(Str::GlobalWave).Means(Str::MeansWave),
    {"ResisZone", resisZone},
};

constexpr DeclaredKeyword defaultValues[] = {
    Number<&G::delta>("delta", U::Factor).Digits(2).Range(0.5, 1).Title(Str::Delta).Means(Str::MeansDelta),
    Number<&G::delhs>("delhs", U::WaterLevel).Digits(7).Title(Str::Delhs).Means(Str::MeansDelhs),
    Number<&G::delh>("delh", U::WaterLevel).Digits(3).Title(Str::Delh).Means(Str::MeansDelh),
    Number<&G::alpha>("alpha", U::Factor).Digits(2).Title(Str::Alpha).Means(Str::MeansAlpha),
    Number<&G::theta>("theta", U::Factor).Digits(2).Title(Str::Theta).Means(Str::MeansTheta),
    Number<&G::eps>("eps", U::Factor).Digits(5).Title(Str::Eps).Means(Str::MeansEps),
    Number<&G::dh_node>("dh_node", U::WaterLevel).Digits(3).Title(Str::DhNode).Means(Str::MeansDhNode),
    Number<&G::zeta_min>("zeta_min", U::Factor).Digits(3).Range(0).Title(Str::ZetaMin).Means(Str::MeansZetaMin),
    Number<&G::struc_fac>("struc_fac", U::Factor).Digits(1).Title(Str::StrucFac).Means(Str::MeansStrucFac),
    Number<&G::froude_exp>("froude_exp", U::Factor).Digits(1).Title(Str::FroudeExp).Means(Str::MeansFroudeExp),
    Number<&G::froude_max>("froude_max", U::Factor).Digits(2).Title(Str::FroudeMax).Means(Str::MeansFroudeMax),
    Integer<&G::no_iter>("no_iter").Title(Str::NoIter).Means(Str::MeansNoIter),
    Integer<&G::max_iter>("max_iter").Title(Str::MaxIterSteady).Means(Str::MeansMaxIter),
    Integer<&G::inter1_max>("inter1_max").Title(Str::Inter1Max).Means(Str::MeansInter1Max),
    Boolean<&G::wind_shear_stress>("wind_shear_stress").Title(Str::IncludeWind).Means(Str::MeansWind),
    Integer<&G::resist_num>("resist_num")
        .Title(Str::ResistanceFormula)
        .Choices(Str::ResistanceFormulas)
        .Means(Str::MeansFormula),
    Number<&G::spilfc>("spilfc"),
    Number<&G::storfc>("storfc"),
};

constexpr auto energyEquation = FieldsOf<G>(
    {Boolean<&G::EnergyEquation>("EnergyEquation").Title(Str::EnergyEquation).Means(Str::MeansEnergyEquation),
     Integer<&G::FrictionSlope>("FrictionSlope")
         .Title(Str::FrictionSlope)
         .Choices(Str::FrictionSlopes)
         .Means(Str::MeansFrictionSlope)});
constexpr auto contractExpansion = FieldsOf<G>(
    {Number<&G::G_Contraction>("G_Contraction", U::Factor).Title(Str::GlobalContraction).Means(Str::MeansContraction),
     Number<&G::G_Expansion>("G_Expansion", U::Factor).Title(Str::GlobalExpansion).Means(Str::MeansExpansion)});
constexpr DeclaredKeyword quasiSteady[] = {
    Number<&G::relax>("relax", U::Factor).Title(Str::Relax).Means(Str::MeansRelax),
    Number<&G::beta_limit>("beta_limit", U::Factor).Digits(8).Title(Str::BetaLimit).Means(Str::MeansBetaLimit),
    Number<&G::fac_0>("fac_0", U::Factor).Title(Str::Fac0).Means(Str::MeansFac0),
    Number<&G::qconv_factor>("qconv_factor", U::Factor).Title(Str::QconvFactor).Means(Str::MeansQconv),
    Number<&G::hconv_factor>("hconv_factor", U::Factor).Title(Str::HconvFactor).Means(Str::MeansHconv),
    Number<&G::min_hconv>("min_hconv", U::WaterLevel).Title(Str::MinHconv).Means(Str::MeansMinHconv),
    Number<&G::qstruc_factor>("qstruc_factor", U::Factor).Title(Str::QstrucFactor).Means(Str::MeansQstruc),
    Number<&G::hstop>("hstop", U::WaterLevel).Title(Str::Hstop).Means(Str::MeansHstop),
    {"EnergyEquation", energyEquation},
    Boolean<&G::ContractExpansion>("ContractExpansion")
        .Title(Str::ContractExpansion)
        .Means(Str::MeansContractExpansion),
    Boolean<&G::SlopeUpstream>("SlopeUpstream").Title(Str::SlopeUpstream).Means(Str::MeansSlopeUpstream),
    Boolean<&G::VelocityCoefficient>("VelocityCoefficient")
        .Title(Str::VelocityCoefficient)
        .Means(Str::MeansVelocityCoefficient),
    Boolean<&G::NoConvectiveSuppression>("NoConvectiveSuppression")
        .Title(Str::NoConvectiveSuppression)
        .Means(Str::MeansNoSuppression),
    {"G_ContractExpansion", contractExpansion},
};

/// `title` is a line of the table's titles, and of what they mean.
template <bool HDAddOutput::*Flag>
constexpr Field Switch(std::string_view name, int title)
{
    return Boolean<&G::AddOutput, Flag>(name).Title(Str::AddedOutputs, title).Means(Str::AddedOutputMeanings, title);
}
using A = HDAddOutput;
constexpr DeclaredKeyword addOutput[] = {
    Integer<&G::AddOutput, &A::ReducedOut>("ReducedOut"),
    Switch<&A::Velo_H>("Velo_H", 0),
    Switch<&A::Velo_struc>("Velo_struc", 0),
    Switch<&A::Discharge_H>("Discharge_H", 1),
    Switch<&A::CrossSec_H>("CrossSec_H", 2),
    Switch<&A::FlowWidth_H>("FlowWidth_H", 3),
    Switch<&A::Radius_H>("Radius_H", 4),
    Switch<&A::Resistance_H>("Resistance_H", 5),
    Switch<&A::Conveyance_H>("Conveyance_H", 6),
    Switch<&A::FroudeNum_H>("FroudeNum_H", 7),
    Switch<&A::Volume_H>("Volume_H", 8),
    Switch<&A::Volume_Total>("Volume_Total", 8),
    Switch<&A::FloodArea_H>("FloodArea_H", 9),
    Switch<&A::FloodArea_Total>("FloodArea_Total", 9),
    Switch<&A::MassError_H>("MassError_H", 10),
    Switch<&A::MassError_Total>("MassError_Total", 10),
    Switch<&A::AcumMassError_Total>("AcumMassError_Total", 11),
    Boolean<&G::AddOutput, &A::Topo_print>("Topo_print"),
    Boolean<&G::AddOutput, &A::Coef_print>("Coef_print"),
    Boolean<&G::AddOutput, &A::Test_print>("Test_print"),
    Switch<&A::LatInflows_H>("LatInflows_H", 12),
    Switch<&A::EnergyLevel>("EnergyLevel", 15),
    Switch<&A::EnergySlope>("EnergySlope", 14),
    Switch<&A::WaterSlope>("WaterSlope", 13),
    Switch<&A::BedShearStress>("BedShearStress", 16),
    Switch<&A::GroundwaterHead>("GroundwaterHead", 17),
    Switch<&A::TimeStep>("TimeStep", 18),
};

using X = HDMixingCoefficients;
constexpr auto mixingCoef =
    FieldsOf<G>({Group<&G::Mixing, &X::CoefPairs>("CoefPairs"),
                 Number<&G::Mixing, &X::MixCoef1>("MixCoef1").Title(Str::MixingCoef1).Means(Str::MeansMixing),
                 Number<&G::Mixing, &X::MixCoef2>("MixCoef2").Title(Str::MixingCoef2).Means(Str::MeansMixing),
                 Number<&G::Mixing, &X::MixCoef3>("MixCoef3").Title(Str::MixingCoef3).Means(Str::MeansMixing),
                 Number<&G::Mixing, &X::MixCoef4>("MixCoef4").Title(Str::MixingCoef4).Means(Str::MeansMixing)});
constexpr DeclaredKeyword mixingCoefficients[] = {{"MixingCoef", mixingCoef}};

// A count alone would leave these two keywords with a single parameter, which
// readers take for a value.
constexpr Field title = Plain<std::string>("Title").Title(Str::MarkTitle).Means(Str::MeansMarkTitle);
constexpr Field interpolate = Plain<bool>("Interpolate").Title(Str::MarkInterpolate).Means(Str::MeansMarkInterpolate);
constexpr DeclaredKeyword markTitles[] = {PlainGroup<title, &G::MarkTitles>("MarkTitles").PadWhenEmpty(),
                                          PlainGroup<interpolate, &G::MarkInterpolate>(HDMarkFlags).PadWhenEmpty()};

using B = HDBedResistTools;
constexpr auto bedResist =
    FieldsOf<G>({Integer<&G::BedResist, &B::Method>("Method")
                     .Title(Str::ToolboxMethod)
                     .Choices(Str::ToolboxMethods)
                     .Means(Str::MeansToolboxMethod),
                 Boolean<&G::BedResist, &B::Option1>("Option1").Title(Str::ToolboxZone1).Means(Str::MeansToolboxZone),
                 Boolean<&G::BedResist, &B::Option2>("Option2").Title(Str::ToolboxZone2).Means(Str::MeansToolboxZone),
                 Boolean<&G::BedResist, &B::Option3>("Option3").Title(Str::ToolboxZone3).Means(Str::MeansToolboxZone),
                 Group<&G::BedResist, &B::VeloRes>("VeloRes"),
                 Number<&G::BedResist, &B::CoefA>("CoefA").Title(Str::ToolboxCoefA).Means(Str::MeansCoefA),
                 Number<&G::BedResist, &B::CoefB>("CoefB").Title(Str::ToolboxCoefB).Means(Str::MeansCoefB),
                 Number<&G::BedResist, &B::MinRes>("MinRes").Title(Str::ToolboxMinimum).Means(Str::MeansMinRes),
                 Number<&G::BedResist, &B::MaxRes>("MaxRes").Title(Str::ToolboxMaximum).Means(Str::MeansMaxRes)});
constexpr DeclaredKeyword bedResistTools[] = {{"BRTools", bedResist}};

using C = HDCurveIncrement;
constexpr auto curve = FieldsOf<G>(
    {Boolean<&G::CurveIncrement, &C::Enabled>("Enabled").Title(Str::CurveIncrement).Means(Str::MeansCurve),
     Boolean<&G::CurveIncrement, &C::SystemRange>("SystemRange")
         .Title(Str::CurveSystemRange)
         .Means(Str::MeansCurveSystem),
     Boolean<&G::CurveIncrement, &C::SystemWidth>("SystemWidth")
         .Title(Str::CurveSystemWidth)
         .Means(Str::MeansCurveSystem),
     Boolean<&G::CurveIncrement, &C::SystemRadius>("SystemRadius")
         .Title(Str::CurveSystemRadius)
         .Means(Str::MeansCurveSystem),
     Boolean<&G::CurveIncrement, &C::SystemVelocity>("SystemVelocity")
         .Title(Str::CurveSystemVelocity)
         .Means(Str::MeansCurveSystem),
     Integer<&G::CurveIncrement, &C::Range>("Range").Choices(Str::AverageRanges).Means(Str::MeansCurveRange),
     Number<&G::CurveIncrement, &C::Width>("Width", U::Width).Means(Str::MeansCurveWidth),
     Number<&G::CurveIncrement, &C::Radius>("Radius", U::Radius).Means(Str::MeansCurveRadius),
     Number<&G::CurveIncrement, &C::Velocity>("Velocity", U::Velocity).Means(Str::MeansCurveVelocity)});
constexpr DeclaredKeyword waterLevelCurve[] = {{"WLDueToCurve", curve}};

using S = HDSandBarIncrement;
constexpr auto sand = FieldsOf<G>(
    {Boolean<&G::SandBarIncrement, &S::Enabled>("Enabled").Title(Str::SandBarIncrement).Means(Str::MeansSand),
     Integer<&G::SandBarIncrement, &S::Method>("Method").Choices(Str::SandBarMethods).Means(Str::MeansSandMethod),
     Number<&G::SandBarIncrement, &S::Slope>("Slope", U::Slope).Means(Str::MeansSandSlope),
     Number<&G::SandBarIncrement, &S::Width>("Width", U::Width).Means(Str::MeansSandWidth),
     Number<&G::SandBarIncrement, &S::Area>("Area", U::Area).Means(Str::MeansSandArea),
     Number<&G::SandBarIncrement, &S::Observed>("Observed", U::WaterLevel).Means(Str::MeansSandObserved)});
constexpr DeclaredKeyword waterLevelSandBars[] = {{"WLDueToSand", sand}};

constexpr DeclaredKeyword encroachment[] = {
    Integer<&G::Max_no_iter>("Max_no_iter").Title(Str::EncroachIterations).Means(Str::MeansEncroachIterations)};

using H = HDHeatBalance;
constexpr DeclaredKeyword heatBalance[] = {
    Boolean<&G::HeatBalance, &H::Calc>("Calc").Title(Str::HeatBalanceIncluded).Means(Str::MeansHeat),
    Number<&G::HeatBalance, &H::Latitude>("Latitude", U::GeoAngle).Title(Str::Latitude).Means(Str::MeansLatitude),
    Number<&G::HeatBalance, &H::Longitude>("Longitude", U::GeoAngle).Title(Str::Longitude).Means(Str::MeansLongitude),
    Number<&G::HeatBalance, &H::TimeZone>("TimeZone", U::TimeDisplacement)
        .Title(Str::TimeMeridian)
        .Means(Str::MeansTimeMeridian),
    Number<&G::HeatBalance, &H::DisTime>("DisTime", U::TimeDisplacement)
        .Title(Str::TimeDisplacement)
        .Means(Str::MeansDisplacement),
    Number<&G::HeatBalance, &H::LightAtt>("LightAtt", U::LightAttenuation)
        .Title(Str::LightAttenuation)
        .Means(Str::MeansLightAttenuation),
    Number<&G::HeatBalance, &H::betaBeer>("betaBeer", U::Factor).Title(Str::BeerConstant).Means(Str::MeansBeer),
    Number<&G::HeatBalance, &H::RadA>("RadA", U::Factor).Title(Str::RadiationA).Means(Str::MeansRadiationA),
    Number<&G::HeatBalance, &H::RadB>("RadB", U::Factor).Title(Str::RadiationB).Means(Str::MeansRadiationB),
    Number<&G::HeatBalance, &H::VapA>("VapA", U::Factor).Title(Str::VaporizationA).Means(Str::MeansVaporizationA),
    Number<&G::HeatBalance, &H::VapB>("VapB", U::Factor).Title(Str::VaporizationB).Means(Str::MeansVaporizationB),
};

using T = HDStratification;
constexpr DeclaredKeyword stratification[] = {
    Integer<&G::Stratification, &T::npv>("npv").Title(Str::LayerCount).Means(Str::MeansLayers),
    Boolean<&G::Stratification, &T::dens>("dens").Title(Str::LayerDensities).Means(Str::MeansDensities),
    Number<&G::Stratification, &T::visc>("visc", U::Viscosity).Title(Str::Viscosity).Means(Str::MeansViscosity),
    Integer<&G::Stratification, &T::vmf>("vmf")
        .Title(Str::FluidTurbulence)
        .Choices(Str::FluidTurbulenceModels)
        .Means(Str::MeansFluidTurbulence),
    Integer<&G::Stratification, &T::vmb>("vmb")
        .Title(Str::BedTurbulence)
        .Choices(Str::BedTurbulenceModels)
        .Means(Str::MeansBedTurbulence),
    Boolean<&G::Stratification, &T::Rich>("Rich").Title(Str::RichardsonCorrection).Means(Str::MeansRichardson),
    Number<&G::Stratification, &T::bpr1>("bpr1", U::Factor).Title(Str::BaroclinicFactor).Means(Str::MeansBaroclinic),
    Number<&G::Stratification, &T::bpr2>("bpr2", U::Factor)
        .Title(Str::BaroclinicBedSlope)
        .Means(Str::MeansBaroclinicSlope),
    Number<&G::Stratification, &T::uu>("uu", U::Factor)
        .Title(Str::HorizontalMomentum)
        .Means(Str::MeansHorizontalMomentum),
    Number<&G::Stratification, &T::uw>("uw", U::Factor).Title(Str::VerticalMomentum).Means(Str::MeansVerticalMomentum),
    Number<&G::Stratification, &T::uwc>("uwc", U::Factor).Title(Str::AdvectionFactor).Means(Str::MeansAdvection),
    Number<&G::Stratification, &T::dfx>("dfx", U::Factor)
        .Title(Str::HorizontalViscosity)
        .Means(Str::MeansHorizontalViscosity),
    Number<&G::Stratification, &T::dfz>("dfz", U::Factor)
        .Title(Str::VerticalViscosity)
        .Means(Str::MeansVerticalViscosity),
};

using K = HDKlrConstants;
constexpr DeclaredKeyword klrParam[] = {
    Number<&G::Klr, &K::fricfac>("fricfac", U::Factor).Title(Str::KlrFriction).Means(Str::MeansInterfaceFriction),
    Number<&G::Klr, &K::maxvol>("maxvol", U::Volume).Digits(8).Title(Str::KlrMaxVolume).Means(Str::MeansMaxVolume),
    Number<&G::Klr, &K::maxvelo>("maxvelo", U::Velocity).Title(Str::KlrMaxVelocity).Means(Str::MeansMaxVelocity),
    Number<&G::Klr, &K::minthick>("minthick", U::WaterLevel).Title(Str::KlrMinThickness).Means(Str::MeansMinThickness),
    Number<&G::Klr, &K::densdiff>("densdiff", U::Factor)
        .Title(Str::KlrDensityDifference)
        .Means(Str::MeansDensityDifference),
    Integer<&G::Klr, &K::action>("action").Title(Str::KlrAction).Choices(Str::KlrActions).Means(Str::MeansKlrAction),
    Number<&G::Klr, &K::R1>("R1", U::Factor).Title(Str::KlrUpward).Means(Str::MeansR1),
    Number<&G::Klr, &K::R2>("R2", U::Factor).Title(Str::KlrDownward).Means(Str::MeansR2),
    Number<&G::Klr, &K::Rs>("Rs", U::Factor).Title(Str::KlrUpwardAtControls).Means(Str::MeansRs),
};

using I = HDKlrInitial;
constexpr DeclaredKeyword klrInit[] = {
    Number<&G::KlrInit, &I::h1>("h1", U::WaterLevel).Digits(8).Title(Str::KlrWaterLevel).Means(Str::MeansLayerH1),
    Number<&G::KlrInit, &I::h0>("h0", U::WaterLevel).Digits(8).Title(Str::KlrInterfaceLevel).Means(Str::MeansLayerH0),
    Number<&G::KlrInit, &I::Q1>("Q1", U::Discharge).Digits(8).Title(Str::KlrTopDischarge).Means(Str::MeansLayerQ1),
    Number<&G::KlrInit, &I::Q0>("Q0", U::Discharge).Digits(8).Title(Str::KlrBottomDischarge).Means(Str::MeansLayerQ0),
    Number<&G::G_friction_factor>("G_friction_factor", U::Factor)
        .Digits(3)
        .Title(Str::WindFriction)
        .Means(Str::MeansWindFriction),
};

/// The list that a sub-section holds.
constexpr DeclaredKeyword Lines(FieldList group)
{
    return {"data", group, Presence::EachLine};
}

using O = HDTextOutput;
constexpr auto summaryInfo = FieldsOf<G>(
    {BooleanAt<0, &G::TextOutput, &O::SummaryInfo>("Minimum").Title(Str::SeriesMinimum).Means(Str::MeansSeriesMinimum),
     BooleanAt<1, &G::TextOutput, &O::SummaryInfo>("Maximum").Title(Str::SeriesMaximum).Means(Str::MeansSeriesMaximum),
     BooleanAt<2, &G::TextOutput, &O::SummaryInfo>("TimeOfMinimum")
         .Title(Str::SeriesTimeOfMinimum)
         .Means(Str::MeansTimeOfMinimum),
     BooleanAt<3, &G::TextOutput, &O::SummaryInfo>("TimeOfMaximum")
         .Title(Str::SeriesTimeOfMaximum)
         .Means(Str::MeansTimeOfMaximum)});
constexpr DeclaredKeyword textOutput[] = {
    Boolean<&G::TextOutput, &O::GenerateOutput>("GenerateOutput").Title(Str::GenerateSeries).Means(Str::MeansSeries),
    Text<&G::TextOutput, &O::Delimiter>("Delimiter").Title(Str::SeriesDelimiter).Means(Str::MeansDelimiter),
    Integer<&G::TextOutput, &O::ColumnWidth>("ColumnWidth").Title(Str::SeriesColumnWidth).Means(Str::MeansColumnWidth),
    {"SummaryInfo", summaryInfo},
    Integer<&G::TextOutput, &O::GridPointOutputType>("GridPointOutputType")
        .Choices(Str::SeriesPointChoices)
        .Means(Str::MeansPointChoice),
    Boolean<&G::TextOutput, &O::LimitedPeriod>("LimitedPeriod")
        .Title(Str::SeriesLimited)
        .Means(Str::MeansLimitedPeriod),
    DateTime<&G::TextOutput, &O::LimitedPeriodStart>("LimitedPeriodStart")
        .Title(Str::SeriesStart)
        .Means(Str::MeansPeriodStart),
    DateTime<&G::TextOutput, &O::LimitedPeriodEnd>("LimitedPeriodEnd").Title(Str::SeriesEnd).Means(Str::MeansPeriodEnd),
};
constexpr auto outputItems = FieldsOf<G>({Group<&G::TextOutput, &O::OutputItems>("OutputItems")});
constexpr auto outputFiles = FieldsOf<G>({Group<&G::TextOutput, &O::OutputFiles>("OutputFiles")});
constexpr DeclaredKeyword itemLines[] = {Lines(outputItems)}, fileLines[] = {Lines(outputFiles)};
constexpr DeclaredSection textLists[] = {{"OutputItems", kept, itemLines}, {"OutputFiles", kept, fileLines}};

// Files from before ground elevations could come from a DEM have no use for the
// three keywords that refine it.
constexpr std::string_view groundElevation = "ApplyDemGroundElevation";
using M = HDMapOutput;
constexpr DeclaredKeyword mapOutput[] = {
    Boolean<&G::MapOutput, &M::GenerateOutput>("GenerateOutput").Title(Str::GenerateMaps).Means(Str::MeansMaps),
    Boolean<&G::MapOutput, &M::ApplyDemInRiverXsec>("ApplyDemInRiverXsec")
        .Title(Str::MapRiverCrossSections)
        .Means(Str::MeansMapSections),
    Boolean<&G::MapOutput, &M::ApplyDemGroundElevation>(groundElevation)
        .Title(Str::MapGroundElevation)
        .Means(Str::MeansMapElevation),
    {Boolean<&G::MapOutput, &M::MapAreaGeoDb>("MapAreaGeoDb").Title(Str::MapFloodedAreas).Means(Str::MeansMapFlooded),
     groundElevation},
    {FileName<&G::MapOutput, &M::GeoDb>("GeoDb").Title(Str::MapHelpGrid).Means(Str::MeansHelpGrid), groundElevation},
    {Boolean<&G::MapOutput, &M::AddToCalculation>("AddToCalculation"), groundElevation},
};
constexpr auto mapFiles = FieldsOf<G>({Group<&G::MapOutput, &M::MapOutputFiles>("MapOutputFiles")});
constexpr auto demFiles = FieldsOf<G>({Group<&G::MapOutput, &M::DemInputFiles>("DemInputFiles")});
constexpr DeclaredKeyword mapLines[] = {Lines(mapFiles)}, demLines[] = {Lines(demFiles)};
constexpr DeclaredSection mapLists[] = {{"MapOutputFiles", kept, mapLines}, {"DemInputFiles", kept, demLines}};

using L = HDLeakageGlobal;
constexpr DeclaredKeyword leakage[] = {
    Boolean<&G::Leakage, &L::IncludeLeakage>("IncludeLeakage")
        .Title(Str::IncludeLeakage)
        .Means(Str::MeansIncludeLeakage),
    Number<&G::Leakage, &L::LeakageCoefficient>("LeakageCoefficient", U::LeakageCoefficient)
        .Digits(3)
        .Title(Str::GlobalLeakageCoef)
        .Means(Str::MeansLeakage),
};

constexpr DeclaredSection sections[] = {
    {"Global_Values", kept, globalValues},
    {"Defalt_Values", kept, defaultValues}, // spelled so in every file
    {"Quasi_steady", kept, quasiSteady},
    {"Add_Output", kept, addOutput},
    {"MixingCoefficients", kept, mixingCoefficients},
    {HDMarkSection, kept, markTitles},
    {"BedResistTools", kept, bedResistTools},
    {"WaterLevelCurve", kept, waterLevelCurve},
    {"WaterLevelSandBars", kept, waterLevelSandBars},
    {"Encroachment", kept, encroachment},
    {"Heat_Balance", kept, heatBalance},
    {"Stratification", kept, stratification},
    {"KlrParam", kept, klrParam},
    {"KlrInit", kept, klrInit},
    {"TextOutput", kept, textOutput, textLists, std::size(textLists)},
    {"MapOutput", kept, mapOutput, mapLists, std::size(mapLists)},
    {"Leakage", kept, leakage},
};

constexpr DeclaredSection globals{"Global_Variables", kept, {}, sections, std::size(sections)};
static_assert(IsOf<G>(globals));

} // namespace

const DeclaredSection& HDGlobals()
{
    return globals;
}

FieldList CTextOutItem::DeclaredFields()
{
    using I = CTextOutItem;
    static constexpr auto fields =
        FieldsOf<I>({Integer<&I::Item>("Item")
                         .Title(Str::OutputItemColumns, 0)
                         .Choices(Str::OutputItems)
                         .Means(Str::MeansOutputItem),
                     Text<&I::UserName>("UserName").Title(Str::OutputItemColumns, 1).Means(Str::MeansItemName),
                     Integer<&I::Decimals>("Decimals").Title(Str::OutputItemColumns, 2).Means(Str::MeansDecimals)});
    return fields;
}

FieldList CTextAutoFile::DeclaredFields()
{
    using F = CTextAutoFile;
    static constexpr auto fields = FieldsOf<F>(
        {Text<&F::Format>("Format")
             .Title(Str::OutputFileColumns, 0)
             .Choices(Str::OutputFormats)
             .Means(Str::MeansSeriesFormat),
         Boolean<&F::AutoName>("AutoName").Title(Str::OutputFileColumns, 1).Means(Str::MeansAutoName),
         ::FileName<&F::FileName>("FileName").Title(Str::OutputFileColumns, 2).Means(Str::MeansSeriesFile)});
    return fields;
}

FieldList CMapsOutput::DeclaredFields()
{
    using R = CMapsOutput;
    constexpr Str titles = Str::MapColumns; // among them, behind the file, one for a button
    static constexpr auto fields = FieldsOf<R>(
        {Number<&R::XOrigin>("XOrigin", U::Coordinate).Title(titles, 0).Means(Str::MeansMapX),
         Number<&R::YOrigin>("YOrigin", U::Coordinate).Title(titles, 1).Means(Str::MeansMapY),
         Number<&R::Rotation>("Rotation", U::Rotation).Title(titles, 2).Means(Str::MeansMapRotation),
         Number<&R::GridSize>("GridSize", U::GridSize).Title(titles, 3).Means(Str::MeansGridSize),
         Integer<&R::JCells>("JCells").Title(titles, 4).Means(Str::MeansJCells),
         Integer<&R::KCells>("KCells").Title(titles, 5).Means(Str::MeansKCells), Integer<&R::Reserved>("Reserved"),
         ::FileName<&R::FileName>("FileName").Title(titles, 6).Means(Str::MeansMapFile),
         Integer<&R::Type>("Type").Title(titles, 8).Choices(Str::MapTypes).Means(Str::MeansMapType),
         Integer<&R::StoringFrequency>("StoringFrequency").Title(titles, 11).Means(Str::MeansFrequency),
         Integer<&R::Item>("Item").Title(titles, 9).Choices(Str::MapItems).Means(Str::MeansMapItem),
         Integer<&R::ComponentNo>("ComponentNo").Title(titles, 10).Means(Str::MeansComponent),
         Boolean<&R::DefaultPeriod>("DefaultPeriod").Title(titles, 12).Means(Str::MeansDefaultPeriod),
         DateTime<&R::StartTime>("StartTime").Title(titles, 13).Means(Str::MeansMapStart),
         DateTime<&R::EndTime>("EndTime").Title(titles, 14).Means(Str::MeansMapEnd)});
    return fields;
}

FieldList CMapsInput::DeclaredFields()
{
    using M = CMapsInput;
    static constexpr auto fields =
        FieldsOf<M>({::FileName<&M::FileName>("FileName").Title(Str::DemColumns, 0).Means(Str::MeansDemFile),
                     Integer<&M::ItemNo>("ItemNo").Title(Str::DemColumns, 2).Means(Str::MeansDemItem),
                     Integer<&M::Order>("Order").Title(Str::DemColumns, 3).Means(Str::MeansDemOrder)});
    return fields;
}
