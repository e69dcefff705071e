// The branches that lines name, by small numbers: comparing names a million times takes too long.
#pragma once

#include "rules/river.h"

#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

class CBranchNumbers
{
public:
    /// `river` may be null, where nobody knows which branches there are; otherwise it must live as long.
    explicit CBranchNumbers(const CRiver* river) : m_river(river) {}

    /// The same for names that mean the same branch.
    std::uint32_t NumberOf(const std::string& name);
    bool IsRiverKnown() const { return m_river; }
    /// Null for one that the river has not.
    const RiverBranch* Branch(std::uint32_t number) const { return m_branches[number]; }

private:
    const CRiver* m_river;
    std::unordered_map<std::string, std::uint32_t> m_ofName, m_ofKey;
    std::vector<const RiverBranch*> m_branches;
    std::string m_last; // neighbors mostly are of one branch
    std::uint32_t m_ofLast = 0;
};
