// The table of the global values: one row a keyword, in file order.
#include "data/global_var.h"
#include "texts/text_numbers.h"

#include <iterator>

namespace {

using G = HD_Global_Var;
using U = UnitGroup;
constexpr KeptAccess kept = Keeps<&G::Kept>();

constexpr auto resisZone =
    FieldsOf<G>({Integer<&G::ResisZone>("ResisZone").Choices(Str::BedApproaches),
                 Number<&G::ZoneResistance1>("ZoneResistance1").Title(Str::MainChannelResistance),
                 Number<&G::ZoneResistance2>("ZoneResistance2").Title(Str::TransitionResistance),
                 Number<&G::ZoneResistance3>("ZoneResistance3").Title(Str::FloodPlainZoneResistance)});
constexpr DeclaredKeyword globalValues[] = {
    Number<&G::G_waterlevel>("G_waterlevel", U::WaterLevel).Title(Str::GlobalWaterLevel),
    Integer<&G::iLevelDepth>("iLevelDepth").Choices(Str::LevelOrDepth),
    Number<&G::G_discharge>("G_discharge", U::Discharge).Title(Str::GlobalDischarge),
    Number<&G::G_wind_factor>("G_wind_factor", U::Factor).Digits(3).Title(Str::GlobalWindFactor),
    Number<&G::G_resistance>("G_resistance").Title(Str::GlobalResistance),
    Number<&G::G_S_max>("G_S_max"),
    Number<&G::G_f>("G_f"),
    Number<&G::G_k_100>("G_k_100"),
    Number<&G::G_min_width>("G_min_width"),
    Number<&G::G_flood_plan_res>("G_flood_plan_res", U::FloodPlainResistance)
        .Digits(2)
        .Title(Str::GlobalFloodPlainResistance),
    Integer<&G::G_wave>("G_wave").Choices(Str::WaveApproximations).Title(Str::GlobalWave),
    {"ResisZone", resisZone},
};

constexpr DeclaredKeyword defaultValues[] = {
    Number<&G::delta>("delta", U::Factor).Digits(2).Range(0.5, 1).Title(Str::Delta),
    Number<&G::delhs>("delhs", U::WaterLevel).Digits(7).Title(Str::Delhs),
    Number<&G::delh>("delh", U::WaterLevel).Digits(3).Title(Str::Delh),
    Number<&G::alpha>("alpha", U::Factor).Digits(2).Title(Str::Alpha),
    Number<&G::theta>("theta", U::Factor).Digits(2).Title(Str::Theta),
    Number<&G::eps>("eps", U::Factor).Digits(5).Title(Str::Eps),
    Number<&G::dh_node>("dh_node", U::WaterLevel).Digits(3).Title(Str::DhNode),
    Number<&G::zeta_min>("zeta_min", U::Factor).Digits(3).Range(0).Title(Str::ZetaMin),
    Number<&G::struc_fac>("struc_fac", U::Factor).Digits(1).Title(Str::StrucFac),
    Number<&G::froude_exp>("froude_exp", U::Factor).Digits(1).Title(Str::FroudeExp),
    Number<&G::froude_max>("froude_max", U::Factor).Digits(2).Title(Str::FroudeMax),
    Integer<&G::no_iter>("no_iter").Title(Str::NoIter),
    Integer<&G::max_iter>("max_iter").Title(Str::MaxIterSteady),
    Integer<&G::inter1_max>("inter1_max").Title(Str::Inter1Max),
    Boolean<&G::wind_shear_stress>("wind_shear_stress").Title(Str::IncludeWind),
    Integer<&G::resist_num>("resist_num").Title(Str::ResistanceFormula).Choices(Str::ResistanceFormulas),
    Number<&G::spilfc>("spilfc"),
    Number<&G::storfc>("storfc"),
};

constexpr auto energyEquation =
    FieldsOf<G>({Boolean<&G::EnergyEquation>("EnergyEquation").Title(Str::EnergyEquation),
                 Integer<&G::FrictionSlope>("FrictionSlope").Title(Str::FrictionSlope).Choices(Str::FrictionSlopes)});
constexpr auto contractExpansion =
    FieldsOf<G>({Number<&G::G_Contraction>("G_Contraction", U::Factor).Title(Str::GlobalContraction),
                 Number<&G::G_Expansion>("G_Expansion", U::Factor).Title(Str::GlobalExpansion)});
constexpr DeclaredKeyword quasiSteady[] = {
    Number<&G::relax>("relax", U::Factor).Title(Str::Relax),
    Number<&G::beta_limit>("beta_limit", U::Factor).Digits(8).Title(Str::BetaLimit),
    Number<&G::fac_0>("fac_0", U::Factor).Title(Str::Fac0),
    Number<&G::qconv_factor>("qconv_factor", U::Factor).Title(Str::QconvFactor),
    Number<&G::hconv_factor>("hconv_factor", U::Factor).Title(Str::HconvFactor),
    Number<&G::min_hconv>("min_hconv", U::WaterLevel).Title(Str::MinHconv),
    Number<&G::qstruc_factor>("qstruc_factor", U::Factor).Title(Str::QstrucFactor),
    Number<&G::hstop>("hstop", U::WaterLevel).Title(Str::Hstop),
    {"EnergyEquation", energyEquation},
    Boolean<&G::ContractExpansion>("ContractExpansion").Title(Str::ContractExpansion),
    Boolean<&G::SlopeUpstream>("SlopeUpstream").Title(Str::SlopeUpstream),
    Boolean<&G::VelocityCoefficient>("VelocityCoefficient").Title(Str::VelocityCoefficient),
    Boolean<&G::NoConvectiveSuppression>("NoConvectiveSuppression").Title(Str::NoConvectiveSuppression),
    {"G_ContractExpansion", contractExpansion},
};

/// `title` is a line of the table's titles.
template <bool HDAddOutput::*Flag>
constexpr Field Switch(std::string_view name, int title)
{
    return Boolean<&G::AddOutput, Flag>(name).Title(Str::AddedOutputs, title);
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
constexpr auto mixingCoef = FieldsOf<G>({Group<&G::Mixing, &X::CoefPairs>("CoefPairs"),
                                         Number<&G::Mixing, &X::MixCoef1>("MixCoef1").Title(Str::MixingCoef1),
                                         Number<&G::Mixing, &X::MixCoef2>("MixCoef2").Title(Str::MixingCoef2),
                                         Number<&G::Mixing, &X::MixCoef3>("MixCoef3").Title(Str::MixingCoef3),
                                         Number<&G::Mixing, &X::MixCoef4>("MixCoef4").Title(Str::MixingCoef4)});
constexpr DeclaredKeyword mixingCoefficients[] = {{"MixingCoef", mixingCoef}};

// A count alone would leave these two keywords with a single parameter, which
// readers take for a value.
constexpr Field title = Plain<std::string>("Title").Title(Str::MarkTitle);
constexpr Field interpolate = Plain<bool>("Interpolate").Title(Str::MarkInterpolate);
constexpr DeclaredKeyword markTitles[] = {PlainGroup<title, &G::MarkTitles>("MarkTitles").PadWhenEmpty(),
                                          PlainGroup<interpolate, &G::MarkInterpolate>(HDMarkFlags).PadWhenEmpty()};

using B = HDBedResistTools;
constexpr auto bedResist = FieldsOf<G>(
    {Integer<&G::BedResist, &B::Method>("Method").Title(Str::ToolboxMethod).Choices(Str::ToolboxMethods),
     Boolean<&G::BedResist, &B::Option1>("Option1").Title(Str::ToolboxZone1),
     Boolean<&G::BedResist, &B::Option2>("Option2").Title(Str::ToolboxZone2),
     Boolean<&G::BedResist, &B::Option3>("Option3").Title(Str::ToolboxZone3),
     Group<&G::BedResist, &B::VeloRes>("VeloRes"), Number<&G::BedResist, &B::CoefA>("CoefA").Title(Str::ToolboxCoefA),
     Number<&G::BedResist, &B::CoefB>("CoefB").Title(Str::ToolboxCoefB),
     Number<&G::BedResist, &B::MinRes>("MinRes").Title(Str::ToolboxMinimum),
     Number<&G::BedResist, &B::MaxRes>("MaxRes").Title(Str::ToolboxMaximum)});
constexpr DeclaredKeyword bedResistTools[] = {{"BRTools", bedResist}};

using C = HDCurveIncrement;
constexpr auto curve =
    FieldsOf<G>({Boolean<&G::CurveIncrement, &C::Enabled>("Enabled").Title(Str::CurveIncrement),
                 Boolean<&G::CurveIncrement, &C::SystemRange>("SystemRange").Title(Str::CurveSystemRange),
                 Boolean<&G::CurveIncrement, &C::SystemWidth>("SystemWidth").Title(Str::CurveSystemWidth),
                 Boolean<&G::CurveIncrement, &C::SystemRadius>("SystemRadius").Title(Str::CurveSystemRadius),
                 Boolean<&G::CurveIncrement, &C::SystemVelocity>("SystemVelocity").Title(Str::CurveSystemVelocity),
                 Integer<&G::CurveIncrement, &C::Range>("Range").Choices(Str::AverageRanges),
                 Number<&G::CurveIncrement, &C::Width>("Width", U::Width),
                 Number<&G::CurveIncrement, &C::Radius>("Radius", U::Radius),
                 Number<&G::CurveIncrement, &C::Velocity>("Velocity", U::Velocity)});
constexpr DeclaredKeyword waterLevelCurve[] = {{"WLDueToCurve", curve}};

using S = HDSandBarIncrement;
constexpr auto sand = FieldsOf<G>({Boolean<&G::SandBarIncrement, &S::Enabled>("Enabled").Title(Str::SandBarIncrement),
                                   Integer<&G::SandBarIncrement, &S::Method>("Method").Choices(Str::SandBarMethods),
                                   Number<&G::SandBarIncrement, &S::Slope>("Slope", U::Slope),
                                   Number<&G::SandBarIncrement, &S::Width>("Width", U::Width),
                                   Number<&G::SandBarIncrement, &S::Area>("Area", U::Area),
                                   Number<&G::SandBarIncrement, &S::Observed>("Observed", U::WaterLevel)});
constexpr DeclaredKeyword waterLevelSandBars[] = {{"WLDueToSand", sand}};

constexpr DeclaredKeyword encroachment[] = {Integer<&G::Max_no_iter>("Max_no_iter").Title(Str::EncroachIterations)};

using H = HDHeatBalance;
constexpr DeclaredKeyword heatBalance[] = {
    Boolean<&G::HeatBalance, &H::Calc>("Calc").Title(Str::HeatBalanceIncluded),
    Number<&G::HeatBalance, &H::Latitude>("Latitude", U::GeoAngle).Title(Str::Latitude),
    Number<&G::HeatBalance, &H::Longitude>("Longitude", U::GeoAngle).Title(Str::Longitude),
    Number<&G::HeatBalance, &H::TimeZone>("TimeZone", U::TimeDisplacement).Title(Str::TimeMeridian),
    Number<&G::HeatBalance, &H::DisTime>("DisTime", U::TimeDisplacement).Title(Str::TimeDisplacement),
    Number<&G::HeatBalance, &H::LightAtt>("LightAtt", U::LightAttenuation).Title(Str::LightAttenuation),
    Number<&G::HeatBalance, &H::betaBeer>("betaBeer", U::Factor).Title(Str::BeerConstant),
    Number<&G::HeatBalance, &H::RadA>("RadA", U::Factor).Title(Str::RadiationA),
    Number<&G::HeatBalance, &H::RadB>("RadB", U::Factor).Title(Str::RadiationB),
    Number<&G::HeatBalance, &H::VapA>("VapA", U::Factor).Title(Str::VaporizationA),
    Number<&G::HeatBalance, &H::VapB>("VapB", U::Factor).Title(Str::VaporizationB),
};

using T = HDStratification;
constexpr DeclaredKeyword stratification[] = {
    Integer<&G::Stratification, &T::npv>("npv").Title(Str::LayerCount),
    Boolean<&G::Stratification, &T::dens>("dens").Title(Str::LayerDensities),
    Number<&G::Stratification, &T::visc>("visc", U::Viscosity).Title(Str::Viscosity),
    Integer<&G::Stratification, &T::vmf>("vmf").Title(Str::FluidTurbulence).Choices(Str::FluidTurbulenceModels),
    Integer<&G::Stratification, &T::vmb>("vmb").Title(Str::BedTurbulence).Choices(Str::BedTurbulenceModels),
    Boolean<&G::Stratification, &T::Rich>("Rich").Title(Str::RichardsonCorrection),
    Number<&G::Stratification, &T::bpr1>("bpr1", U::Factor).Title(Str::BaroclinicFactor),
    Number<&G::Stratification, &T::bpr2>("bpr2", U::Factor).Title(Str::BaroclinicBedSlope),
    Number<&G::Stratification, &T::uu>("uu", U::Factor).Title(Str::HorizontalMomentum),
    Number<&G::Stratification, &T::uw>("uw", U::Factor).Title(Str::VerticalMomentum),
    Number<&G::Stratification, &T::uwc>("uwc", U::Factor).Title(Str::AdvectionFactor),
    Number<&G::Stratification, &T::dfx>("dfx", U::Factor).Title(Str::HorizontalViscosity),
    Number<&G::Stratification, &T::dfz>("dfz", U::Factor).Title(Str::VerticalViscosity),
};

using K = HDKlrConstants;
constexpr DeclaredKeyword klrParam[] = {
    Number<&G::Klr, &K::fricfac>("fricfac", U::Factor).Title(Str::KlrFriction),
    Number<&G::Klr, &K::maxvol>("maxvol", U::Volume).Digits(8).Title(Str::KlrMaxVolume),
    Number<&G::Klr, &K::maxvelo>("maxvelo", U::Velocity).Title(Str::KlrMaxVelocity),
    Number<&G::Klr, &K::minthick>("minthick", U::WaterLevel).Title(Str::KlrMinThickness),
    Number<&G::Klr, &K::densdiff>("densdiff", U::Factor).Title(Str::KlrDensityDifference),
    Integer<&G::Klr, &K::action>("action").Title(Str::KlrAction).Choices(Str::KlrActions),
    Number<&G::Klr, &K::R1>("R1", U::Factor).Title(Str::KlrUpward),
    Number<&G::Klr, &K::R2>("R2", U::Factor).Title(Str::KlrDownward),
    Number<&G::Klr, &K::Rs>("Rs", U::Factor).Title(Str::KlrUpwardAtControls),
};

using I = HDKlrInitial;
constexpr DeclaredKeyword klrInit[] = {
    Number<&G::KlrInit, &I::h1>("h1", U::WaterLevel).Digits(8).Title(Str::KlrWaterLevel),
    Number<&G::KlrInit, &I::h0>("h0", U::WaterLevel).Digits(8).Title(Str::KlrInterfaceLevel),
    Number<&G::KlrInit, &I::Q1>("Q1", U::Discharge).Digits(8).Title(Str::KlrTopDischarge),
    Number<&G::KlrInit, &I::Q0>("Q0", U::Discharge).Digits(8).Title(Str::KlrBottomDischarge),
    Number<&G::G_friction_factor>("G_friction_factor", U::Factor).Digits(3).Title(Str::WindFriction),
};

/// The list that a sub-section holds.
constexpr DeclaredKeyword Lines(FieldList group)
{
    return {"data", group, Presence::EachLine};
}

using O = HDTextOutput;
constexpr auto summaryInfo =
    FieldsOf<G>({BooleanAt<0, &G::TextOutput, &O::SummaryInfo>("Minimum").Title(Str::SeriesMinimum),
                 BooleanAt<1, &G::TextOutput, &O::SummaryInfo>("Maximum").Title(Str::SeriesMaximum),
                 BooleanAt<2, &G::TextOutput, &O::SummaryInfo>("TimeOfMinimum").Title(Str::SeriesTimeOfMinimum),
                 BooleanAt<3, &G::TextOutput, &O::SummaryInfo>("TimeOfMaximum").Title(Str::SeriesTimeOfMaximum)});
constexpr DeclaredKeyword textOutput[] = {
    Boolean<&G::TextOutput, &O::GenerateOutput>("GenerateOutput").Title(Str::GenerateSeries),
    Text<&G::TextOutput, &O::Delimiter>("Delimiter").Title(Str::SeriesDelimiter),
    Integer<&G::TextOutput, &O::ColumnWidth>("ColumnWidth").Title(Str::SeriesColumnWidth),
    {"SummaryInfo", summaryInfo},
    Integer<&G::TextOutput, &O::GridPointOutputType>("GridPointOutputType").Choices(Str::SeriesPointChoices),
    Boolean<&G::TextOutput, &O::LimitedPeriod>("LimitedPeriod").Title(Str::SeriesLimited),
    DateTime<&G::TextOutput, &O::LimitedPeriodStart>("LimitedPeriodStart").Title(Str::SeriesStart),
    DateTime<&G::TextOutput, &O::LimitedPeriodEnd>("LimitedPeriodEnd").Title(Str::SeriesEnd),
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
    Boolean<&G::MapOutput, &M::GenerateOutput>("GenerateOutput").Title(Str::GenerateMaps),
    Boolean<&G::MapOutput, &M::ApplyDemInRiverXsec>("ApplyDemInRiverXsec").Title(Str::MapRiverCrossSections),
    Boolean<&G::MapOutput, &M::ApplyDemGroundElevation>(groundElevation).Title(Str::MapGroundElevation),
    {Boolean<&G::MapOutput, &M::MapAreaGeoDb>("MapAreaGeoDb").Title(Str::MapFloodedAreas), groundElevation},
    {FileName<&G::MapOutput, &M::GeoDb>("GeoDb").Title(Str::MapHelpGrid), groundElevation},
    {Boolean<&G::MapOutput, &M::AddToCalculation>("AddToCalculation"), groundElevation},
};
constexpr auto mapFiles = FieldsOf<G>({Group<&G::MapOutput, &M::MapOutputFiles>("MapOutputFiles")});
constexpr auto demFiles = FieldsOf<G>({Group<&G::MapOutput, &M::DemInputFiles>("DemInputFiles")});
constexpr DeclaredKeyword mapLines[] = {Lines(mapFiles)}, demLines[] = {Lines(demFiles)};
constexpr DeclaredSection mapLists[] = {{"MapOutputFiles", kept, mapLines}, {"DemInputFiles", kept, demLines}};

using L = HDLeakageGlobal;
constexpr DeclaredKeyword leakage[] = {
    Boolean<&G::Leakage, &L::IncludeLeakage>("IncludeLeakage").Title(Str::IncludeLeakage),
    Number<&G::Leakage, &L::LeakageCoefficient>("LeakageCoefficient", U::LeakageCoefficient)
        .Digits(3)
        .Title(Str::GlobalLeakageCoef),
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
        FieldsOf<I>({Integer<&I::Item>("Item").Title(Str::OutputItemColumns, 0).Choices(Str::OutputItems),
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
         Integer<&R::Type>("Type").Title(titles, 8).Choices(Str::MapTypes),
         Integer<&R::StoringFrequency>("StoringFrequency").Title(titles, 11),
         Integer<&R::Item>("Item").Title(titles, 9).Choices(Str::MapItems),
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
