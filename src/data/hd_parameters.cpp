#include "data/hd_parameters.h"

#include <algorithm>

namespace {

template <auto List>
CGenParamListBase* Of(HD_Parameters& parameters)
{
    return &(parameters.*List);
}

using P = HD_Parameters;
constexpr ListEntry lists[] = {
    {"InitList", true, &Of<&P::InitList>},
    {"WindList", true, &Of<&P::WindList>},
    {"BedList", true, &Of<&P::BedList>},
    {"WaveList", true, &Of<&P::WaveList>},
    {"WaterList", true, &Of<&P::WaterList>},
    {"FloodList", true, &Of<&P::FloodList>},
    {"MixingCoefList", true, &Of<&P::MixingCoefList>},
    {"WaterLevelMarkList", true, &Of<&P::WaterLevelMarkList>},
    {"BedResistanceToolboxList", true, &Of<&P::BedResistanceToolboxList>},
    {"WLCurveList", false, &Of<&P::WLCurveList>},
    {"WLSandBarsList", false, &Of<&P::WLSandBarsList>},
    {"Enc_Simulation", false, nullptr},
    {"KlrParamList", true, &Of<&P::KlrParamList>},
    {"KlrInitList", true, &Of<&P::KlrInitList>},
    {"QSSContractionExpansionList", true, &Of<&P::QSSContractionExpansionList>},
    {"QSSReachLengthsList", true, &Of<&P::QSSReachLengthsList>},
    {"OutputGridPoints", false, &Of<&P::OutputGridPoints>},
    {"LeakageList", false, &Of<&P::LeakageList>},
};

} // namespace

std::span<const ListEntry> HDLists()
{
    return lists;
}

Known HDKnownSection(std::string_view name, bool isSection)
{
    if (!isSection)
        return Known::No;
    const bool known = name == HDGlobalSectionName ||
                       std::ranges::any_of(lists, [name](const ListEntry& entry) { return name == entry.section; });
    return known ? Known::First : Known::No;
}

Known HDKnownTarget(std::string_view name, bool isSection)
{
    return isSection && name == HDTargetName ? Known::First : Known::No;
}

void HD_Parameters::Load(tqlHandle structure, LoadReport* report)
{
    const tqlHandle target = tqlTargetByNameNum(structure, HDTargetName, 1);
    if (!target && report) {
        report->Add(nullptr, nullptr, {.kind = Finding::NoTarget, .section = HDTargetName});
        report = nullptr; // that says it all
    }
    Global.Load(target, report);
    for (const ListEntry& entry : lists) {
        if (entry.list)
            entry.list(*this)->Load(target, 1, report);
        else
            EncroachList.Load(target, 1, report);
    }
    CollectUnknown(target, &HDKnownSection, Unknown.InTarget, report);
    CollectUnknown(structure, &HDKnownTarget, Unknown.Targets, report);
}

void HD_Parameters::Save(tqlHandle structure, bool everySet) const
{
    tqlAddTarget(structure, HDTargetName);
    Global.Save(structure);
    for (const ListEntry& entry : lists) {
        if (entry.list)
            entry.list(const_cast<HD_Parameters&>(*this))->Save(structure);
        else
            EncroachList.Save(structure, everySet);
    }
    WriteUnknown(structure, Unknown.InTarget);
    tqlEndSection(structure);
    WriteUnknownTargets(structure, Unknown.Targets);
}

void HD_Parameters::RemoveAllRecords()
{
    for (const ListEntry& entry : lists) {
        if (entry.list) {
            entry.list(*this)->RemoveAll();
            entry.list(*this)->ClearUnknown();
        } else {
            EncroachList.RemoveAllRecords();
            EncroachList.ClearUnknown();
        }
    }
    Global.ClearUnknown();
    Unknown.Clear();
}

bool HD_Parameters::RemoveIncompleteLines(bool& asked, const std::function<bool()>& ask)
{
    return std::ranges::all_of(lists, [&](const ListEntry& entry) {
        return !entry.purgedAtSave || entry.list(*this)->RemoveIncompleteLines(asked, ask);
    });
}
