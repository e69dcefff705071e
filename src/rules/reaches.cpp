#include "rules/reaches.h"

#include <algorithm>

void CReaches::Add(std::uint32_t branch, double start, double end, std::size_t line)
{
    const auto [least, largest] = std::minmax(start, end);
    m_reaches.push_back({branch, least, largest, line});
    std::push_heap(m_reaches.begin(), m_reaches.end());
}

bool CReaches::Compare(std::size_t count, ProblemPlace place, CProblems& problems)
{
    for (; count > 0 && !m_reaches.empty(); --count) {
        std::pop_heap(m_reaches.begin(), m_reaches.end());
        const Reach reach = m_reaches.back();
        m_reaches.pop_back();
        const bool isOnBranch = m_hasFurthest && m_furthest.branch == reach.branch;
        if (isOnBranch && reach.start < m_furthest.end) {
            place.line = std::max(reach.line, m_furthest.line); // the one that came later
            const std::size_t other = std::min(reach.line, m_furthest.line);
            problems.Add({RuleId::ReachOverlap, place, {Amount{double(other + 1)}}});
        }
        if (!isOnBranch || reach.end > m_furthest.end)
            m_furthest = reach;
        m_hasFurthest = true;
    }
    return !m_reaches.empty();
}
