#include "files/field_io.h"

#include "files/extra_params.h"

#include <bit>
#include <cmath>
#include <limits>

namespace {

// ---- values of another type --------------------------------------------------------------------

/// The number of a parameter, when it is a whole one that fits.
bool GetWhole(tqlHandle param, std::int32_t* value)
{
    double number = 0;
    if (!tqlGetDouble(param, &number) || std::trunc(number) != number ||
        std::abs(number) > std::numeric_limits<std::int32_t>::max())
        return false;
    *value = static_cast<std::int32_t>(number);
    return true;
}

bool TakeBeyondDoubt(tqlHandle param, std::int32_t* value)
{
    return GetWhole(param, value);
}

bool TakeBeyondDoubt(tqlHandle param, bool* value)
{
    std::int32_t number = 0;
    if (!GetWhole(param, &number) || (number != 0 && number != 1))
        return false;
    *value = number == 1;
    return true;
}

template <typename Value>
bool TakeBeyondDoubt(tqlHandle, Value*)
{
    return false; // every number is read as one; and what a number stands for among texts nobody can tell
}

/// `at` is the parameter that the cursor has just passed.
void ReportType(const ParamCursor& params, tqlHandle at, const Field& field, const void* object, bool taken)
{
    if (!params.report)
        return;
    params.report->Add(at, params.keyword,
                       {.kind = taken ? Finding::OtherType : Finding::WrongType,
                        .parameter = params.number - 1,
                        .field = std::string(field.name),
                        .expected = field.kind,
                        .type = tqlGetType(at),
                        .found = std::string(tqlGetRawParam(at)),
                        .used = ParamsText(FieldList(&field, 1), object)});
}

template <typename Value>
void ReadValue(ParamCursor& params, const Field& field, void* object)
{
    auto* const value = static_cast<Value*>(field.address(object));
    const tqlHandle at = params.param;
    if (!params.Take(value)) [[unlikely]]
        ReportType(params, at, field, object, TakeBeyondDoubt(at, value));
}

/// Strings and file names are read alike; which of them it should be is told.
void ReadText(ParamCursor& params, const Field& field, void* object)
{
    const tqlHandle at = params.param;
    const TqlType expected = field.kind == FieldKind::Text ? TqlType::String : TqlType::FileName;
    const bool taken = params.Take(static_cast<std::string*>(field.address(object)));
    if (params.report && tqlGetType(at) != expected) [[unlikely]]
        ReportType(params, at, field, object, taken);
}

// ---- dates -------------------------------------------------------------------------------------

/// Six integers; a date made of halves would be neither the old nor the new one.
void ReadDateTime(ParamCursor& params, const Field& field, void* object)
{
    constexpr int parts = 6;
    auto& value = *static_cast<HDDateTime*>(field.address(object));
    const tqlHandle first = params.param;
    const auto report = [&](Finding::Kind kind, tqlHandle at, int parameter) {
        if (params.report)
            params.report->Add(at, params.keyword,
                               {.kind = kind,
                                .parameter = parameter,
                                .field = std::string(field.name),
                                .expected = field.kind,
                                .type = tqlGetType(at),
                                .found = std::string(tqlGetRawParamsFrom(first)),
                                .used = ParamsText(FieldList(&field, 1), object)});
    };
    if (params.Left() < parts) {
        report(Finding::ShortDate, first, params.number);
        params.ToEnd();
        return;
    }
    HDDateTime read;
    tqlHandle wrong = nullptr, other = nullptr;
    int wrongNumber = 0, otherNumber = 0;
    for (std::int32_t* const part : {&read.Year, &read.Month, &read.Day, &read.Hour, &read.Minute, &read.Second}) {
        const tqlHandle at = params.param;
        if (params.Take(part))
            continue;
        const bool taken = TakeBeyondDoubt(at, part);
        (taken ? other : wrong) = at;
        (taken ? otherNumber : wrongNumber) = params.number - 1;
    }
    if (wrong) {
        report(Finding::WrongType, wrong, wrongNumber);
        return;
    }
    value = read;
    if (other)
        report(Finding::OtherType, other, otherNumber);
    if (value != HDDateTime{} && !value.IsValid()) // six zeros are "not set"
        report(Finding::NoDate, first, params.number - parts);
}

void WriteDateTime(tqlHandle structure, const HDDateTime& value)
{
    for (const std::int32_t part : {value.Year, value.Month, value.Day, value.Hour, value.Minute, value.Second})
        tqlAddInt(structure, part);
}

/// Reads a count and its elements; false when the count is none or does not fit.
bool ReadGroup(ParamCursor& params, const Field& field, void* object)
{
    const GroupAccess& group = *field.group;
    void* const container = field.address(object);
    const tqlHandle at = params.param;
    std::int32_t elements = 0;
    const bool isInteger = tqlGetInt(at, &elements);
    if ((!isInteger && !GetWhole(at, &elements)) || !CountFits(group, elements, params.Left() - 1))
        return false;
    params.Next();
    group.resize(container, 0); // new elements start with their defaults
    group.resize(container, static_cast<std::size_t>(elements));
    if (!isInteger && params.report)
        params.report->Add(at, params.keyword,
                           {.kind = Finding::OtherType,
                            .parameter = params.number - 1,
                            .field = std::string(field.name),
                            .expected = field.kind,
                            .type = tqlGetType(at),
                            .found = std::string(tqlGetRawParam(at)),
                            .used = std::to_string(elements)});
    for (std::int32_t i = 0; i < elements; ++i)
        ReadFields(params, group.elements, group.at(container, static_cast<std::size_t>(i)));
    const int size = static_cast<int>(ParamsOf(group.elements));
    if (elements == 0 && group.padWhenEmpty && params.Left() >= size)
        params.Skip(size);
    return true;
}

/// `rest` begins with the group whose count cannot be used.
void ReportCount(const ParamCursor& params, FieldList rest, const void* object)
{
    if (!params.report)
        return;
    std::int32_t count = 0;
    params.report->Add(params.param, params.keyword,
                       {.kind = GetWhole(params.param, &count) ? Finding::CountDoesNotFit : Finding::WrongType,
                        .parameter = params.number,
                        .field = std::string(rest.front().name),
                        .expected = FieldKind::Group,
                        .type = tqlGetType(params.param),
                        .behind = params.Left() - 1,
                        .found = std::string(tqlGetRawParamsFrom(params.param)),
                        .used = ParamsText(rest, object)});
}

/// `missing` begins with the first field that has no parameter left.
void ReportMissing(const ParamCursor& params, FieldList missing, const void* object, bool behindCount)
{
    if (!params.report)
        return;
    params.report->Add(params.keyword, params.keyword,
                       {.kind = Finding::Missing,
                        .parameter = params.number,
                        .field = std::string(missing.front().name),
                        .expected = missing.front().kind,
                        .behind = behindCount ? params.count : 0,
                        .more = missing.size() > 1,
                        .found = std::string(tqlGetRawParams(params.keyword)),
                        .used = ParamsText(missing, object)});
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

bool ReadFields(ParamCursor& params, FieldList fields, void* object)
{
    bool inTail = false, behindCount = false;
    for (const Field& field : fields) {
        if (!params.param) {
            // An optional tail is there whole or not at all.
            if (!field.optionalTail || inTail)
                ReportMissing(params, fields.subspan(static_cast<std::size_t>(&field - fields.data())), object,
                              behindCount);
            return false;
        }
        inTail = field.optionalTail;
        switch (field.kind) {
        case FieldKind::Number:
            ReadValue<double>(params, field, object);
            break;
        case FieldKind::Integer:
        case FieldKind::Choice:
            ReadValue<std::int32_t>(params, field, object);
            break;
        case FieldKind::Boolean:
            ReadValue<bool>(params, field, object);
            break;
        case FieldKind::Text:
        case FieldKind::FileName:
            ReadText(params, field, object);
            break;
        case FieldKind::DateTime:
            ReadDateTime(params, field, object);
            break;
        case FieldKind::Group:
            if (!ReadGroup(params, field, object)) {
                ReportCount(params, fields.subspan(static_cast<std::size_t>(&field - fields.data())), object);
                params.ToEnd();
                return true; // told
            }
            behindCount = true;
            break;
        }
    }
    return true;
}

void ReadExtra(ParamCursor& params, ExtraParams& extra)
{
    extra.Read(params.param);
    if (params.param && params.report)
        params.report->Add(params.param, params.keyword, {.kind = Finding::UnknownParams, .parameter = params.number});
}

std::string ParamsText(FieldList fields, const void* object)
{
    constexpr std::string_view mark = "x = ";
    tqlHandle structure = tqlCreate();
    tqlAddTarget(structure, "X");
    tqlAddKeyword(structure, "x");
    WriteFields(structure, fields, object);
    tqlEndSection(structure);
    std::string text(tqlGetText(structure));
    tqlClose(&structure);
    text.erase(0, text.find(mark) + mark.size());
    return text.substr(0, text.find('\n'));
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
