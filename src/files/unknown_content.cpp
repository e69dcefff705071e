#include "files/unknown_content.h"

#include "files/finding.h"

#include <unordered_set>

namespace {

/// Remembers which names were met, so that only the first occurrence of one is taken.
class Filter
{
public:
    Filter(const KnownNames& known, bool sections) : m_known(known), m_sections(sections) {}

    bool IsUnknown(std::string_view name)
    {
        switch (m_known(name, m_sections)) {
        case Known::No:
            return true;
        case Known::First:
            return !m_met.insert(name).second;
        case Known::Every:
            break;
        }
        return false;
    }

private:
    const KnownNames& m_known;
    bool m_sections;
    std::unordered_set<std::string_view> m_met;
};

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

void ForEachUnknown(tqlHandle section, const KnownNames& known, const std::function<void(tqlHandle, bool)>& visit)
{
    Filter keywords(known, false);
    const int keywordCount = tqlGetNoKeywords(section);
    for (int number = 1; number <= keywordCount; ++number) {
        const tqlHandle keyword = tqlKeywordByNum(section, number);
        if (keywords.IsUnknown(tqlName(keyword)))
            visit(keyword, false);
    }
    Filter sections(known, true);
    const int sectionCount = tqlGetNoSections(section);
    for (int number = 1; number <= sectionCount; ++number) {
        const tqlHandle inner = tqlSectionByNum(section, number);
        if (sections.IsUnknown(tqlName(inner)))
            visit(inner, true);
    }
}

void CollectUnknown(tqlHandle section, const KnownNames& known, UnknownNodes& nodes, LoadReport* report)
{
    ForEachUnknown(section, known, [&](tqlHandle node, bool isSection) {
        const std::string_view name = tqlName(node);
        if (report)
            report->Add(node, isSection ? nullptr : node,
                        {.kind = known(name, isSection) == Known::No ? Finding::Unknown : Finding::Repeated,
                         .section = std::string(isSection ? name : std::string_view()),
                         .found = isSection ? std::string() : std::string(tqlGetRawParams(node))});
        nodes.push_back(CopyNode(node, isSection));
    });
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
