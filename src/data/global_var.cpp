#include "data/global_var.h"

#include "data/field_io.h"

#include <algorithm>

namespace {

void LoadItems(tqlHandle section, const GroupAccess& group, void* container)
{
    const int count = tqlGetNoKeywords(section, HDItemKeyword);
    group.resize(container, 0); // new elements start with their defaults
    group.resize(container, static_cast<std::size_t>(count));
    for (int number = 1; number <= count; ++number) {
        void* const element = group.at(container, static_cast<std::size_t>(number - 1));
        ParamCursor params(tqlKeywordByNameNum(section, HDItemKeyword, number));
        ReadFields(params, group.elements, element);
        group.extra(element)->Read(params.param);
    }
}

void SaveItems(tqlHandle structure, const GroupAccess& group, void* container)
{
    for (std::size_t index = 0; index < group.size(container); ++index) {
        tqlAddKeyword(structure, HDItemKeyword);
        WriteFields(structure, group.elements, group.at(container, index));
        group.extra(group.at(container, index))->Write(structure);
    }
}

} // namespace

void HD_Global_Var::Load(tqlHandle target)
{
    const tqlHandle global = tqlSectionByNameNum(target, HDGlobalSectionName, 1);
    if (!global)
        return;
    for (const GlobalSection& table : HDGlobalSections())
        if (const tqlHandle section = tqlSectionByNameNum(global, table.name, 1))
            LoadSection(section, table);
    CollectUnknown(global, &HDKnownGlobalSection, m_unknown[HDGlobalSectionName]);
}

void HD_Global_Var::LoadSection(tqlHandle section, const GlobalSection& table)
{
    for (const GlobalKeyword& row : table.keywords) {
        const tqlHandle keyword = tqlKeywordByNameNum(section, row.name, 1);
        if (!keyword || (!row.onlyWith.empty() && !tqlKeywordByNameNum(section, row.onlyWith, 1)))
            continue;
        ParamCursor params(keyword);
        ReadFields(params, row.Fields(), this);
        ExtraParams extra;
        extra.Read(params.param);
        if (extra.IsEmpty())
            m_extra.erase(&row);
        else
            m_extra[&row] = std::move(extra);
    }
    for (const Field& items : table.items) {
        const tqlHandle inner = tqlSectionByNameNum(section, items.name, 1);
        if (!inner)
            continue;
        LoadItems(inner, *items.group, items.address(this));
        CollectUnknown(inner, &HDKnownItem, m_unknown[items.name]);
    }
    CollectUnknown(
        section, [&table](std::string_view name, bool isSection) { return HDKnownInSection(table, name, isSection); },
        m_unknown[table.name]);
}

void HD_Global_Var::Save(tqlHandle structure) const
{
    tqlAddSection(structure, HDGlobalSectionName);
    for (const GlobalSection& table : HDGlobalSections())
        SaveSection(structure, table);
    SaveUnknown(structure, HDGlobalSectionName);
    tqlEndSection(structure);
}

void HD_Global_Var::SaveSection(tqlHandle structure, const GlobalSection& table) const
{
    tqlAddSection(structure, table.name);
    for (const GlobalKeyword& row : table.keywords) {
        tqlAddKeyword(structure, row.name);
        WriteFields(structure, row.Fields(), this);
        if (const auto extra = m_extra.find(&row); extra != m_extra.end())
            extra->second.Write(structure);
    }
    for (const Field& items : table.items) {
        tqlAddSection(structure, items.name);
        SaveItems(structure, *items.group, items.address(const_cast<HD_Global_Var*>(this)));
        SaveUnknown(structure, items.name);
        tqlEndSection(structure);
    }
    SaveUnknown(structure, table.name);
    tqlEndSection(structure);
}

void HD_Global_Var::SaveUnknown(tqlHandle structure, std::string_view section) const
{
    if (const auto found = m_unknown.find(section); found != m_unknown.end())
        WriteUnknown(structure, found->second);
}

void HD_Global_Var::ClearUnknown()
{
    m_unknown.clear();
    m_extra.clear();
}

Known HDKnownGlobalSection(std::string_view name, bool isSection)
{
    const auto sections = HDGlobalSections();
    const bool known = isSection && std::ranges::find(sections, name, &GlobalSection::name) != sections.end();
    return known ? Known::First : Known::No;
}

Known HDKnownInSection(const GlobalSection& table, std::string_view name, bool isSection)
{
    const bool known = isSection
                           ? std::ranges::find(table.items, name, &Field::name) != table.items.end()
                           : std::ranges::find(table.keywords, name, &GlobalKeyword::name) != table.keywords.end();
    return known ? Known::First : Known::No;
}

Known HDKnownItem(std::string_view name, bool isSection)
{
    return !isSection && name == HDItemKeyword ? Known::Every : Known::No;
}
