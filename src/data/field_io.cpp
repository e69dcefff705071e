#include "data/field_io.h"

#include "data/extra_params.h"

#include <bit>

namespace {

void ReadDateTime(ParamCursor& params, HDDateTime& value)
{
    HDDateTime read;
    bool whole = true; // a date made of halves would be neither the old nor the new one
    for (std::int32_t* const part : {&read.Year, &read.Month, &read.Day, &read.Hour, &read.Minute, &read.Second}) {
        whole &= params.Take(part);
    }
    if (whole)
        value = read;
}

void WriteDateTime(tqlHandle structure, const HDDateTime& value)
{
    for (const std::int32_t part : {value.Year, value.Month, value.Day, value.Hour, value.Minute, value.Second})
        tqlAddInt(structure, part);
}

void ReadGroup(ParamCursor& params, const GroupAccess& group, void* container)
{
    std::int32_t elements = 0;
    if (!tqlGetInt(params.param, &elements) || !CountFits(group, elements, params.Left() - 1)) {
        params.ToEnd();
        return;
    }
    params.Next();
    group.resize(container, 0); // new elements start with their defaults
    group.resize(container, static_cast<std::size_t>(elements));
    for (std::int32_t i = 0; i < elements; ++i)
        ReadFields(params, group.elements, group.at(container, static_cast<std::size_t>(i)));
    const int size = static_cast<int>(ParamsOf(group.elements));
    if (elements == 0 && group.padWhenEmpty && params.Left() >= size)
        params.Skip(size);
}

/// The element that stands for "none" where a keyword may not end with its count.
void WritePadding(tqlHandle structure, FieldList fields)
{
    for (const Field& field : fields) {
        switch (field.kind) {
        case FieldKind::Number:
            tqlAddDouble(structure, 0);
            break;
        case FieldKind::Boolean:
            tqlAddBool(structure, false);
            break;
        case FieldKind::Text:
            tqlAddString(structure, {});
            break;
        case FieldKind::FileName:
            tqlAddFilename(structure, {});
            break;
        case FieldKind::DateTime:
            WriteDateTime(structure, {});
            break;
        case FieldKind::Integer:
        case FieldKind::Choice:
        case FieldKind::Group:
            tqlAddInt(structure, 0);
            break;
        }
    }
}

void WriteGroup(tqlHandle structure, const GroupAccess& group, void* container)
{
    const std::size_t size = group.size(container);
    tqlAddInt(structure, static_cast<std::int32_t>(size));
    for (std::size_t i = 0; i < size; ++i)
        WriteFields(structure, group.elements, group.at(container, i));
    if (size == 0 && group.padWhenEmpty)
        WritePadding(structure, group.elements);
}

bool SameGroup(const GroupAccess& group, void* a, void* b)
{
    const std::size_t size = group.size(a);
    if (size != group.size(b))
        return false;
    for (std::size_t i = 0; i < size; ++i)
        if (!SameFields(group.elements, group.at(a, i), group.at(b, i)))
            return false;
    return true;
}

void CopyGroup(const GroupAccess& group, void* from, void* to)
{
    const std::size_t size = group.size(from);
    group.resize(to, size);
    for (std::size_t i = 0; i < size; ++i) {
        CopyFields(group.elements, group.at(from, i), group.at(to, i));
        if (group.extra)
            *group.extra(group.at(to, i)) = *group.extra(group.at(from, i));
    }
}

} // namespace

std::size_t ParamsOf(FieldList fields)
{
    std::size_t count = 0;
    for (const Field& field : fields)
        count += field.FixedParams();
    return count;
}

bool CountFits(const GroupAccess& group, std::int32_t count, int paramsLeft)
{
    return count >= 0 && count <= paramsLeft / static_cast<int>(ParamsOf(group.elements));
}

void ReadFields(ParamCursor& params, FieldList fields, void* object)
{
    for (const Field& field : fields) {
        if (!params.param)
            break; // an optional tail, or an older file
        void* const value = field.address(object);
        switch (field.kind) {
        case FieldKind::Number:
            params.Take(static_cast<double*>(value));
            break;
        case FieldKind::Integer:
        case FieldKind::Choice:
            params.Take(static_cast<std::int32_t*>(value));
            break;
        case FieldKind::Boolean:
            params.Take(static_cast<bool*>(value));
            break;
        case FieldKind::Text:
        case FieldKind::FileName:
            params.Take(static_cast<std::string*>(value));
            break;
        case FieldKind::DateTime:
            ReadDateTime(params, *static_cast<HDDateTime*>(value));
            break;
        case FieldKind::Group:
            ReadGroup(params, *field.group, value);
            break;
        }
    }
}

void WriteFields(tqlHandle structure, FieldList fields, const void* object)
{
    for (const Field& field : fields) {
        switch (field.kind) {
        case FieldKind::Number:
            tqlAddDouble(structure, field.In<double>(object));
            break;
        case FieldKind::Integer:
        case FieldKind::Choice:
            tqlAddInt(structure, field.In<std::int32_t>(object));
            break;
        case FieldKind::Boolean:
            tqlAddBool(structure, field.In<bool>(object));
            break;
        case FieldKind::Text:
            tqlAddString(structure, field.In<std::string>(object));
            break;
        case FieldKind::FileName:
            tqlAddFilename(structure, field.In<std::string>(object));
            break;
        case FieldKind::DateTime:
            WriteDateTime(structure, field.In<HDDateTime>(object));
            break;
        case FieldKind::Group:
            WriteGroup(structure, *field.group, field.address(const_cast<void*>(object)));
            break;
        }
    }
}

bool SameFields(FieldList fields, const void* a, const void* b)
{
    for (const Field& field : fields) {
        bool same = false;
        switch (field.kind) {
        case FieldKind::Number: // bits: a nan equals itself, and -0 is not 0
            same =
                std::bit_cast<std::uint64_t>(field.In<double>(a)) == std::bit_cast<std::uint64_t>(field.In<double>(b));
            break;
        case FieldKind::Integer:
        case FieldKind::Choice:
            same = field.In<std::int32_t>(a) == field.In<std::int32_t>(b);
            break;
        case FieldKind::Boolean:
            same = field.In<bool>(a) == field.In<bool>(b);
            break;
        case FieldKind::Text:
        case FieldKind::FileName:
            same = field.In<std::string>(a) == field.In<std::string>(b);
            break;
        case FieldKind::DateTime:
            same = field.In<HDDateTime>(a) == field.In<HDDateTime>(b);
            break;
        case FieldKind::Group:
            same = SameGroup(*field.group, field.address(const_cast<void*>(a)), field.address(const_cast<void*>(b)));
            break;
        }
        if (!same)
            return false;
    }
    return true;
}

void CopyFields(FieldList fields, const void* from, void* to)
{
    for (const Field& field : fields) {
        switch (field.kind) {
        case FieldKind::Number:
            field.In<double>(to) = field.In<double>(from);
            break;
        case FieldKind::Integer:
        case FieldKind::Choice:
            field.In<std::int32_t>(to) = field.In<std::int32_t>(from);
            break;
        case FieldKind::Boolean:
            field.In<bool>(to) = field.In<bool>(from);
            break;
        case FieldKind::Text:
        case FieldKind::FileName:
            field.In<std::string>(to) = field.In<std::string>(from);
            break;
        case FieldKind::DateTime:
            field.In<HDDateTime>(to) = field.In<HDDateTime>(from);
            break;
        case FieldKind::Group:
            CopyGroup(*field.group, field.address(const_cast<void*>(from)), field.address(to));
            break;
        }
    }
}
