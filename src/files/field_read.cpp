// Keyword parameters into an object.
#include "files/extra_params.h"
#include "files/field_io.h"

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

/// Reports about a field. Unless the finding says otherwise, the parameter stands there, and the field's value is used.
void Report(const ParamCursor& params, tqlHandle at, const Field& field, const void* object, Finding finding)
{
    if (!params.report)
        return;
    finding.field = field.name;
    finding.expected = field.kind;
    finding.type = tqlGetType(at);
    if (finding.found.empty())
        finding.found = tqlGetRawParam(at);
    if (finding.used.empty())
        finding.used = ParamsText(FieldList(&field, 1), object);
    if (!field.mayBeUnknown && (finding.kind == Finding::WrongType || finding.kind == Finding::Missing))
        params.report->CountLost();
    params.report->Add(at, params.keyword, std::move(finding));
}

/// `at` is the parameter that the cursor has just passed.
void ReportType(const ParamCursor& params, tqlHandle at, const Field& field, const void* object, bool taken)
{
    Report(params, at, field, object,
           {.kind = taken ? Finding::OtherType : Finding::WrongType, .parameter = params.number - 1});
}

// ---- one field ---------------------------------------------------------------------------------
// Each returns whether what follows can be told apart.

template <typename Value>
bool Read(ParamCursor& params, const Field& field, const void* object, Value& value)
{
    const tqlHandle at = params.param;
    if (!params.Take(&value)) [[unlikely]]
        ReportType(params, at, field, object, TakeBeyondDoubt(at, &value));
    return true;
}

bool Read(ParamCursor& params, const Field& field, const void* object, double& value)
{
    const tqlHandle at = params.param;
    double read = 0;
    if (params.Take(&read) && (!params.onlyFinite || std::isfinite(read) || (field.mayBeUnknown && std::isnan(read))))
        [[likely]]
        value = read;
    else
        ReportType(params, at, field, object, false); // every number is read as one
    return true;
}

/// Strings and file names are read alike; which of them it should be is told.
bool Read(ParamCursor& params, const Field& field, const void* object, std::string& value)
{
    const tqlHandle at = params.param;
    const TqlType expected = field.kind == FieldKind::Text ? TqlType::String : TqlType::FileName;
    const bool taken = params.Take(&value);
    if (params.report && tqlGetType(at) != expected) [[unlikely]]
        ReportType(params, at, field, object, taken);
    return true;
}

/// Six integers; a date made of halves would be neither the old nor the new one.
bool Read(ParamCursor& params, const Field& field, const void* object, HDDateTime& value)
{
    const auto parts = int(field.FixedParams());
    const tqlHandle first = params.param;
    const auto report = [&](Finding::Kind kind, tqlHandle at, int parameter) {
        Report(params, at, field, object,
               {.kind = kind, .parameter = parameter, .found = std::string(tqlGetRawParamsFrom(first))});
    };
    if (params.Left() < parts) {
        report(Finding::ShortDate, first, params.number);
        params.ToEnd();
        return true;
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
        return true;
    }
    value = read;
    if (other)
        report(Finding::OtherType, other, otherNumber);
    if (value != HDDateTime{} && !value.IsValid()) // six zeros are "not set"
        report(Finding::NoDate, first, params.number - parts);
    return true;
}

/// An empty group is followed by one element with default values, which is not kept: others are reported. `count` is
/// the parameter that the cursor has just passed.
void ReadPadding(ParamCursor& params, tqlHandle count, const Field& field, const void* object, GroupValue<void> group)
{
    const int number = params.number - 1, behind = params.Left();
    group.Renew(1);
    const std::string padding = ParamsText(group.Elements(), group[0]);
    ReadFields(params, group.Elements(), group[0]);
    const bool isKept = ParamsText(group.Elements(), group[0]) == padding;
    group.Renew(0);
    if (!isKept)
        Report(params, count, field, object,
               {.kind = Finding::CountDoesNotFit,
                .parameter = number,
                .behind = behind,
                .found = std::string(tqlGetRawParamsFrom(count))});
}

/// A count and its elements; false when the count is none or does not fit.
bool Read(ParamCursor& params, const Field& field, const void* object, GroupValue<void> group)
{
    const tqlHandle at = params.param;
    std::int32_t elements = 0;
    if (!GetWhole(at, &elements) || !CountFits(group.Elements(), elements, params.Left() - 1))
        return false;
    params.Next();
    group.Renew(std::size_t(elements));
    if (tqlGetType(at) != TqlType::Int) [[unlikely]]
        Report(params, at, field, object,
               {.kind = Finding::OtherType, .parameter = params.number - 1, .used = std::to_string(elements)});
    for (std::int32_t i = 0; i < elements; ++i)
        ReadFields(params, group.Elements(), group[std::size_t(i)]);
    if (elements == 0 && field.padWhenEmpty && params.Left() >= int(ParamsOf(group.Elements())))
        ReadPadding(params, at, field, object, group);
    return true;
}

/// `rest` begins with the group whose count cannot be used.
void ReportCount(const ParamCursor& params, FieldList rest, const void* object)
{
    std::int32_t count = 0;
    Report(params, params.param, rest.front(), object,
           {.kind = GetWhole(params.param, &count) ? Finding::CountDoesNotFit : Finding::WrongType,
            .parameter = params.number,
            .behind = params.Left() - 1,
            .found = std::string(tqlGetRawParamsFrom(params.param)),
            .used = ParamsText(rest, object)});
}

/// `missing` begins with the first field that has no parameter left.
void ReportMissing(const ParamCursor& params, FieldList missing, const void* object, bool behindCount)
{
    Report(params, params.keyword, missing.front(), object,
           {.kind = Finding::Missing,
            .parameter = params.number,
            .behind = behindCount ? params.count : 0,
            .more = missing.size() > 1,
            .found = std::string(tqlGetRawParams(params.keyword)),
            .used = ParamsText(missing, object)});
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
        const auto rest = [&] { return fields.subspan(std::size_t(&field - fields.data())); };
        if (!params.param) {
            // An optional tail is there whole or not at all.
            if (params.report && (!field.optionalTail || inTail))
                ReportMissing(params, rest(), object, behindCount);
            return false;
        }
        inTail = field.optionalTail;
        behindCount = behindCount || field.kind == FieldKind::Group;
        if (!Visit(field, object, [&](auto&& value) { return Read(params, field, object, value); })) {
            if (params.report)
                ReportCount(params, rest(), object);
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
