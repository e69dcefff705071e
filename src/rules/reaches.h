// Which reaches of a list lie over one another.
#pragma once

#include "rules/problem.h"

#include <cstdint>
#include <tuple>
#include <vector>

class CReaches
{
public:
    void Add(std::uint32_t branch, double start, double end, std::size_t line);
    /// Compares the next ones, up to that many, with those before them along their branches; `place` is of the list.
    /// False when there are no more.
    bool Compare(std::size_t count, ProblemPlace place, CProblems& problems);

private:
    struct Reach
    {
        std::uint32_t branch;
        double start, end; // the least and the largest chainage
        std::size_t line;
        /// Later ones of a branch come later.
        bool operator<(const Reach& other) const
        {
            return std::tie(branch, start, line) > std::tie(other.branch, other.start, other.line);
        }
    };
    std::vector<Reach> m_reaches; // a heap: sorted as far as it was asked, without a pause
    Reach m_furthest{};           // of those that were compared, on the branch
    bool m_hasFurthest = false;
};
