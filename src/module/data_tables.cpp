#include "module/data_tables.h"

#include <cmath>

namespace {

template <auto List>
CGenList& ListOf(HD_Parameters& parameters)
{
    return parameters.*List;
}

double DownstreamChainage(const HD_RiverPos& record)
{
    return static_cast<const HD_Wavetype&>(record).DownstreamChainage;
}

void FillInitial(HD_RiverPos& record, const HD_Global_Var& globals, const CKvr_CBE_ModelDataItem&)
{
    auto& initial = static_cast<HD_Initial&>(record);
    initial.InitialH = globals.G_waterlevel;
    initial.InitialQ = globals.G_discharge;
}

void FillWind(HD_RiverPos& record, const HD_Global_Var& globals, const CKvr_CBE_ModelDataItem&)
{
    static_cast<HD_Windfact&>(record).WindFactor = globals.G_wind_factor;
}

void FillBed(HD_RiverPos& record, const HD_Global_Var& globals, const CKvr_CBE_ModelDataItem&)
{
    auto& bed = static_cast<HD_Resistfact&>(record);
    bed.Resistance = globals.G_resistance;
    bed.ZoneResistance1 = globals.ZoneResistance1;
    bed.ZoneResistance2 = globals.ZoneResistance2;
    bed.ZoneResistance3 = globals.ZoneResistance3;
}

void FillWave(HD_RiverPos& record, const HD_Global_Var&, const CKvr_CBE_ModelDataItem& item)
{
    if (std::isfinite(item.second))
        static_cast<HD_Wavetype&>(record).DownstreamChainage = item.second;
}

void FillMixing(HD_RiverPos& record, const HD_Global_Var& globals, const CKvr_CBE_ModelDataItem&)
{
    auto& mixing = static_cast<HDMixingCoef&>(record);
    mixing.CoefPairs = globals.Mixing.CoefPairs;
    mixing.MixCoef1 = globals.Mixing.MixCoef1;
    mixing.MixCoef2 = globals.Mixing.MixCoef2;
    mixing.MixCoef3 = globals.Mixing.MixCoef3;
    mixing.MixCoef4 = globals.Mixing.MixCoef4;
}

using P = HD_Parameters;

// The tabs are fixed numbers that other editors' users know, and deliberately not those of the tables' own pages: 3 is
// the bed resistance toolbox, 6 the quasi-steady page, 8 the output page and 9 the flood plain page.
constexpr HDDataTable Tables[HDDataTypeCount] = {
    {&ListOf<&P::InitList>, 0, Str::InsertedInit, Str::DeletedInit, Str::CannotSelectInit, nullptr, &FillInitial},
    {&ListOf<&P::WindList>, 1, Str::InsertedWind, Str::DeletedWind, Str::CannotSelectWind, nullptr, &FillWind},
    {&ListOf<&P::BedList>, 2, Str::InsertedBed, Str::DeletedBed, Str::CannotSelectBed, nullptr, &FillBed},
    {&ListOf<&P::WaveList>, 3, Str::InsertedWave, Str::DeletedWave, Str::CannotSelectWave, &DownstreamChainage,
     &FillWave},
    {&ListOf<&P::WaterList>, 6, Str::InsertedLoss, Str::DeletedLoss, Str::CannotSelectLoss, nullptr, nullptr},
    {&ListOf<&P::FloodList>, 8, Str::InsertedFlood, Str::DeletedFlood, Str::CannotSelectFlood, nullptr, nullptr},
    {&ListOf<&P::MixingCoefList>, 9, Str::InsertedMixing, Str::DeletedMixing, Str::CannotSelectMixing, nullptr,
     &FillMixing},
};

} // namespace

std::span<const HDDataTable> HDDataTables()
{
    return Tables;
}

const HDDataTable* FindDataTable(int type)
{
    return type >= 0 && type < HDDataTypeCount ? &Tables[type] : nullptr;
}
