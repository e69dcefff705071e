// A place that breaks a rule.
#pragma once

#include "files/field.h"
#include "rules/rule.h"

#include <string>
#include <string_view>
#include <variant>
#include <vector>

/// A number in the base unit of its group.
struct Amount
{
    double value = 0;
    UnitGroup unit = UnitGroup::None;
};
/// A text of the table of what is plausible, in English: whoever shows it translates it ("HDRules").
struct Reason
{
    const char* english = nullptr;
};
using ProblemValue = std::variant<std::string, Amount, HDDateTime, Reason>;

/// Where a problem is. Names are those of the file and live as long as the declarations.
struct ProblemPlace
{
    static constexpr std::size_t None = std::size_t(-1);

    std::string_view section{}; // of a list, or of global values
    std::string_view keyword{}; // of a global value
    std::size_t set = 0;        // which of the lists of a section that holds several
    std::size_t line = None;    // of a list, from 0; None for a global value
    const Field* field = nullptr;
    std::size_t element = None; // of a group that is the field, or holds it
};

struct Problem
{
    RuleId rule{};
    ProblemPlace place{};
    std::vector<ProblemValue> values{}; // for the rule's text
};

/// What a check found. Of a rule that hundreds of thousands of lines break the first are listed and the others counted.
class CProblems
{
public:
    static constexpr std::size_t MostOfARule = 1000;

    void Add(Problem problem)
    {
        if (++m_counts[std::size_t(problem.rule)] <= MostOfARule)
            m_listed.push_back(std::move(problem));
    }
    std::vector<Problem> TakeListed() { return std::move(m_listed); }
    std::size_t Count(RuleId rule) const { return m_counts[std::size_t(rule)]; } // with those that are not listed
    std::size_t ListedCount() const { return m_listed.size(); }
    /// Those behind the first so many in the order of their lines.
    void SortFrom(std::size_t first);

private:
    std::vector<Problem> m_listed;
    std::vector<std::size_t> m_counts = std::vector<std::size_t>(HDRules().size());
};

/// What is beyond doubt to mend it.
enum class Remedy
{
    None,
    RemoveLine,
    SwapEnds // start and end of a reach
};
Remedy RemedyOf(RuleId rule);
/// In English ("HDRules"); empty for none.
const char* RemedyName(Remedy remedy);

/// A rule's text in English with the values in the notation of files.
std::string ProblemText(const Problem& problem);
