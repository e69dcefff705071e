#include "data/global_var.h"

#include "files/field_io.h"

#include <algorithm>

namespace {

void LoadItems(tqlHandle section, GroupValue<void> items, LoadReport* report)
{
    const auto count = std::size_t(tqlGetNoKeywords(section, HDItemKeyword));
    items.Renew(count);
    for (std::size_t index = 0; index < count; ++index) {
        ParamCursor params(tqlKeywordByNameNum(section, HDItemKeyword, int(index) + 1), report);
        ReadFields(params, items.Elements(), items[index]);
        ReadExtra(params, *items.ExtraOf(index));
    }
}

void SaveItems(tqlHandle structure, GroupValue<const void> items)
{
    for (std::size_t index = 0; index < items.size(); ++index) {
        tqlAddKeyword(structure, HDItemKeyword);
        WriteFields(structure, items.Elements(), items[index]);
        items.ExtraOf(index)->Write(structure);
    }
}

/// Whether a table has a row of that name.
bool Has(const auto& rows, std::string_view name)
{
    return std::ranges::any_of(rows, [name](const auto& row) { return row.name == name; });
}

} // namespace

void HD_Global_Var::Load(tqlHandle target, LoadReport* report)
{
    const tqlHandle global = tqlSectionByNameNum(target, HDGlobalSectionName, 1);
    if (!global)
        return;
    for (const GlobalSection& table : HDGlobalSections())
        if (const tqlHandle section = tqlSectionByNameNum(global, table.name, 1))
            LoadSection(section, table, report);
    const auto known = [](std::string_view name, bool isSection) {
        return isSection && Has(HDGlobalSections(), name) ? Known::First : Known::No;
    };
    CollectUnknown(global, known, m_unknown[HDGlobalSectionName], report);
}

void HD_Global_Var::LoadSection(tqlHandle section, const GlobalSection& table, LoadReport* report)
{
    if (report)
        report->InSection(table.name);
    for (const GlobalKeyword& row : table.keywords) {
        const tqlHandle keyword = tqlKeywordByNameNum(section, row.name, 1);
        if (!keyword)
            continue;
        if (row.onlyWith.empty() || tqlKeywordByNameNum(section, row.onlyWith, 1)) {
            LoadKeyword(keyword, row, report);
            continue;
        }
        m_unread[&row] = tqlGetRawParams(keyword);
        if (report)
            report->Add(keyword, keyword, {.kind = Finding::NotRead, .field = std::string(row.onlyWith)});
    }
    for (const Field& items : table.items) {
        const tqlHandle inner = tqlSectionByNameNum(section, items.name, 1);
        if (!inner)
            continue;
        if (report)
            report->InSection(items.name);
        LoadItems(inner, items.GroupIn(this), report);
        const auto known = [](std::string_view name, bool isSection) {
            return !isSection && name == HDItemKeyword ? Known::Every : Known::No;
        };
        CollectUnknown(inner, known, m_unknown[items.name], report);
    }
    if (report)
        report->InSection(table.name);
    const auto known = [&table](std::string_view name, bool isSection) {
        return (isSection ? Has(table.items, name) : Has(table.keywords, name)) ? Known::First : Known::No;
    };
    CollectUnknown(section, known, m_unknown[table.name], report);
}

void HD_Global_Var::LoadKeyword(tqlHandle keyword, const GlobalKeyword& row, LoadReport* report)
{
    ParamCursor params(keyword, report);
    ReadFields(params, row.Fields(), this);
    ReadExtra(params, m_extra[&row]);
    // The titles stand before their flags in the table, and so are read by now.
    if (report && row.Fields().front().address(this) == &MarkInterpolate && MarkInterpolate.size() > MarkTitles.size())
        report->Add(keyword, keyword,
                    {.kind = Finding::SurplusFlags,
                     .behind = int(MarkTitles.size()),
                     .found = std::string(tqlGetRawParams(keyword)),
                     .used = std::to_string(MarkTitles.size())});
}

void HD_Global_Var::Save(tqlHandle structure) const
{
    if (MarkInterpolate.size() != MarkTitles.size()) {
        HD_Global_Var even(*this);
        even.MarkInterpolate.resize(MarkTitles.size());
        even.Save(structure);
        return;
    }
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
        if (const std::string* const unread = Unread(table, row)) {
            tqlAddRawKeyword(structure, row.name, *unread);
            continue;
        }
        tqlAddKeyword(structure, row.name);
        WriteFields(structure, row.Fields(), this);
        if (const auto extra = m_extra.find(&row); extra != m_extra.end())
            extra->second.Write(structure);
    }
    for (const Field& items : table.items) {
        tqlAddSection(structure, items.name);
        SaveItems(structure, items.GroupIn(this));
        SaveUnknown(structure, items.name);
        tqlEndSection(structure);
    }
    SaveUnknown(structure, table.name);
    tqlEndSection(structure);
}

/// What stood in the file for a keyword that was not read; null when there is nothing such, or when its value or the
/// one that opens it have been set since.
const std::string* HD_Global_Var::Unread(const GlobalSection& table, const GlobalKeyword& row) const
{
    const auto found = m_unread.find(&row);
    if (found == m_unread.end())
        return nullptr;
    static const HD_Global_Var defaults;
    const auto opener = std::ranges::find(table.keywords, row.onlyWith, &GlobalKeyword::name);
    const bool untouched =
        SameFields(row.Fields(), this, &defaults) && SameFields(opener->Fields(), this, &defaults);
    return untouched ? &found->second : nullptr;
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
    m_unread.clear();
}
