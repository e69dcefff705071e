#include "module/problem_places.h"

#include "document/document.h"
#include "grid/gen_grid.h"
#include "module/sheet.h"
#include "pages/framework/page.h"
#include "res/strings.h"

#include <algorithm>

int ColumnOf(const CGenGrid& grid, const ProblemPlace& place)
{
    std::size_t before = place.element == ProblemPlace::None ? 0 : place.element;
    const auto& columns = grid.Model()->Columns();
    const bool isOne = std::ranges::count(columns, place.field->name, &ColumnSpec::name) == 1;
    for (std::size_t column = 0; column < columns.size(); ++column)
        if (columns[column].name == place.field->name && (isOne || before-- == 0))
            return int(column) + 1;
    return 0;
}

namespace {

/// The group of an object whose elements have the field; null for one of the object's own.
const Field* GroupOf(FieldList fields, const Field* field)
{
    for (const Field& each : fields) {
        const FieldList elements = each.group ? each.group->elements() : FieldList();
        if (std::ranges::any_of(elements, [field](const Field& inner) { return &inner == field; }))
            return &each;
    }
    return nullptr;
}

const DeclaredKeyword* FindKeyword(const DeclaredSection& section, const ProblemPlace& place)
{
    if (section.name == place.section)
        for (const DeclaredKeyword& keyword : section.keywords)
            if (keyword.name == place.keyword)
                return &keyword;
    for (const DeclaredSection& inner : section.Sections())
        if (const DeclaredKeyword* found = FindKeyword(inner, place))
            return found;
    return nullptr;
}

} // namespace

/// Looking through all pages takes a while, and many problems are of one list.
CProblemPlaces::Shown CProblemPlaces::Find(const ChangePlace& place)
{
    if (!place.data)
        return {};
    const void* const data = place.list ? place.list : place.data;
    const auto [known, isNew] = m_known.try_emplace(data);
    if (!isNew)
        return known->second;
    Shown& shown = known->second;
    shown.tab = m_sheet.TabWith(place);
    if (shown.tab >= 0)
        for (CGenGrid* grid : m_sheet.PageAt(shown.tab)->findChildren<CGenGrid*>())
            if (const auto& rows = grid->Model()->Rows(); rows && rows->Data() == data)
                shown.table = grid;
    return shown;
}

CGenParamListBase* CProblemPlaces::ListOf(const ProblemPlace& place) const
{
    const auto entry = std::ranges::find(HDLists(), place.section, &ListEntry::section);
    CListSection& section = entry->list(m_document.Parameters());
    const bool isThere = place.set < section.ListCount() && place.line < section.ListAt(place.set).GetCount();
    return isThere ? &section.ListAt(place.set) : nullptr;
}

CGenGrid* CProblemPlaces::TableOf(const ProblemPlace& place)
{
    CGenParamListBase* const list = ListOf(place);
    return list ? Find({list, 0, 0, list}).table : nullptr;
}

ChangePlace CProblemPlaces::InList(const ProblemPlace& place)
{
    CGenParamListBase* const list = ListOf(place);
    if (!list)
        return {};
    ChangePlace shown{list, int(place.line) + 1, 0, list};
    const CGenGrid* const table = Find(shown).table;
    if (table)
        shown.row += int(table->Model()->Rows()->FixedRows());
    if (!table || !place.field)
        return shown;
    shown.column = ColumnOf(*table, place);
    const Field* const group = shown.column == 0 ? GroupOf(list->Fields(), place.field) : nullptr;
    if (!group)
        return shown;
    // A table of the line's own.
    const FieldList elements = group->group->elements();
    HD_RiverPos& record = list->GetAt(place.line);
    return {group->address(&record), int(place.element) + 1, int(place.field - elements.data()) + 1, list,
            int(place.line) + 1};
}

ChangePlace CProblemPlaces::InGlobals(const ProblemPlace& place)
{
    const DeclaredKeyword* const keyword = FindKeyword(HDGlobals(), place);
    if (!keyword || !place.field)
        return {};
    const HD_Global_Var& global = m_document.Parameters().Global;
    const Field* const group = GroupOf(keyword->Fields(), place.field);
    if (!group)
        return {place.field->constAddress(&global)};
    ChangePlace shown{group->constAddress(&global), int(place.element) + 1};
    if (const CGenGrid* table = Find(shown).table)
        shown.column = ColumnOf(*table, {.field = place.field});
    return shown;
}

ChangePlace CProblemPlaces::On(const ProblemPlace& place)
{
    return place.line == ProblemPlace::None ? InGlobals(place) : InList(place);
}

/// What the column is called; of a single value its title on the page, or its name in the file.
QString CProblemPlaces::FieldText(const ProblemPlace& place, const ChangePlace& shown, const CGenGrid* table)
{
    if (!place.field)
        return {};
    if (table && shown.column > 0 && !shown.listRow)
        return table->Model()->Column(shown.column - 1).header().simplified();
    if (place.field->title)
        return PlainTitle(LoadLine(place.field->title.text, place.field->title.line));
    return QString::fromUtf8(place.field->name);
}

ProblemWhere CProblemPlaces::WhereIs(const ProblemPlace& place)
{
    const ChangePlace on = On(place);
    const Shown shown = Find(on);
    ProblemWhere where{.tab = shown.tab};
    if (where.tab >= 0)
        where.page = PlainTitle(m_sheet.tabText(where.tab));
    else
        where.page = QString::fromUtf8(place.section); // as the file has it
    if (const int line = on.listRow ? on.listRow : on.row; line > 0)
        where.line = QString::number(line);
    where.field = FieldText(place, on, shown.table);
    return where;
}
