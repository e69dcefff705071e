#include "rules/branch_numbers.h"

#include "files/branch_key.h"

std::uint32_t CBranchNumbers::NumberOf(const std::string& name)
{
    if (name == m_last && !m_branches.empty())
        return m_ofLast;
    const auto [known, isNew] = m_ofName.try_emplace(name);
    if (isNew) {
        const std::string key = BranchKey(name);
        const auto [number, isFirst] = m_ofKey.try_emplace(key, std::uint32_t(m_branches.size()));
        if (isFirst)
            m_branches.push_back(m_river ? m_river->Find(key) : nullptr);
        known->second = number->second;
    }
    m_last = name;
    return m_ofLast = known->second;
}
