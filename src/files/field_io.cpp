#include "files/field_io.h"

#include "files/extra_params.h"
#include "files/structure.h"

#include <algorithm>
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
    *value = std::int32_t(number);
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
void ReadValue(ParamCursor& params, const Field& field, const void* object, Value& value)
{
    const tqlHandle at = params.param;
    if (!params.Take(&value)) [[unlikely]]
        ReportType(params, at, field, object, TakeBeyondDoubt(at, &value));
}

/// Strings and file names are read alike; which of them it should be is told.
void ReadText(ParamCursor& params, const Field& field, const void* object, std::string& value)
{
    const tqlHandle at = params.param;
    const TqlType expected = field.kind == FieldKind::Text ? TqlType::String : TqlType::FileName;
    const bool taken = params.Take(&value);
    if (params.report && tqlGetType(at) != expected) [[unlikely]]
        ReportType(params, at, field, object, taken);
}

// ---- dates -------------------------------------------------------------------------------------

/// Six integers; a date made of halves would be neither the old nor the new one.
void ReadDateTime(ParamCursor& params, const Field& field, const void* object, HDDateTime& value)
{
    constexpr int parts = 6;
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
bool ReadGroup(ParamCursor& params, const Field& field, GroupValue<void> group)
{
    const tqlHandle at = params.param;
    std::int32_t elements = 0;
    const bool isInteger = tqlGetInt(at, &elements);
    if ((!isInteger && !GetWhole(at, &elements)) || !CountFits(group.Elements(), elements, params.Left() - 1))
        return false;
    params.Next();
    group.Renew(std::size_t(elements));
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
        ReadFields(params, group.Elements(), group[std::size_t(i)]);
    const int size = int(ParamsOf(group.Elements()));
    if (elements == 0 && field.padWhenEmpty && params.Left() >= size)
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

void CopyGroup(GroupValue<const void> from, GroupValue<void> to)
{
    to.Renew(from.size());
    for (std::size_t i = 0; i < from.size(); ++i) {
        CopyFields(from.Elements(), from[i], to[i]);
        if (ExtraParams* const extra = to.ExtraOf(i))
            *extra = *from.ExtraOf(i);
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

bool CountFits(FieldList elements, std::int32_t count, int paramsLeft)
{
    return count >= 0 && count <= paramsLeft / int(ParamsOf(elements));
}

bool ReadFields(ParamCursor& params, FieldList fields, void* object)
{
    bool inTail = false, behindCount = false;
    for (const Field& field : fields) {
        if (!params.param) {
            // An optional tail is there whole or not at all.
            if (!field.optionalTail || inTail)
                ReportMissing(params, fields.subspan(std::size_t(&field - fields.data())), object, behindCount);
            return false;
        }
        inTail = field.optionalTail;
        const bool isRead = Visit(field, object,
                                  Overloads{[&](std::string& value) {
                                                ReadText(params, field, object, value);
                                                return true;
                                            },
                                            [&](HDDateTime& value) {
                                                ReadDateTime(params, field, object, value);
                                                return true;
                                            },
                                            [&](GroupValue<void> group) {
                                                behindCount = true;
                                                return ReadGroup(params, field, group);
                                            },
                                            [&](auto& value) {
                                                ReadValue(params, field, object, value);
                                                return true;
                                            }});
        if (!isRead) {
            ReportCount(params, fields.subspan(std::size_t(&field - fields.data())), object);
            params.ToEnd();
            return true; // told
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
    const TqlStructure structure(tqlCreate());
    tqlAddTarget(structure.Get(), "X");
    tqlAddKeyword(structure.Get(), "x");
    WriteFields(structure.Get(), fields, object);
    tqlEndSection(structure.Get());
    std::string text(tqlGetText(structure.Get()));
    text.erase(0, text.find(mark) + mark.size());
    return text.substr(0, text.find('\n'));
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

void CopyFields(FieldList fields, const void* from, void* to)
{
    for (const Field& field : fields)
        Visit(field, from,
              Overloads{[&](GroupValue<const void> group) { CopyGroup(group, field.GroupIn(to)); },
                        [&]<typename T>(const T& value) { field.In<T>(to) = value; }});
}
