// The branches of a river network, as far as lists of values along them have to fit.
#pragma once

#include "base/result.h"

#include <map>
#include <string>

struct RiverBranch
{
    std::string name;
    double first = 0, last = 0; // the least and the largest chainage, metres
    bool downstream = true;     // water flows towards increasing chainage
};

class CRiver
{
public:
    /// A second branch of the same name adds its chainages to the first.
    void Add(RiverBranch branch);
    /// By the branch's key (files/branch_key.h); null for none.
    const RiverBranch* Find(const std::string& key) const
    {
        const auto found = m_branches.find(key);
        return found == m_branches.end() ? nullptr : &found->second;
    }
    bool IsEmpty() const { return m_branches.empty(); }

private:
    std::map<std::string, RiverBranch> m_branches;
};

/// The branches of a network file (.kvnw). The error says why it could not be read as one.
Result<CRiver> LoadRiver(const std::string& path);
