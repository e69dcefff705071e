#include "rules/global_place.h"

#include <cstdlib>

namespace {

bool Find(const DeclaredSection& section, const HD_Global_Var& global, const void* member, ProblemPlace& place)
{
    for (const DeclaredKeyword& keyword : section.keywords)
        for (const Field& field : keyword.Fields())
            if (field.constAddress(&global) == member) {
                place = {.section = section.name, .keyword = keyword.name, .field = &field};
                return true;
            }
    for (const DeclaredSection& inner : section.Sections())
        if (Find(inner, global, member, place))
            return true;
    return false;
}

} // namespace

ProblemPlace GlobalPlace(const HD_Global_Var& global, const void* member)
{
    ProblemPlace place;
    if (!Find(HDGlobals(), global, member, place))
        std::abort(); // no declaration of such a member
    return place;
}

ProblemPlace GlobalPlace(const HD_Global_Var& global, const void* member, const Field& field, std::size_t element)
{
    ProblemPlace place = GlobalPlace(global, member);
    place.field = &field;
    place.element = element;
    return place;
}
