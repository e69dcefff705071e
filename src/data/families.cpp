// What is known about each field of the families.
#include "data/families.h"

#include "files/declare_field.h"
#include "texts/text_numbers.h"

using U = UnitGroup;

namespace {
constexpr Field level = Plain<double>("Level", U::WaterLevel);
constexpr Str titles = Str::EncroachColumns;
} // namespace

FieldList LocationFields()
{
    static constexpr auto fields =
        FieldsOf<HD_RiverPos>({Text<&HD_RiverPos::RiverName>("RiverName").Title(Str::RiverName),
                               Number<&HD_RiverPos::Chainage>("Chainage", U::Chainage).Title(Str::Chainage)});
    return fields;
}

// A field a line.
// clang-format off
KVR_FIELDS(HD_Initial,
           Number<&Self::InitialH>("InitialH", U::WaterLevel).Title(Str::InitialH),
           Number<&Self::InitialQ>("InitialQ", U::Discharge).Title(Str::InitialQ))

KVR_FIELDS(HD_Windfact,
           Number<&Self::WindFactor>("WindFactor", U::Factor).Title(Str::WindFactor))

KVR_FIELDS(HD_Resistfact,
           Number<&Self::Resistance>("Resistance").Title(Str::Resistance).Digits(6),
           Number<&Self::ZoneResistance1>("ZoneResistance1").Title(Str::Zone1).Digits(6).OptionalTail(),
           Number<&Self::ZoneResistance2>("ZoneResistance2").Title(Str::Zone2).Digits(6).OptionalTail(),
           Number<&Self::ZoneResistance3>("ZoneResistance3").Title(Str::Zone3).Digits(6).OptionalTail())

KVR_FIELDS(HD_Wavetype,
           Number<&Self::DownstreamChainage>("DownstreamChainage", U::Chainage).Title(Str::DownstreamChainage),
           Integer<&Self::WaveApproximation>("WaveApproximation").Title(Str::WaveApproximation).Choices(Str::WaveApproximations))

KVR_FIELDS(HD_Waterloss,
           Number<&Self::WaterLoss1>("WaterLoss1").Title(Str::WaterLosses, 0).Digits(6),
           Number<&Self::WaterLoss2>("WaterLoss2").Title(Str::WaterLosses, 1).Digits(6),
           Number<&Self::WaterLoss3>("WaterLoss3").Title(Str::WaterLosses, 2).Digits(6),
           Number<&Self::WaterLoss4>("WaterLoss4").Title(Str::WaterLosses, 3).Digits(6))

KVR_FIELDS(HD_Flood_resist,
           Number<&Self::FloodPlainResistance>("FloodPlainResistance", U::FloodPlainResistance).Title(Str::FloodPlRes))

KVR_FIELDS(CMixingWCCoef,
           Number<&Self::First>("First").Title(Str::WidthDepthRatio).Digits(6),
           Number<&Self::Second>("Second").Title(Str::MixingCoefficient).Digits(6))

KVR_FIELDS(HDMixingCoef,
           Group<&Self::CoefPairs>("CoefPairs"),
           Number<&Self::MixCoef1>("MixCoef1").Title(Str::MixCoefs, 0).Digits(6),
           Number<&Self::MixCoef2>("MixCoef2").Title(Str::MixCoefs, 1).Digits(6),
           Number<&Self::MixCoef3>("MixCoef3").Title(Str::MixCoefs, 2).Digits(6),
           Number<&Self::MixCoef4>("MixCoef4").Title(Str::MixCoefs, 3).Digits(6))

KVR_FIELDS(HDWLMark,
           PlainGroup<level, &Self::MarkLevels>("MarkLevels"))

KVR_FIELDS(HDWLCurve,
           Integer<&Self::CurveOption>("CurveOption").Title(Str::AverageRange).Choices(Str::AverageRanges),
           Number<&Self::CurveValue1>("CurveValue1", U::Width).Title(Str::WaterWidth),
           Number<&Self::CurveValue2>("CurveValue2", U::Radius).Title(Str::CurveRadius),
           Number<&Self::CurveValue3>("CurveValue3", U::Velocity).Title(Str::Velocity))

KVR_FIELDS(HDWLSandBars,
           Number<&Self::SandBarValue1>("SandBarValue1", U::Slope).Title(Str::BedSlope),
           Number<&Self::SandBarValue2>("SandBarValue2", U::Width).Title(Str::LowWaterWidth),
           Number<&Self::SandBarValue3>("SandBarValue3", U::Area).Title(Str::LowWaterArea),
           Number<&Self::SandBarValue4>("SandBarValue4", U::WaterLevel).Title(Str::ObservedIncrement))

KVR_FIELDS(CBRTVeloRes,
           Number<&Self::Velocity>("Velocity", U::Velocity).Title(Str::Velocity).Digits(6),
           Number<&Self::ResValue>("ResValue").Title(Str::Resistance).Digits(6))

KVR_FIELDS(HDBedResTool,
           Number<&Self::CoefA>("CoefA").Title(Str::CoefA).Digits(6),
           Number<&Self::CoefB>("CoefB").Title(Str::CoefB).Digits(6),
           Number<&Self::MinRes>("MinRes").Title(Str::MinRes).Digits(6),
           Number<&Self::MaxRes>("MaxRes").Title(Str::MaxRes).Digits(6),
           Group<&Self::VeloRes>("VeloRes"))

KVR_FIELDS(HDEncroach,
           Integer<&Self::EncOption1>("EncOption1").Title(titles, 0).Choices(Str::EncroachMethods, 1),
           Integer<&Self::EncOption2>("EncOption2").Title(titles, 1).Choices(Str::EncroachBanks, 1),
           NumberAt<0, &Self::EncValues1>("EncValues1.1", U::Width).Title(titles, 2).Digits(6),
           NumberAt<1, &Self::EncValues1>("EncValues1.2", U::Width).Title(titles, 3).Digits(6),
           NumberAt<2, &Self::EncValues1>("EncValues1.3", U::Width).Title(titles, 4).Digits(6),
           NumberAt<3, &Self::EncValues1>("EncValues1.4", U::Width).Title(titles, 5).Digits(6),
           NumberAt<4, &Self::EncValues1>("EncValues1.5", U::Width).Title(titles, 6).Digits(6),
           Integer<&Self::EncOption3>("EncOption3").Title(titles, 7).Choices(Str::EncroachReductions, 1),
           NumberAt<0, &Self::EncValues2>("EncValues2.1").Title(titles, 8).Digits(6),
           NumberAt<1, &Self::EncValues2>("EncValues2.2").Title(titles, 9).Digits(6),
           NumberAt<2, &Self::EncValues2>("EncValues2.3").Title(titles, 10).Digits(6),
           NumberAt<3, &Self::EncValues2>("EncValues2.4", U::WaterLevel).Title(titles, 11).Digits(6),
           NumberAt<4, &Self::EncValues2>("EncValues2.5", U::WaterLevel).Title(titles, 12).Digits(6))

KVR_FIELDS(HDKlrParam,
           Number<&Self::R1>("R1", U::Factor).Title(Str::LayerR1),
           Number<&Self::R2>("R2", U::Factor).Title(Str::LayerR2))

KVR_FIELDS(HDKlrInit,
           Number<&Self::h1>("h1", U::WaterLevel).Title(Str::LayerH1),
           Number<&Self::h0>("h0", U::WaterLevel).Title(Str::LayerH0),
           Number<&Self::Q1>("Q1", U::Discharge).Title(Str::LayerQ1),
           Number<&Self::Q0>("Q0", U::Discharge).Title(Str::LayerQ0))

KVR_FIELDS(HDContraExpan,
           Number<&Self::Contraction>("Contraction", U::Factor).Title(Str::Contraction),
           Number<&Self::Expansion>("Expansion", U::Factor).Title(Str::Expansion))

KVR_FIELDS(HDReachLength,
           Number<&Self::ReachLength1>("ReachLength1", U::Chainage).Title(Str::LeftBank),
           Number<&Self::ReachLength2>("ReachLength2", U::Chainage).Title(Str::RightBank))

KVR_FIELDS(HDOutputGridPoint,
           Number<&Self::PointValue>("PointValue", U::Chainage).Title(Str::DownstreamChainage))

// Coefficients are far below one, so three decimals would show nothing of them.
KVR_FIELDS(HDLeakage,
           Number<&Self::LeakageCoefficient>("LeakageCoefficient", U::LeakageCoefficient).Title(Str::LeakageCoef).Digits(6))
