// Which of two neighboring user-defined marks lies above the other along the river.
#pragma once

#include "data/hd_parameters.h"
#include "rules/problem.h"

#include <vector>

class CMarkOrder
{
public:
    explicit CMarkOrder(const std::vector<std::string>& titles) : m_titles(titles), m_pairs(titles.size()) {}
    void Count(const HDWLMark& record);
    /// After all were counted: reports where two marks stand otherwise than nearly everywhere else.
    void Check(const HDWLMark& record, ProblemPlace place, CProblems& problems) const;

private:
    /// 1 where the mark of the number lies below the next, -1 above; 0 where they are level or not both given.
    static int Order(const HDWLMark& record, std::size_t mark);

    struct Pair
    {
        std::size_t rising = 0, falling = 0;
    };
    const std::vector<std::string>& m_titles;
    std::vector<Pair> m_pairs; // of a mark and the next
};
