#include "sample_river.h"

#include <algorithm>
#include <cmath>
#include <random>

namespace {

struct Reach
{
    const char* name;
    double length;           // metres
    double bedUp, bedDown;   // metres above datum
    double discharge, depth; // cubic metres a second, metres
};
constexpr Reach reaches[] = {{"AELDER UPPER", 24600, 62.4, 38.1, 45, 2.4},
                             {"AELDER LOWER", 31250, 38.1, 17.6, 53.5, 3.1},
                             {"MOORBECK", 9850, 57.3, 38.9, 8.5, 1.2}};

double Rounded(double value, double step)
{
    const double whole = std::round(value / step);
    return step < 1 ? whole / std::round(1 / step) : whole * step; // 0.01 * 3 is not 0.03
}

/// The generator's numbers are fixed by the standard, those of its distributions are not.
class Noise
{
public:
    double Between(double low, double high) { return low + (high - low) * (m_engine() / 4294967296.0); }

private:
    std::mt19937 m_engine{19};
};

struct Location
{
    const Reach* reach;
    double chainage, bed, depth;

    template <typename T>
    T Record() const
    {
        T record;
        record.RiverName = reach->name;
        record.Chainage = chainage;
        return record;
    }
};

/// Surveyed cross sections: from end to end of every branch, at uneven distances around `spacing`.
std::vector<Location> Locations(double spacing)
{
    Noise noise;
    std::vector<Location> locations;
    for (const Reach& reach : reaches) {
        for (double chainage = 0;; chainage += Rounded(noise.Between(0.7, 1.3) * spacing, 5)) {
            chainage = std::min(chainage, reach.length);
            const double along = chainage / reach.length;
            // Steeper upstream than downstream.
            const double bed = reach.bedUp + (reach.bedDown - reach.bedUp) * (1.25 * along - 0.25 * along * along);
            locations.push_back(
                {&reach, chainage, Rounded(bed, 0.01), Rounded(reach.depth * noise.Between(0.85, 1.2), 0.01)});
            if (chainage == reach.length)
                break;
        }
    }
    return locations;
}

void FillFlow(HD_Parameters& p)
{
    Noise noise;
    for (const Location& at : Locations(700)) {
        auto initial = at.Record<HD_Initial>();
        initial.InitialH = Rounded(at.bed + at.depth, 0.01);
        initial.InitialQ = Rounded(at.reach->discharge * noise.Between(0.97, 1.03), 0.1);
        p.InitList.Add(initial);
    }
    for (const Location& at : Locations(1100)) {
        auto bed = at.Record<HD_Resistfact>();
        bed.Resistance = Rounded(noise.Between(0.024, 0.036), 0.0005);
        bed.ZoneResistance1 = bed.Resistance;
        bed.ZoneResistance2 = Rounded(bed.Resistance * 1.25, 0.0005);
        bed.ZoneResistance3 = Rounded(bed.Resistance * 1.65, 0.0005);
        p.BedList.Add(bed);
    }
    for (const Location& at : Locations(2800)) {
        auto wind = at.Record<HD_Windfact>();
        wind.WindFactor = Rounded(noise.Between(0.6, 1.1), 0.01);
        p.WindList.Add(wind);
        auto flood = at.Record<HD_Flood_resist>();
        flood.FloodPlainResistance = Rounded(noise.Between(0.04, 0.06), 0.0005);
        p.FloodList.Add(flood);
        auto loss = at.Record<HD_Waterloss>();
        loss.WaterLoss1 = Rounded(noise.Between(0.002, 0.01), 0.0001);
        loss.WaterLoss2 = Rounded(noise.Between(0.5, 1.5), 0.01);
        loss.WaterLoss3 = 1;
        loss.WaterLoss4 = Rounded(noise.Between(5, 25), 0.5);
        p.WaterList.Add(loss);
        auto leakage = at.Record<HDLeakage>();
        leakage.LeakageCoefficient = Rounded(noise.Between(1e-7, 9e-7), 1e-8);
        p.LeakageList.Add(leakage);
    }
    const std::vector<Location> ends = Locations(5000);
    for (std::size_t i = 0; i + 1 < ends.size(); ++i) {
        if (ends[i].reach != ends[i + 1].reach)
            continue;
        auto wave = ends[i].Record<HD_Wavetype>();
        wave.DownstreamChainage = ends[i + 1].chainage;
        wave.WaveApproximation = std::int32_t(i % 4);
        p.WaveList.Add(wave);
        auto point = ends[i].Record<HDOutputGridPoint>();
        point.PointValue = ends[i + 1].chainage;
        p.OutputGridPoints.Add(point);
    }
}

void FillMarksAndIncrements(HD_Parameters& p)
{
    Noise noise;
    for (const Location& at : Locations(2500)) {
        auto mark = at.Record<HDWLMark>();
        for (const double above : {0.6, 1.4, 2.3})
            mark.MarkLevels.push_back(Rounded(at.bed + at.depth + above * noise.Between(0.9, 1.1), 0.01));
        p.WaterLevelMarkList.Add(mark);
        auto curve = at.Record<HDWLCurve>();
        curve.CurveOption = std::int32_t(p.WLCurveList.GetCount() % 5);
        curve.CurveValue1 = Rounded(noise.Between(25, 70), 0.5);
        curve.CurveValue2 = Rounded(noise.Between(180, 900), 10);
        curve.CurveValue3 = Rounded(noise.Between(0.5, 1.6), 0.05);
        p.WLCurveList.Add(curve);
        auto sand = at.Record<HDWLSandBars>();
        sand.SandBarValue1 = Rounded(noise.Between(0.0004, 0.0016), 0.0001);
        sand.SandBarValue2 = Rounded(noise.Between(18, 42), 0.5);
        sand.SandBarValue3 = Rounded(noise.Between(24, 95), 0.5);
        sand.SandBarValue4 = Rounded(noise.Between(0.05, 0.3), 0.01);
        p.WLSandBarsList.Add(sand);
    }
    for (const char* title : {"FLOOD WATCH", "FLOOD WARNING", "LEVEE CREST"}) {
        p.Global.MarkTitles.push_back(title);
        p.Global.MarkInterpolate.push_back(p.Global.MarkTitles.size() != 3);
    }
}

void FillResistanceTools(HD_Parameters& p)
{
    Noise noise;
    for (const Location& at : Locations(4200)) {
        auto mixing = at.Record<HDMixingCoef>();
        for (double width = 20; width <= 60; width += 20)
            mixing.CoefPairs.push_back({width, Rounded(noise.Between(0.1, 0.25), 0.01)});
        mixing.MixCoef1 = 0.17;
        mixing.MixCoef2 = 0.04;
        mixing.MixCoef3 = Rounded(noise.Between(0.08, 0.12), 0.005);
        mixing.MixCoef4 = 0.03;
        p.MixingCoefList.Add(mixing);
        auto tool = at.Record<HDBedResTool>();
        tool.CoefA = Rounded(noise.Between(0.032, 0.042), 0.0005);
        tool.CoefB = -Rounded(noise.Between(0.1, 0.3), 0.01);
        tool.MinRes = 0.02;
        tool.MaxRes = 0.06;
        for (double velocity = 0.5; velocity <= 2; velocity += 0.5)
            tool.VeloRes.push_back({velocity, Rounded(0.046 - 0.008 * velocity, 0.0005)});
        p.BedResistanceToolboxList.Add(tool);
    }
    constexpr double freeboard = 0.3;
    for (const bool isFixedWidth : {true, false}) {
        auto& set = p.EncroachList.Add();
        for (const Location& at : Locations(5200)) {
            auto location = at.Record<HDEncroach>();
            location.EncValues1[0] = Rounded(noise.Between(5, 15), 0.5); // offsets from the banks
            location.EncValues1[1] = Rounded(noise.Between(5, 15), 0.5);
            if (isFixedWidth) {
                location.EncOption1 = 2;
                location.EncValues1[4] = Rounded(noise.Between(80, 140), 0.5);
            } else {
                location.EncOption1 = 4;
                location.EncOption3 = 2;
                location.EncValues2[3] = Rounded(at.bed + at.depth + freeboard, 0.01); // target level
            }
            set.Add(location);
        }
    }
}

void FillLayersAndLosses(HD_Parameters& p)
{
    Noise noise;
    for (const Location& at : Locations(4000)) {
        auto flux = at.Record<HDKlrParam>();
        flux.R1 = Rounded(noise.Between(0.03, 0.07), 0.005);
        flux.R2 = Rounded(noise.Between(0.03, 0.07), 0.005);
        p.KlrParamList.Add(flux);
        auto layers = at.Record<HDKlrInit>();
        layers.h1 = Rounded(at.bed + at.depth, 0.01);
        layers.h0 = Rounded(at.bed + 0.4 * at.depth, 0.01);
        layers.Q1 = Rounded(0.8 * at.reach->discharge, 0.1);
        layers.Q0 = Rounded(0.2 * at.reach->discharge, 0.1);
        p.KlrInitList.Add(layers);
        auto loss = at.Record<HDContraExpan>();
        loss.Contraction = Rounded(noise.Between(0.05, 0.2), 0.01);
        loss.Expansion = Rounded(noise.Between(0.2, 0.5), 0.01);
        p.QSSContractionExpansionList.Add(loss);
        auto bank = at.Record<HDReachLength>();
        bank.ReachLength1 = Rounded(noise.Between(420, 760), 5);
        bank.ReachLength2 = Rounded(noise.Between(420, 760), 5);
        p.QSSReachLengthsList.Add(bank);
    }
}

/// Lists that nothing was invented for have their defaults.
void FillOtherLists(HD_Parameters& p)
{
    for (const ListEntry& entry : HDLists()) {
        CListSection& lists = entry.list(p);
        if (lists.ListCount() == 0 || !lists.ListAt(0).IsEmpty())
            continue;
        for (const Location& at : Locations(4000)) {
            HD_RiverPos& record = lists.ListAt(0).AddTail(lists.ListAt(0).NewRecord());
            record.RiverName = at.reach->name;
            record.Chainage = at.chainage;
        }
    }
}

constexpr HDDateTime floodStart{2019, 3, 4, 6, 0, 0}, floodEnd{2019, 3, 11, 18, 0, 0};

void FillSettings(HD_Global_Var& g)
{
    g.G_waterlevel = 41.5;
    g.G_discharge = 45;
    g.G_wind_factor = 0.9;
    g.G_resistance = 0.031;
    g.G_S_max = 0.35;
    g.G_f = 0.02;
    g.G_k_100 = 1.1;
    g.G_min_width = 4;
    g.G_flood_plan_res = 0.05;
    g.ResisZone = 1;
    g.ZoneResistance1 = 0.031;
    g.ZoneResistance2 = 0.039;
    g.ZoneResistance3 = 0.051;
    g.wind_shear_stress = true;
    g.resist_num = 1; // Manning's n
    g.struc_fac = 0.1;
    g.EnergyEquation = true;
    g.FrictionSlope = 1;
    g.ContractExpansion = true;
    g.G_Expansion = 0.35;
    g.AddOutput.Velo_H = g.AddOutput.Discharge_H = g.AddOutput.FroudeNum_H = true;
    g.AddOutput.WaterSlope = g.AddOutput.BedShearStress = g.AddOutput.MassError_Total = true;
    g.Mixing.CoefPairs = {{20, 0.17}, {40, 0.19}};
    g.BedResist = {1, true, false, true, {{0.5, 0.042}, {1, 0.038}, {1.5, 0.034}}, 0.037, -0.15, 0.02, 0.06};
    g.CurveIncrement = {true, false, true, false, false, 1, 45, 350, 1.1};
    g.SandBarIncrement = {true, 0, 0.0008, 28, 52, 0.15};
    g.Max_no_iter = 30;
    g.HeatBalance.Calc = true;
    g.HeatBalance.Latitude = 51.2;
    g.HeatBalance.Longitude = -9.6;
    g.HeatBalance.betaBeer = 0.3;
    g.Stratification.npv = 8;
    g.Stratification.bpr2 = 0.0007;
    g.Klr.action = 1;
    g.KlrInit = {41.5, 40.2, 36, 9};
    g.Leakage = {true, 4e-7};
}

void FillOutput(HD_Global_Var& g)
{
    HDTextOutput& text = g.TextOutput;
    text.GenerateOutput = true;
    text.Delimiter = ";";
    text.ColumnWidth = 16;
    text.SummaryInfo[1] = text.SummaryInfo[3] = true;
    text.LimitedPeriod = true;
    text.LimitedPeriodStart = floodStart;
    text.LimitedPeriodEnd = floodEnd;
    text.OutputItems = {{0, "Stage", 2, {}}, {1, "Flow", 1, {}}, {2, "Mean velocity", 2, {}}};
    text.OutputFiles = {{"kvt Timeseries Bridge", true, "results/aelder.kvt0", {}},
                        {"Ascii Format 1 Timeseries Bridge", false, "results/aelder.txt", {}}};

    HDMapOutput& maps = g.MapOutput;
    maps.GenerateOutput = maps.ApplyDemGroundElevation = maps.MapAreaGeoDb = true;
    maps.GeoDb = "maps/help grid.kvt2";
    maps.DemInputFiles = {{"maps/valley dem.kvt2", 1, 1, {}}, {"maps/levee survey.kvt2", 1, 2, {}}};
    CMapsOutput map;
    map.XOrigin = 512400;
    map.YOrigin = 5678200;
    map.Rotation = 12.5;
    map.GridSize = 25;
    map.JCells = 420;
    map.KCells = 260;
    map.StartTime = floodStart;
    map.EndTime = floodEnd;
    map.FileName = "results/largest depth.kvt2";
    map.Item = 1;
    maps.MapOutputFiles.push_back(map);
    map.FileName = "results/velocity.kvt2";
    map.Type = 2;
    map.Item = 2;
    map.StoringFrequency = 6;
    map.DefaultPeriod = true;
    maps.MapOutputFiles.push_back(map);
}

} // namespace

HD_Parameters SampleRiver()
{
    HD_Parameters parameters;
    FillFlow(parameters);
    FillMarksAndIncrements(parameters);
    FillResistanceTools(parameters);
    FillLayersAndLosses(parameters);
    FillOtherLists(parameters);
    FillSettings(parameters.Global);
    FillOutput(parameters.Global);
    return parameters;
}

HD_Parameters LongRiver(std::size_t count)
{
    HD_Parameters parameters = SampleRiver();
    auto& list = parameters.InitList;
    list.RemoveAll();
    list.Reserve(count);
    constexpr std::size_t branches = std::size(reaches);
    constexpr double spacing = 25;
    for (std::size_t branch = 0; branch < branches; ++branch) {
        const Reach& reach = reaches[branch];
        const std::size_t share = count / branches + (branch < count % branches);
        for (std::size_t i = 0; i < share; ++i) {
            const double along = double(i) / double(share);
            HD_Initial initial;
            initial.RiverName = reach.name;
            initial.Chainage = double(i) * spacing;
            initial.InitialH = Rounded(reach.bedUp + reach.depth - (reach.bedUp - reach.bedDown) * along, 0.001);
            initial.InitialQ = Rounded(reach.discharge * (1 + 0.1 * along), 0.001);
            list.Add(std::move(initial));
        }
    }
    return parameters;
}
