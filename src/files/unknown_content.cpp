#include "files/unknown_content.h"

#include "files/finding.h"

#include <unordered_set>

namespace {

UnknownNode CopyNode(tqlHandle node, bool isSection)
{
    UnknownNode copy{std::string(tqlName(node)), isSection, {}, {}};
    if (isSection)
        CollectUnknown(
            node, [](std::string_view, bool) { return Known::No; }, copy.Children);
    else
        copy.Params = tqlGetRawParams(node);
    return copy;
}

} // namespace

void CollectUnknown(tqlHandle section, const KnownNames& known, UnknownNodes& nodes, LoadReport* report)
{
    for (const bool isSection : {false, true}) {
        std::unordered_set<std::string_view> met; // of the names whose first occurrence is known
        const int count = isSection ? tqlGetNoSections(section) : tqlGetNoKeywords(section);
        for (int number = 1; number <= count; ++number) {
            const tqlHandle node = isSection ? tqlSectionByNum(section, number) : tqlKeywordByNum(section, number);
            const std::string_view name = tqlName(node);
            const Known takes = known(name, isSection);
            if (takes == Known::Every || (takes == Known::First && met.insert(name).second))
                continue;
            if (report)
                report->Add(node, isSection ? nullptr : node,
                            {.kind = takes == Known::No ? Finding::Unknown : Finding::Repeated,
                             .section = std::string(isSection ? name : std::string_view()),
                             .found = isSection ? std::string() : std::string(tqlGetRawParams(node))});
            nodes.push_back(CopyNode(node, isSection));
        }
    }
}

void WriteUnknown(tqlHandle structure, const UnknownNodes& nodes)
{
    for (const UnknownNode& node : nodes) {
        if (node.IsSection) {
            tqlAddSection(structure, node.Name);
            WriteUnknown(structure, node.Children);
            tqlEndSection(structure);
        } else {
            tqlAddRawKeyword(structure, node.Name, node.Params);
        }
    }
}

void WriteUnknownTargets(tqlHandle structure, const UnknownNodes& nodes)
{
    for (const UnknownNode& node : nodes) {
        tqlAddTarget(structure, node.Name);
        WriteUnknown(structure, node.Children);
        tqlEndSection(structure);
    }
}
