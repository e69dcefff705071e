// Everything that the rules say about one file of HD parameters, in pieces, so that an editor can look between the keys
// of its user.
#pragma once

#include "rules/list_check.h"

#include <memory>

class CHDCheck
{
public:
    /// The parameters must live as long, and so must the river, which is null where nobody knows it. `path`: of the
    /// file, in UTF-8; empty for one that has never been saved.
    CHDCheck(const HD_Parameters& parameters, const CRiver* river, std::string path);

    /// Goes on by about that many lines of lists; false when all is done. When the parameters have changed since the
    /// last step, what was found may not be true, but nothing breaks as long as no list has gone.
    bool Step(std::size_t lines);
    /// The global values, then a list after the other, as the file has them.
    std::vector<Problem> Take() { return m_found.TakeListed(); }
    /// How many places break a rule, with those that are not listed.
    std::size_t Count(RuleId rule) const { return m_found.Count(rule); }

private:
    bool NextList();

    const HD_Parameters& m_parameters;
    std::string m_path;
    CBranchNumbers m_branches;
    CProblems m_found;
    std::size_t m_before = 0;           // how many were listed when the list was begun
    std::size_t m_entry = 0, m_set = 0; // of the next list
    std::unique_ptr<CListCheck> m_list; // the one that is looked at
    bool m_isBegun = false;
};
