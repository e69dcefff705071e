// What is known about each field of the families.
#include "data/families.h"

#include "files/declare_field.h"
#include "texts/text_numbers.h"

using U = UnitGroup;

FieldList LocationFields()
{
    static constexpr auto fields =
        FieldsOf<HD_RiverPos>({Text<&HD_RiverPos::RiverName>("RiverName").Title(Str::RiverName),
                               Number<&HD_RiverPos::Chainage>("Chainage", U::Chainage).Title(Str::Chainage)});
    return fields;
}

FieldList HD_Initial::DeclaredFields()
{
    static constexpr auto fields =
        FieldsOf<HD_Initial>({Number<&HD_Initial::InitialH>("InitialH", U::WaterLevel).Title(Str::InitialH),
                              Number<&HD_Initial::InitialQ>("InitialQ", U::Discharge).Title(Str::InitialQ)});
    return fields;
}

FieldList HD_Windfact::DeclaredFields()
{
    static constexpr auto fields =
        FieldsOf<HD_Windfact>({Number<&HD_Windfact::WindFactor>("WindFactor", U::Factor).Title(Str::WindFactor)});
    return fields;
}

FieldList HD_Resistfact::DeclaredFields()
{
    using R = HD_Resistfact;
    static constexpr auto fields =
        FieldsOf<R>({Number<&R::Resistance>("Resistance").Title(Str::Resistance).Digits(6),
                     Number<&R::ZoneResistance1>("ZoneResistance1").Title(Str::Zone1).Digits(6).OptionalTail(),
                     Number<&R::ZoneResistance2>("ZoneResistance2").Title(Str::Zone2).Digits(6).OptionalTail(),
                     Number<&R::ZoneResistance3>("ZoneResistance3").Title(Str::Zone3).Digits(6).OptionalTail()});
    return fields;
}

FieldList HD_Wavetype::DeclaredFields()
{
    using W = HD_Wavetype;
    static constexpr auto fields =
        FieldsOf<W>({Number<&W::DownstreamChainage>("DownstreamChainage", U::Chainage).Title(Str::DownstreamChainage),
                     Choice<&W::WaveApproximation>("WaveApproximation")
                         .Title(Str::WaveApproximation)
                         .Choices(Str::WaveApproximations)});
    return fields;
}

FieldList HD_Waterloss::DeclaredFields()
{
    using W = HD_Waterloss;
    static constexpr auto fields =
        FieldsOf<W>({Number<&W::WaterLoss1>("WaterLoss1").Digits(6), Number<&W::WaterLoss2>("WaterLoss2").Digits(6),
                     Number<&W::WaterLoss3>("WaterLoss3").Digits(6), Number<&W::WaterLoss4>("WaterLoss4").Digits(6)});
    return fields;
}

FieldList HD_Flood_resist::DeclaredFields()
{
    using F = HD_Flood_resist;
    static constexpr auto fields = FieldsOf<F>(
        {Number<&F::FloodPlainResistance>("FloodPlainResistance", U::FloodPlainResistance).Title(Str::FloodPlRes)});
    return fields;
}

FieldList CMixingWCCoef::DeclaredFields()
{
    using M = CMixingWCCoef;
    static constexpr auto fields = FieldsOf<M>({Number<&M::First>("First").Title(Str::WidthDepthRatio).Digits(6),
                                                Number<&M::Second>("Second").Title(Str::MixingCoefficient).Digits(6)});
    return fields;
}

FieldList HDMixingCoef::DeclaredFields()
{
    using M = HDMixingCoef;
    static constexpr auto fields =
        FieldsOf<M>({Group<&M::CoefPairs>("CoefPairs"), Number<&M::MixCoef1>("MixCoef1").Digits(6),
                     Number<&M::MixCoef2>("MixCoef2").Digits(6), Number<&M::MixCoef3>("MixCoef3").Digits(6),
                     Number<&M::MixCoef4>("MixCoef4").Digits(6)});
    return fields;
}

FieldList HDWLMark::DeclaredFields()
{
    static constexpr Field level = Plain<double>("Level", U::WaterLevel);
    static constexpr auto fields = FieldsOf<HDWLMark>({PlainGroup<level, &HDWLMark::MarkLevels>("MarkLevels")});
    return fields;
}

FieldList HDWLCurve::DeclaredFields()
{
    using C = HDWLCurve;
    static constexpr auto fields =
        FieldsOf<C>({Choice<&C::CurveOption>("CurveOption").Title(Str::AverageRange).Choices(Str::AverageRanges),
                     Number<&C::CurveValue1>("CurveValue1", U::Width).Title(Str::WaterWidth),
                     Number<&C::CurveValue2>("CurveValue2", U::Radius).Title(Str::CurveRadius),
                     Number<&C::CurveValue3>("CurveValue3", U::Velocity).Title(Str::Velocity)});
    return fields;
}

FieldList HDWLSandBars::DeclaredFields()
{
    using S = HDWLSandBars;
    static constexpr auto fields =
        FieldsOf<S>({Number<&S::SandBarValue1>("SandBarValue1", U::Slope).Title(Str::BedSlope),
                     Number<&S::SandBarValue2>("SandBarValue2", U::Width).Title(Str::LowWaterWidth),
                     Number<&S::SandBarValue3>("SandBarValue3", U::Area).Title(Str::LowWaterArea),
                     Number<&S::SandBarValue4>("SandBarValue4", U::WaterLevel).Title(Str::ObservedIncrement)});
    return fields;
}

FieldList CBRTVeloRes::DeclaredFields()
{
    using V = CBRTVeloRes;
    static constexpr auto fields =
        FieldsOf<V>({Number<&V::Velocity>("Velocity", U::Velocity).Title(Str::Velocity).Digits(6),
                     Number<&V::ResValue>("ResValue").Title(Str::Resistance).Digits(6)});
    return fields;
}

FieldList HDBedResTool::DeclaredFields()
{
    using B = HDBedResTool;
    static constexpr auto fields = FieldsOf<B>(
        {Number<&B::CoefA>("CoefA").Title(Str::CoefA).Digits(6), Number<&B::CoefB>("CoefB").Title(Str::CoefB).Digits(6),
         Number<&B::MinRes>("MinRes").Title(Str::MinRes).Digits(6),
         Number<&B::MaxRes>("MaxRes").Title(Str::MaxRes).Digits(6), Group<&B::VeloRes>("VeloRes")});
    return fields;
}

FieldList HDEncroach::DeclaredFields()
{
    using E = HDEncroach;
    constexpr Str titles = Str::EncroachColumns;
    static constexpr auto fields = FieldsOf<E>({
        Choice<&E::EncOption1>("EncOption1").Title(titles, 0).Choices(Str::EncroachMethods, 1),
        Choice<&E::EncOption2>("EncOption2").Title(titles, 1).Choices(Str::EncroachBanks, 1),
        NumberAt<0, &E::EncValues1>("EncValues1.1", U::Width).Title(titles, 2).Digits(6),
        NumberAt<1, &E::EncValues1>("EncValues1.2", U::Width).Title(titles, 3).Digits(6),
        NumberAt<2, &E::EncValues1>("EncValues1.3", U::Width).Title(titles, 4).Digits(6),
        NumberAt<3, &E::EncValues1>("EncValues1.4", U::Width).Title(titles, 5).Digits(6),
        NumberAt<4, &E::EncValues1>("EncValues1.5", U::Width).Title(titles, 6).Digits(6),
        Choice<&E::EncOption3>("EncOption3").Title(titles, 7).Choices(Str::EncroachReductions, 1),
        NumberAt<0, &E::EncValues2>("EncValues2.1").Title(titles, 8).Digits(6),
        NumberAt<1, &E::EncValues2>("EncValues2.2").Title(titles, 9).Digits(6),
        NumberAt<2, &E::EncValues2>("EncValues2.3").Title(titles, 10).Digits(6),
        NumberAt<3, &E::EncValues2>("EncValues2.4", U::WaterLevel).Title(titles, 11).Digits(6),
        NumberAt<4, &E::EncValues2>("EncValues2.5", U::WaterLevel).Title(titles, 12).Digits(6),
    });
    return fields;
}

FieldList HDKlrParam::DeclaredFields()
{
    static constexpr auto fields = FieldsOf<HDKlrParam>({Number<&HDKlrParam::R1>("R1", U::Factor).Title(Str::LayerR1),
                                                         Number<&HDKlrParam::R2>("R2", U::Factor).Title(Str::LayerR2)});
    return fields;
}

FieldList HDKlrInit::DeclaredFields()
{
    using K = HDKlrInit;
    static constexpr auto fields = FieldsOf<K>({Number<&K::h1>("h1", U::WaterLevel).Title(Str::LayerH1),
                                                Number<&K::h0>("h0", U::WaterLevel).Title(Str::LayerH0),
                                                Number<&K::Q1>("Q1", U::Discharge).Title(Str::LayerQ1),
                                                Number<&K::Q0>("Q0", U::Discharge).Title(Str::LayerQ0)});
    return fields;
}

FieldList HDContraExpan::DeclaredFields()
{
    using C = HDContraExpan;
    static constexpr auto fields =
        FieldsOf<C>({Number<&C::Contraction>("Contraction", U::Factor).Title(Str::Contraction),
                     Number<&C::Expansion>("Expansion", U::Factor).Title(Str::Expansion)});
    return fields;
}

FieldList HDReachLength::DeclaredFields()
{
    using R = HDReachLength;
    static constexpr auto fields =
        FieldsOf<R>({Number<&R::ReachLength1>("ReachLength1", U::Chainage).Title(Str::LeftBank),
                     Number<&R::ReachLength2>("ReachLength2", U::Chainage).Title(Str::RightBank)});
    return fields;
}

FieldList HDOutputGridPoint::DeclaredFields()
{
    using O = HDOutputGridPoint;
    static constexpr auto fields =
        FieldsOf<O>({Number<&O::PointValue>("PointValue", U::Chainage).Title(Str::DownstreamChainage)});
    return fields;
}

FieldList HDLeakage::DeclaredFields()
{
    // Coefficients are far below one, so three decimals would show nothing of them.
    static constexpr auto fields =
        FieldsOf<HDLeakage>({Number<&HDLeakage::LeakageCoefficient>("LeakageCoefficient", U::LeakageCoefficient)
                                 .Title(Str::LeakageCoef)
                                 .Digits(6)});
    return fields;
}
