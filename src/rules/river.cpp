#include "rules/river.h"

#include "files/branch_key.h"
#include "files/network_names.h"
#include "files/structure.h"

#include <algorithm>
#include <tuple>

void CRiver::Add(RiverBranch branch)
{
    const auto [place, isNew] = m_branches.try_emplace(BranchKey(branch.name), branch);
    if (isNew)
        return;
    place->second.first = std::min(place->second.first, branch.first);
    place->second.last = std::max(place->second.last, branch.last);
}

Result<CRiver> LoadRiver(const std::string& path)
{
    const Result<TqlStructure> structure = ParseFile(path);
    if (!structure)
        return structure.error();
    const tqlHandle target = tqlTargetByNameNum(structure.value().Get(), NetworkFile::Target, 1);
    if (!target)
        return Error{path + " is no river network: it has no target [" + NetworkFile::Target + "]."};
    CRiver river;
    for (int number = 1;; ++number) {
        const tqlHandle section = tqlSectionByNameNum(target, NetworkFile::Branch, number);
        if (!section)
            return river;
        const auto param = [section](const char* keyword, int at) {
            return tqlParamByNum(tqlKeywordByNameNum(section, keyword, 1), at);
        };
        RiverBranch branch;
        double from = 0, to = 0;
        if (!tqlGetString(param(NetworkFile::Name, 1), &branch.name) ||
            !tqlGetDouble(param(NetworkFile::Chainage, 1), &from) ||
            !tqlGetDouble(param(NetworkFile::Chainage, 2), &to))
            continue; // the network editor tells what is wrong with it
        std::tie(branch.first, branch.last) = std::minmax(from, to);
        tqlGetBool(param(NetworkFile::FlowsDownstream, 1), &branch.downstream);
        river.Add(std::move(branch));
    }
}
