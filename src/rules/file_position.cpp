#include "rules/file_position.h"

#include "files/field_io.h"

#include <algorithm>

namespace {

/// A node with the one that stands for it where it is missing.
struct Found
{
    tqlHandle node = nullptr, last = nullptr;

    explicit Found(tqlHandle start) : node(start), last(start) {}
    void Go(tqlHandle next)
    {
        node = next;
        if (next)
            last = next;
    }
};

const CListSection& ListOf(const ProblemPlace& place, const HD_Parameters& parameters)
{
    return std::ranges::find(HDLists(), place.section, &ListEntry::section)->constList(parameters);
}

/// Goes to the parameter behind `number` others; `place` is one of a field of `object`.
void GoToParameter(Found& found, FieldList fields, const void* object, int number, const ProblemPlace& place)
{
    for (const Field& field : fields) {
        if (&field == place.field)
            return found.Go(tqlParamByNum(found.node, number + 1));
        if (!field.group) {
            number += int(field.FixedParams());
            continue;
        }
        const auto elements = field.GroupIn(object);
        const int size = int(ParamsOf(elements.Elements()));
        int inside = number + 1 + int(place.element) * size; // behind the count
        for (const Field& inner : elements.Elements()) {
            if (&inner == place.field)
                return found.Go(tqlParamByNum(found.node, inside + 1));
            inside += int(inner.FixedParams());
        }
        number += 1 + int(elements.size()) * size;
    }
}

Found InList(const ProblemPlace& place, const HD_Parameters& parameters, tqlHandle target)
{
    Found found(target);
    const CListSection& section = ListOf(place, parameters);
    found.Go(tqlSectionByNameNum(target, section.SectionName(), 1));
    if (section.HasSets())
        found.Go(tqlSectionByNameNum(found.node, section.ListAt(place.set).SectionName(), int(place.set) + 1));
    found.Go(tqlKeywordByNameNum(found.node, RecordKeyword, int(place.line) + 1));
    const HD_RiverPos& record = RecordAt(place, parameters);
    const auto location = std::ranges::find(LocationFields(), place.field, [](const Field& field) { return &field; });
    if (location != LocationFields().end())
        found.Go(tqlParamByNum(found.node, int(location - LocationFields().begin()) + 1));
    else
        GoToParameter(found, record.Fields(), &record, int(LocationFields().size()), place);
    return found;
}

bool InGlobals(Found& found, const DeclaredSection& section, const ProblemPlace& place, const HD_Global_Var& global)
{
    const Found before = found;
    found.Go(tqlSectionByNameNum(found.node, section.name, 1));
    for (const DeclaredKeyword& keyword : section.keywords) {
        if (section.name != place.section || keyword.name != place.keyword)
            continue;
        const bool isLine = keyword.presence == Presence::EachLine;
        found.Go(tqlKeywordByNameNum(found.node, keyword.name, isLine ? int(place.element) + 1 : 1));
        ProblemPlace inside = place;
        if (isLine) // its keyword holds one element
            inside.element = 0;
        const FieldList fields = isLine ? keyword.Fields().front().group->elements() : keyword.Fields();
        GoToParameter(found, fields, &global, 0, inside);
        return true;
    }
    for (const DeclaredSection& inner : section.Sections())
        if (InGlobals(found, inner, place, global))
            return true;
    found = before;
    return false;
}

} // namespace

const HD_RiverPos& RecordAt(const ProblemPlace& place, const HD_Parameters& parameters)
{
    return ListOf(place, parameters).ListAt(place.set).GetAt(place.line);
}

TqlPosition PositionOf(const ProblemPlace& place, const HD_Parameters& parameters, tqlHandle structure)
{
    const tqlHandle target = tqlTargetByNameNum(structure, HDTargetName, 1);
    Found found(target);
    if (place.line != ProblemPlace::None)
        found = InList(place, parameters, target);
    else
        InGlobals(found, HDGlobals(), place, parameters.Global);
    const TqlPosition position = tqlGetPosition(structure, found.last);
    return position.line ? position : TqlPosition{1, 1};
}
