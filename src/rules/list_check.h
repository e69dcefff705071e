// One list of values along the river, checked line by line.
#pragma once

#include "rules/branch_numbers.h"
#include "rules/line_rules.h"
#include "rules/locations.h"
#include "rules/mark_order.h"
#include "rules/reaches.h"
#include "rules/value_rules.h"

#include <optional>

class CListCheck
{
public:
    /// All must live as long. The list may change only while nothing calls Step, and what was found then is not true.
    /// `firstMayBeBlank`: the first line need not be a location.
    CListCheck(const CGenParamListBase& list, ProblemPlace place, bool firstMayBeBlank, const HD_Parameters& parameters,
               CBranchNumbers& branches);

    /// Goes on by about that many lines; false when all is done.
    bool Step(std::size_t lines, CProblems& problems);

private:
    void CheckLine(std::size_t line, CProblems& problems);
    bool IsIncomplete(const HD_RiverPos& record, std::size_t line, CProblems& problems);
    void CheckBranch(const HD_RiverPos& record, std::uint32_t branch, std::size_t line, CProblems& problems);
    void CheckReach(const HD_RiverPos& record, std::uint32_t branch, std::size_t line, CProblems& problems);
    void CheckRepeated(const HD_RiverPos& record, std::uint32_t branch, std::size_t line, CProblems& problems);
    ProblemPlace At(std::size_t line, const Field* field = nullptr) const;

    const CGenParamListBase& m_list;
    ProblemPlace m_place;
    bool m_firstMayBeBlank;
    CBranchNumbers& m_branches;
    CValueRules m_values;
    LineRules m_rules;
    const Field* m_reachEnd = nullptr; // of lists of reaches
    std::size_t m_count;               // of lines, when the check began
    CLocations m_locations;
    CReaches m_reaches;
    std::optional<CMarkOrder> m_marks; // of the list of marks
    std::size_t m_next = 0, m_nextMark = 0;
};
