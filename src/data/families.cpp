// What is known about each field of the families.
#include "data/families.h"

#include "files/declare_field.h"
#include "texts/text_numbers.h"

using U = UnitGroup;

namespace {
constexpr Field level = Plain<double>("Level", U::WaterLevel).Is(Along::Elevation).Means(Str::MeansMarkLevel);
constexpr Str titles = Str::EncroachColumns;
} // namespace

FieldList LocationFields()
{
    static constexpr auto fields = FieldsOf<HD_RiverPos>(
        {Text<&HD_RiverPos::RiverName>("RiverName").Title(Str::RiverName).Means(Str::MeansRiverName),
         Number<&HD_RiverPos::Chainage>("Chainage", U::Chainage).Title(Str::Chainage).Means(Str::MeansChainage)});
    return fields;
}

// A field a line.
// clang-format off
KVR_FIELDS(HD_Initial,
           Number<&Self::InitialH>("InitialH", U::WaterLevel).Is(Along::Elevation).Title(Str::InitialH).Means(Str::MeansInitialH),
           Number<&Self::InitialQ>("InitialQ", U::Discharge).Title(Str::InitialQ).Means(Str::MeansInitialQ))

KVR_FIELDS(HD_Windfact,
           Number<&Self::WindFactor>("WindFactor", U::Factor).Title(Str::WindFactor).Means(Str::MeansWindFactor))

KVR_FIELDS(HD_Resistfact,
           Number<&Self::Resistance>("Resistance").Title(Str::Resistance).Digits(6).Means(Str::MeansResistance),
           Number<&Self::ZoneResistance1>("ZoneResistance1").Title(Str::Zone1).Digits(6).OptionalTail().Means(Str::MeansZone1),
           Number<&Self::ZoneResistance2>("ZoneResistance2").Title(Str::Zone2).Digits(6).OptionalTail().Means(Str::MeansZone2),
           Number<&Self::ZoneResistance3>("ZoneResistance3").Title(Str::Zone3).Digits(6).OptionalTail().Means(Str::MeansZone3))

KVR_FIELDS(HD_Wavetype,
           Number<&Self::DownstreamChainage>("DownstreamChainage", U::Chainage).Is(Along::ReachEnd).Title(Str::DownstreamChainage).Means(Str::MeansReachEnd),
           Integer<&Self::WaveApproximation>("WaveApproximation").Title(Str::WaveApproximation).Choices(Str::WaveApproximations).Means(Str::MeansWave))

KVR_FIELDS(HD_Waterloss,
           Number<&Self::WaterLoss1>("WaterLoss1").Title(Str::WaterLosses, 0).Digits(6).Means(Str::MeansWaterLoss),
           Number<&Self::WaterLoss2>("WaterLoss2").Title(Str::WaterLosses, 1).Digits(6).Means(Str::MeansWaterLoss),
           Number<&Self::WaterLoss3>("WaterLoss3").Title(Str::WaterLosses, 2).Digits(6).Means(Str::MeansWaterLoss),
           Number<&Self::WaterLoss4>("WaterLoss4").Title(Str::WaterLosses, 3).Digits(6).Means(Str::MeansWaterLoss))

KVR_FIELDS(HD_Flood_resist,
           Number<&Self::FloodPlainResistance>("FloodPlainResistance", U::FloodPlainResistance).Title(Str::FloodPlRes).Means(Str::MeansFloodPlainResistance))

KVR_FIELDS(CMixingWCCoef,
           Number<&Self::First>("First").Title(Str::WidthDepthRatio).Digits(6).Means(Str::MeansWidthDepth),
           Number<&Self::Second>("Second").Title(Str::MixingCoefficient).Digits(6).Means(Str::MeansMixing))

KVR_FIELDS(HDMixingCoef,
           Group<&Self::CoefPairs>("CoefPairs"),
           Number<&Self::MixCoef1>("MixCoef1").Title(Str::MixCoefs, 0).Digits(6).Means(Str::MeansMixing),
           Number<&Self::MixCoef2>("MixCoef2").Title(Str::MixCoefs, 1).Digits(6).Means(Str::MeansMixing),
           Number<&Self::MixCoef3>("MixCoef3").Title(Str::MixCoefs, 2).Digits(6).Means(Str::MeansMixing),
           Number<&Self::MixCoef4>("MixCoef4").Title(Str::MixCoefs, 3).Digits(6).Means(Str::MeansMixing))

KVR_FIELDS(HDWLMark,
           PlainGroup<level, &Self::MarkLevels>("MarkLevels"))

KVR_FIELDS(HDWLCurve,
           Integer<&Self::CurveOption>("CurveOption").Title(Str::AverageRange).Choices(Str::AverageRanges).Means(Str::MeansCurveRange),
           Number<&Self::CurveValue1>("CurveValue1", U::Width).Title(Str::WaterWidth).Means(Str::MeansCurveWidth),
           Number<&Self::CurveValue2>("CurveValue2", U::Radius).Title(Str::CurveRadius).Means(Str::MeansCurveRadius),
           Number<&Self::CurveValue3>("CurveValue3", U::Velocity).Title(Str::Velocity).Means(Str::MeansCurveVelocity))

KVR_FIELDS(HDWLSandBars,
           Number<&Self::SandBarValue1>("SandBarValue1", U::Slope).Title(Str::BedSlope).Means(Str::MeansSandSlope),
           Number<&Self::SandBarValue2>("SandBarValue2", U::Width).Title(Str::LowWaterWidth).Means(Str::MeansSandWidth),
           Number<&Self::SandBarValue3>("SandBarValue3", U::Area).Title(Str::LowWaterArea).Means(Str::MeansSandArea),
           Number<&Self::SandBarValue4>("SandBarValue4", U::WaterLevel).Title(Str::ObservedIncrement).Means(Str::MeansSandObserved))

KVR_FIELDS(CBRTVeloRes,
           Number<&Self::Velocity>("Velocity", U::Velocity).Title(Str::Velocity).Digits(6).Means(Str::MeansTableVelocity),
           Number<&Self::ResValue>("ResValue").Title(Str::Resistance).Digits(6).Means(Str::MeansTableResistance))

KVR_FIELDS(HDBedResTool,
           Number<&Self::CoefA>("CoefA").Title(Str::CoefA).Digits(6).Means(Str::MeansCoefA),
           Number<&Self::CoefB>("CoefB").Title(Str::CoefB).Digits(6).Means(Str::MeansCoefB),
           Number<&Self::MinRes>("MinRes").Title(Str::MinRes).Digits(6).Means(Str::MeansMinRes),
           Number<&Self::MaxRes>("MaxRes").Title(Str::MaxRes).Digits(6).Means(Str::MeansMaxRes),
           Group<&Self::VeloRes>("VeloRes"))

KVR_FIELDS(HDEncroach,
           Integer<&Self::EncOption1>("EncOption1").Title(titles, 0).Choices(Str::EncroachMethods, 1).Means(Str::MeansEncMethod),
           Integer<&Self::EncOption2>("EncOption2").Title(titles, 1).Choices(Str::EncroachBanks, 1).Means(Str::MeansEncBanks),
           NumberAt<0, &Self::EncValues1>("EncValues1.1", U::Width).Title(titles, 2).Digits(6).Means(Str::MeansEncLeftOffset),
           NumberAt<1, &Self::EncValues1>("EncValues1.2", U::Width).Title(titles, 3).Digits(6).Means(Str::MeansEncRightOffset),
           NumberAt<2, &Self::EncValues1>("EncValues1.3", U::Width).Title(titles, 4).Digits(6).Means(Str::MeansEncLeftPosition),
           NumberAt<3, &Self::EncValues1>("EncValues1.4", U::Width).Title(titles, 5).Digits(6).Means(Str::MeansEncRightPosition),
           NumberAt<4, &Self::EncValues1>("EncValues1.5", U::Width).Title(titles, 6).Digits(6).Means(Str::MeansEncWidth),
           Integer<&Self::EncOption3>("EncOption3").Title(titles, 7).Choices(Str::EncroachReductions, 1).Means(Str::MeansEncReduction),
           NumberAt<0, &Self::EncValues2>("EncValues2.1").Title(titles, 8).Digits(6).Means(Str::MeansEncTotal),
           NumberAt<1, &Self::EncValues2>("EncValues2.2").Title(titles, 9).Digits(6).Means(Str::MeansEncLeft),
           NumberAt<2, &Self::EncValues2>("EncValues2.3").Title(titles, 10).Digits(6).Means(Str::MeansEncRight),
           NumberAt<3, &Self::EncValues2>("EncValues2.4", U::WaterLevel).Title(titles, 11).Digits(6).Means(Str::MeansEncLevel),
           NumberAt<4, &Self::EncValues2>("EncValues2.5", U::WaterLevel).Title(titles, 12).Digits(6).Means(Str::MeansEncEnergy))

KVR_FIELDS(HDKlrParam,
           Number<&Self::R1>("R1", U::Factor).Title(Str::LayerR1).Means(Str::MeansR1),
           Number<&Self::R2>("R2", U::Factor).Title(Str::LayerR2).Means(Str::MeansR2))

KVR_FIELDS(HDKlrInit,
           Number<&Self::h1>("h1", U::WaterLevel).Title(Str::LayerH1).Means(Str::MeansLayerH1),
           Number<&Self::h0>("h0", U::WaterLevel).Title(Str::LayerH0).Means(Str::MeansLayerH0),
           Number<&Self::Q1>("Q1", U::Discharge).Title(Str::LayerQ1).Means(Str::MeansLayerQ1),
           Number<&Self::Q0>("Q0", U::Discharge).Title(Str::LayerQ0).Means(Str::MeansLayerQ0))

KVR_FIELDS(HDContraExpan,
           Number<&Self::Contraction>("Contraction", U::Factor).Title(Str::Contraction).Means(Str::MeansContraction),
           Number<&Self::Expansion>("Expansion", U::Factor).Title(Str::Expansion).Means(Str::MeansExpansion))

KVR_FIELDS(HDReachLength,
           Number<&Self::ReachLength1>("ReachLength1", U::Chainage).Title(Str::LeftBank).Means(Str::MeansLeftReach),
           Number<&Self::ReachLength2>("ReachLength2", U::Chainage).Title(Str::RightBank).Means(Str::MeansRightReach))

KVR_FIELDS(HDOutputGridPoint,
           Number<&Self::PointValue>("PointValue", U::Chainage).Is(Along::ReachEnd).Title(Str::DownstreamChainage).Means(Str::MeansReachEnd))

// Coefficients are far below one, so three decimals would show nothing of them.
KVR_FIELDS(HDLeakage,
           Number<&Self::LeakageCoefficient>("LeakageCoefficient", U::LeakageCoefficient).Title(Str::LeakageCoef).Digits(6).Means(Str::MeansLeakage))
