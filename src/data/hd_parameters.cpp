#include "data/hd_parameters.h"

#include <algorithm>

namespace {

template <auto List>
constexpr ListEntry Entry(const char* section, bool purgedAtSave)
{
    return {section, purgedAtSave, [](HD_Parameters& parameters) -> CListSection& { return parameters.*List; },
            [](const HD_Parameters& parameters) -> const CListSection& { return parameters.*List; }};
}

using P = HD_Parameters;
constexpr ListEntry lists[] = {
    Entry<&P::InitList>("InitList", true),
    Entry<&P::WindList>("WindList", true),
    Entry<&P::BedList>("BedList", true),
    Entry<&P::WaveList>("WaveList", true),
    Entry<&P::WaterList>("WaterList", true),
    Entry<&P::FloodList>("FloodList", true),
    Entry<&P::MixingCoefList>("MixingCoefList", true),
    Entry<&P::WaterLevelMarkList>("WaterLevelMarkList", true),
    Entry<&P::BedResistanceToolboxList>("BedResistanceToolboxList", true),
    Entry<&P::WLCurveList>("WLCurveList", false),
    Entry<&P::WLSandBarsList>("WLSandBarsList", false),
    Entry<&P::EncroachList>("Enc_Simulation", false),
    Entry<&P::KlrParamList>("KlrParamList", true),
    Entry<&P::KlrInitList>("KlrInitList", true),
    Entry<&P::QSSContractionExpansionList>("QSSContractionExpansionList", true),
    Entry<&P::QSSReachLengthsList>("QSSReachLengthsList", true),
    Entry<&P::OutputGridPoints>("OutputGridPoints", false),
    Entry<&P::LeakageList>("LeakageList", false),
};

} // namespace

std::span<const ListEntry> HDLists()
{
    return lists;
}

void HD_Parameters::Load(tqlHandle structure, LoadReport* report)
{
    const tqlHandle target = tqlTargetByNameNum(structure, HDTargetName, 1);
    if (!target && report) {
        report->Add(nullptr, nullptr, {.kind = Finding::NoTarget, .section = HDTargetName});
        report = nullptr; // that says it all
    }
    Global.Load(target, report);
    for (const ListEntry& entry : lists)
        entry.list(*this).Load(target, 1, report);
    const auto first = [](bool known) { return known ? Known::First : Known::No; };
    const auto knownSection = [&](std::string_view name, bool isSection) {
        return first(isSection && (name == HDGlobals().name ||
                                   std::ranges::find(lists, name, &ListEntry::section) != std::end(lists)));
    };
    CollectUnknown(target, knownSection, Unknown.InTarget, report);
    const auto knownTarget = [&](std::string_view name, bool) { return first(name == HDTargetName); };
    CollectUnknown(structure, knownTarget, Unknown.Targets, report);
}

void HD_Parameters::Save(tqlHandle structure, bool everySet) const
{
    tqlAddTarget(structure, HDTargetName);
    Global.Save(structure);
    for (const ListEntry& entry : lists)
        entry.constList(*this).Save(structure, everySet);
    WriteUnknown(structure, Unknown.InTarget);
    tqlEndSection(structure);
    WriteUnknownTargets(structure, Unknown.Targets);
}

void HD_Parameters::RemoveAllRecords()
{
    for (const ListEntry& entry : lists)
        entry.list(*this).Empty();
    Global.ClearUnknown();
    Unknown.Clear();
}

bool HD_Parameters::RemoveIncompleteLines(bool& asked, const std::function<bool()>& ask)
{
    return std::ranges::all_of(lists, [&](const ListEntry& entry) {
        CListSection& section = entry.list(*this);
        bool agreed = true;
        for (std::size_t i = 0; entry.purgedAtSave && agreed && i < section.ListCount(); ++i)
            agreed = section.ListAt(i).RemoveIncompleteLines(asked, ask);
        return agreed;
    });
}
