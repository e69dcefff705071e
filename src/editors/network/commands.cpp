#include "editors/network/commands.h"

#include <algorithm>
#include <iterator>

void CNetworkCommand::redo()
{
    Apply(m_document.m_network);
    m_document.Changed();
}

void CNetworkCommand::undo()
{
    Revert(m_document.m_network);
    m_document.Changed();
}

CReplaceBranch::CReplaceBranch(CNetworkDoc& document, int index, CNetworkBranch branch, const QString& text)
    : CNetworkCommand(document, text), m_index(static_cast<std::size_t>(index)), m_other(std::move(branch))
{
}

void CReplaceBranch::Apply(CNetwork& network)
{
    std::swap(network.branches[m_index], m_other);
}

CAppendBranches::CAppendBranches(CNetworkDoc& document, std::vector<CNetworkBranch> branches, const QString& system,
                                 const QString& text)
    : CNetworkCommand(document, text), m_added(std::move(branches)), m_count(m_added.size()), m_system(system)
{
}

void CAppendBranches::Apply(CNetwork& network)
{
    std::move(m_added.begin(), m_added.end(), std::back_inserter(network.branches));
    m_added.clear();
    std::swap(network.system, m_system);
}

void CAppendBranches::Revert(CNetwork& network)
{
    auto& branches = network.branches;
    const auto first = branches.end() - static_cast<std::ptrdiff_t>(m_count);
    m_added.assign(std::make_move_iterator(first), std::make_move_iterator(branches.end()));
    branches.erase(first, branches.end());
    std::swap(network.system, m_system);
}

CRemoveBranches::CRemoveBranches(CNetworkDoc& document, std::vector<int> indexes, const QString& text)
    : CNetworkCommand(document, text), m_indexes(std::move(indexes))
{
    std::sort(m_indexes.begin(), m_indexes.end());
}

void CRemoveBranches::Apply(CNetwork& network)
{
    for (auto index = m_indexes.rbegin(); index != m_indexes.rend(); ++index) {
        m_removed.push_back(std::move(network.branches[static_cast<std::size_t>(*index)]));
        network.branches.erase(network.branches.begin() + *index);
    }
    std::reverse(m_removed.begin(), m_removed.end());
}

void CRemoveBranches::Revert(CNetwork& network)
{
    for (std::size_t i = 0; i < m_indexes.size(); ++i)
        network.branches.insert(network.branches.begin() + m_indexes[i], std::move(m_removed[i]));
    m_removed.clear();
}
