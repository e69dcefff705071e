#include "rules/value_rules.h"

#include "texts/text_numbers.h"

#include <algorithm>

namespace {

std::string_view EnglishText(Str number)
{
    switch (number) {
#define QT_TRANSLATE_NOOP(context, text) text
#define KVR_STRING(id, name, text)                                                                                     \
    case Str::name:                                                                                                    \
        return text;
#include "texts/string_table.inc"
#undef KVR_STRING
#undef QT_TRANSLATE_NOOP
    default:
        return {};
    }
}

/// A number that stands for an entry: how many entries there are.
std::int32_t ChoicesOf(const Field& field)
{
    const std::string_view entries = EnglishText(field.choices.text);
    return field.kind != FieldKind::Integer || entries.empty() ? 0
                                                               : std::int32_t(1 + std::ranges::count(entries, '\n'));
}

} // namespace

CValueRules::CValueRules(std::string_view section, FieldList fields, const HD_Global_Var& global)
{
    for (const Field& field : fields) {
        if (field.group)
            for (const Field& element : field.group->elements())
                Add(section, element, &field, global);
        else
            Add(section, field, nullptr, global);
    }
}

void CValueRules::Add(std::string_view section, const Field& field, const Field* group, const HD_Global_Var& global)
{
    Rule rule{&field, group, {}, ChoicesOf(field)};
    for (const Plausible& row : PlausibleValues())
        if (row.section == section && row.field == field.name && (!row.applies || row.applies(global)))
            rule.plausible.push_back(row);
    if (!rule.plausible.empty() || rule.choices || field.bounds != Bounds())
        m_rules.push_back(std::move(rule));
}

void CValueRules::Check(const void* object, const ProblemPlace& place, CProblems& problems) const
{
    for (const Rule& rule : m_rules) {
        if (!rule.group) {
            CheckOne(rule, object, place, problems);
            continue;
        }
        const auto elements = rule.group->GroupIn(object);
        for (std::size_t i = 0; i < elements.size(); ++i) {
            ProblemPlace at = place;
            at.element = i;
            CheckOne(rule, elements[i], at, problems);
        }
    }
}

void CValueRules::CheckOne(const Rule& rule, const void* object, ProblemPlace place, CProblems& problems)
{
    place.field = rule.field;
    const auto choose = [&](std::int32_t value) {
        const std::int32_t first = rule.field->firstChoice;
        if (rule.choices && (value < first || value - first >= rule.choices))
            problems.Add({RuleId::NoSuchChoice,
                          place,
                          {Amount{double(value)}, Amount{double(first)}, Amount{double(first + rule.choices - 1)}}});
        CheckNumber(rule, value, place, problems);
    };
    if (rule.field->kind == FieldKind::Number)
        CheckNumber(rule, rule.field->In<double>(object), place, problems);
    else if (rule.field->kind == FieldKind::Integer)
        choose(rule.field->In<std::int32_t>(object));
}

void CValueRules::CheckNumber(const Rule& rule, double value, const ProblemPlace& place, CProblems& problems)
{
    if (value == NotGiven && rule.field->kind == FieldKind::Number)
        return;
    const UnitGroup unit = rule.field->unit;
    const auto& [minimum, maximum] = rule.field->bounds;
    if (minimum && value < *minimum)
        problems.Add({RuleId::BelowRange, place, {Amount{value, unit}, Amount{*minimum, unit}}});
    if (maximum && value > *maximum)
        problems.Add({RuleId::AboveRange, place, {Amount{value, unit}, Amount{*maximum, unit}}});
    for (const Plausible& row : rule.plausible) {
        if (row.isMark && row.isMark(value))
            continue;
        if (value < row.minimum)
            problems.Add(
                {RuleId::ImplausiblyLow, place, {Amount{value, unit}, Amount{row.minimum, unit}, Reason{row.reason}}});
        if (value > row.maximum)
            problems.Add(
                {RuleId::ImplausiblyHigh, place, {Amount{value, unit}, Amount{row.maximum, unit}, Reason{row.reason}}});
    }
}
