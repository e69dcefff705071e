// The families of location records: their fields in file order, behind branch name and chainage. A list is
// stored as one keyword "DATA" a record; the field order below is the parameter order.
#pragma once

#include "data/location_record.h"

#include <memory>

/// Initial conditions at a location.
class HD_Initial final : public HDRecord<HD_Initial>
{
public:
    double InitialH = 0; // water level or depth, see the global switch iLevelDepth
    double InitialQ = 0;

    static FieldList DeclaredFields();
};

/// Topographical wind factor.
class HD_Windfact final : public HDRecord<HD_Windfact>
{
public:
    double WindFactor = 0;

    static FieldList DeclaredFields();
};

/// Bed resistance, of the whole section and of its three zones. Older files end with the first value.
class HD_Resistfact final : public HDRecord<HD_Resistfact>
{
public:
    double Resistance = 30;
    double ZoneResistance1 = 30, ZoneResistance2 = 25, ZoneResistance3 = 20;

    static FieldList DeclaredFields();
};

/// Approximation of the momentum equation in a reach.
class HD_Wavetype final : public HDRecord<HD_Wavetype>
{
public:
    double DownstreamChainage = 0;      // end of the reach that starts at Chainage
    std::int32_t WaveApproximation = 0; // 0 high order fully dynamic, 1 fully dynamic, 2 diffusive, 3 kinematic

    static FieldList DeclaredFields();
};

/// Water loss, four coefficients.
class HD_Waterloss final : public HDRecord<HD_Waterloss>
{
public:
    double WaterLoss1 = 0, WaterLoss2 = 0, WaterLoss3 = 0, WaterLoss4 = 0;

    static FieldList DeclaredFields();
};

/// Flood plain resistance.
class HD_Flood_resist final : public HDRecord<HD_Flood_resist>
{
public:
    double FloodPlainResistance = 0;

    static FieldList DeclaredFields();
};

/// One pair of mixing coefficients.
struct CMixingWCCoef
{
    double First = 0, Second = 0;

    static FieldList DeclaredFields();
};

/// Mixing coefficients: any number of pairs, then four single ones.
class HDMixingCoef final : public HDRecord<HDMixingCoef>
{
public:
    std::vector<CMixingWCCoef> CoefPairs;
    double MixCoef1 = 0, MixCoef2 = 0, MixCoef3 = 0, MixCoef4 = 0;

    /// A deep copy; the caller owns it.
    std::unique_ptr<HDMixingCoef> Clone() const { return std::make_unique<HDMixingCoef>(*this); }
    static FieldList DeclaredFields();
};

/// Levels of the user-defined marks: as many as this record has, whatever the number of mark titles.
class HDWLMark final : public HDRecord<HDWLMark>
{
public:
    std::vector<double> MarkLevels;

    static FieldList DeclaredFields();
};

/// Water level increment due to curvature.
class HDWLCurve final : public HDRecord<HDWLCurve>
{
public:
    std::int32_t CurveOption = 0; // averaging range: none, single, multiple 1, 2, one half
    double CurveValue1 = 0;       // water width
    double CurveValue2 = 0;       // radius
    double CurveValue3 = 0;       // velocity

    static FieldList DeclaredFields();
};

/// Water level increment due to sand bars.
class HDWLSandBars final : public HDRecord<HDWLSandBars>
{
public:
    double SandBarValue1 = 0; // slope of the bed channel
    double SandBarValue2 = 0; // width of the low water channel
    double SandBarValue3 = 0; // area of the low water channel
    double SandBarValue4 = 0; // observed increment

    static FieldList DeclaredFields();
};

/// One step of a resistance curve over velocity.
struct CBRTVeloRes
{
    double Velocity = 0, ResValue = 0;

    static FieldList DeclaredFields();
};

/// Bed resistance as a function of the flow, bounded, or as a table over velocity.
class HDBedResTool final : public HDRecord<HDBedResTool>
{
public:
    double CoefA = 0, CoefB = 0, MinRes = 0, MaxRes = 0;
    std::vector<CBRTVeloRes> VeloRes;

    static FieldList DeclaredFields();
};

/// One location of an encroachment set-up.
class HDEncroach final : public HDRecord<HDEncroach>
{
public:
    std::int32_t EncOption1 = 1, EncOption2 = 1;
    double EncValues1[5] = {};
    std::int32_t EncOption3 = 1;
    double EncValues2[5] = {};

    static FieldList DeclaredFields();
};

/// Richardson bulk flux numbers of the two-layer model.
class HDKlrParam final : public HDRecord<HDKlrParam>
{
public:
    double R1 = 0.05, R2 = 0.05;

    static FieldList DeclaredFields();
};

/// Initial conditions of the two layers: 1 the top layer, 0 the bottom layer.
class HDKlrInit final : public HDRecord<HDKlrInit>
{
public:
    double h1 = 0, h0 = 0, Q1 = 0, Q0 = 0;

    static FieldList DeclaredFields();
};

/// Contraction and expansion losses of the quasi-steady solver.
class HDContraExpan final : public HDRecord<HDContraExpan>
{
public:
    double Contraction = 0.1, Expansion = 0.3;

    static FieldList DeclaredFields();
};

/// Over-bank reach lengths, left and right bank.
class HDReachLength final : public HDRecord<HDReachLength>
{
public:
    double ReachLength1 = 0, ReachLength2 = 0;

    static FieldList DeclaredFields();
};

/// Grid points of the time series output: a reach from Chainage to PointValue.
class HDOutputGridPoint final : public HDRecord<HDOutputGridPoint>
{
public:
    double PointValue = 0; // downstream chainage

    static FieldList DeclaredFields();
};

/// Groundwater leakage.
class HDLeakage final : public HDRecord<HDLeakage>
{
public:
    double LeakageCoefficient = 0;

    static FieldList DeclaredFields();
};
