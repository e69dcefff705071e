#include "rules/problem.h"

#include "files/field_io.h"
#include "tql/number.h"

#include <algorithm>

void CProblems::SortFrom(std::size_t first)
{
    std::ranges::stable_sort(m_listed.begin() + std::ptrdiff_t(first), m_listed.end(), {},
                             [](const Problem& problem) { return problem.place.line; });
}

Remedy RemedyOf(RuleId rule)
{
    switch (rule) {
    case RuleId::SameLine:
        return Remedy::RemoveLine;
    case RuleId::ReachBackwards:
        return Remedy::SwapEnds;
    default:
        return Remedy::None;
    }
}

const char* RemedyName(Remedy remedy)
{
#define TQL_TEXT(context, english) english
    switch (remedy) {
    case Remedy::RemoveLine:
        return TQL_TEXT("HDRules", "remove the line");
    case Remedy::SwapEnds:
        return TQL_TEXT("HDRules", "exchange start and end");
    case Remedy::None:
        break;
    }
#undef TQL_TEXT
    return "";
}

namespace {

std::string NumberText(double value)
{
    std::string text;
    tql::AppendDouble(text, value);
    return text;
}

std::string ValueText(const ProblemValue& value)
{
    return std::visit(Overloads{[](const std::string& text) { return text; },
                                [](const Amount& amount) { return NumberText(amount.value); },
                                [](const HDDateTime& date) { return DateText(date); },
                                [](const Reason& reason) { return std::string(reason.english); }},
                      value);
}

} // namespace

std::string ProblemText(const Problem& problem)
{
    std::string text;
    for (const char* next = RuleOf(problem.rule).text; *next; ++next) {
        const std::size_t number = *next == '%' ? std::size_t(next[1] - '1') : problem.values.size();
        if (number < problem.values.size()) {
            text += ValueText(problem.values[number]);
            ++next;
        } else {
            text += *next;
        }
    }
    return text;
}
