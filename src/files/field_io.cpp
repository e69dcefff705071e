#include "files/field_io.h"

#include "files/structure.h"

#include <algorithm>
#include <bit>
#include <charconv>
#include <cstdio>

namespace {

void WriteDateTime(tqlHandle structure, const HDDateTime& value)
{
    for (const std::int32_t part : {value.Year, value.Month, value.Day, value.Hour, value.Minute, value.Second})
        tqlAddInt(structure, part);
}

void WriteValue(tqlHandle structure, const Field& field, const std::string& value)
{
    if (field.kind == FieldKind::FileName)
        tqlAddFilename(structure, value);
    else
        tqlAddString(structure, value);
}

/// The element that stands for "none" where a keyword may not end with its count.
void WritePadding(tqlHandle structure, FieldList fields)
{
    for (const Field& field : fields)
        VisitKind(field.kind, Overloads{[&](std::type_identity<double>) { tqlAddDouble(structure, 0); },
                                        [&](std::type_identity<bool>) { tqlAddBool(structure, false); },
                                        [&](std::type_identity<std::string>) { WriteValue(structure, field, {}); },
                                        [&](std::type_identity<HDDateTime>) { WriteDateTime(structure, {}); },
                                        [&](auto) { tqlAddInt(structure, 0); }});
}

void WriteGroup(tqlHandle structure, const Field& field, GroupValue<const void> group)
{
    tqlAddInt(structure, std::int32_t(group.size()));
    for (std::size_t i = 0; i < group.size(); ++i)
        WriteFields(structure, group.Elements(), group[i]);
    if (group.size() == 0 && field.padWhenEmpty)
        WritePadding(structure, group.Elements());
}

bool Same(GroupValue<const void> a, GroupValue<const void> b)
{
    if (a.size() != b.size())
        return false;
    for (std::size_t i = 0; i < a.size(); ++i)
        if (!SameFields(a.Elements(), a[i], b[i]))
            return false;
    return true;
}

/// By bits: a nan equals itself, and -0 is not 0.
bool Same(double a, double b)
{
    return std::bit_cast<std::uint64_t>(a) == std::bit_cast<std::uint64_t>(b);
}

template <typename Value>
bool Same(const Value& a, const Value& b)
{
    return a == b;
}

} // namespace

std::string ParamsText(FieldList fields, const void* object)
{
    constexpr std::string_view mark = "x = ";
    const TqlStructure structure(tqlCreate());
    tqlAddTarget(structure.Get(), "X");
    tqlAddKeyword(structure.Get(), "x");
    WriteFields(structure.Get(), fields, object);
    tqlEndSection(structure.Get());
    std::string text(tqlGetText(structure.Get()));
    text.erase(0, text.find(mark) + mark.size());
    return text.substr(0, text.find('\n'));
}

std::string DateText(const HDDateTime& date)
{
    char text[80];
    std::snprintf(text, sizeof text, "%d-%02d-%02d %02d:%02d:%02d", date.Year, date.Month, date.Day, date.Hour,
                  date.Minute, date.Second);
    return text;
}

std::string BoundsWords(const Bounds& bounds)
{
    const auto append = [](std::string text, double value) {
        char number[32];
        return text.append(number, std::to_chars(number, number + sizeof number, value).ptr);
    };
    const auto& [minimum, maximum] = bounds;
    if (minimum && maximum)
        return append(append({}, *minimum) + " to ", *maximum);
    return minimum ? append("at least ", *minimum) : maximum ? append("at most ", *maximum) : std::string();
}

void WriteFields(tqlHandle structure, FieldList fields, const void* object)
{
    for (const Field& field : fields)
        Visit(field, object,
              Overloads{[&](double value) { tqlAddDouble(structure, value); },
                        [&](std::int32_t value) { tqlAddInt(structure, value); },
                        [&](bool value) { tqlAddBool(structure, value); },
                        [&](const std::string& value) { WriteValue(structure, field, value); },
                        [&](const HDDateTime& value) { WriteDateTime(structure, value); },
                        [&](GroupValue<const void> group) { WriteGroup(structure, field, group); }});
}

bool SameFields(FieldList fields, const void* a, const void* b)
{
    return std::ranges::all_of(fields, [&](const Field& field) {
        return Visit(field, a,
                     Overloads{[&](GroupValue<const void> group) { return Same(group, field.GroupIn(b)); },
                               [&]<typename T>(const T& value) { return Same(value, field.In<T>(b)); }});
    });
}
