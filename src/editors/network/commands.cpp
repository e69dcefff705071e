#include "editors/network/commands.h"

#include <algorithm>
#include <iterator>

void CNetworkCommand::redo()
{
    Apply(m_document.m_network.branches);
    m_document.Changed();
}

void CNetworkCommand::undo()
{
    Revert(m_document.m_network.branches);
    m_document.Changed();
}

CReplaceBranch::CReplaceBranch(CNetworkDoc& document, int index, CNetworkBranch branch, const QString& text)
    : CNetworkCommand(document, text), m_index(static_cast<std::size_t>(index)), m_other(std::move(branch))
{
}

void CReplaceBranch::Apply(std::vector<CNetworkBranch>& branches)
{
    std::swap(branches[m_index], m_other);
}

CAppendBranches::CAppendBranches(CNetworkDoc& document, std::vector<CNetworkBranch> branches, const QString& text)
    : CNetworkCommand(document, text), m_added(std::move(branches)), m_count(m_added.size())
{
}

void CAppendBranches::Apply(std::vector<CNetworkBranch>& branches)
{
    std::move(m_added.begin(), m_added.end(), std::back_inserter(branches));
    m_added.clear();
}

void CAppendBranches::Revert(std::vector<CNetworkBranch>& branches)
{
    const auto first = branches.end() - static_cast<std::ptrdiff_t>(m_count);
    m_added.assign(std::make_move_iterator(first), std::make_move_iterator(branches.end()));
    branches.erase(first, branches.end());
}

CRemoveBranches::CRemoveBranches(CNetworkDoc& document, std::vector<int> indexes, const QString& text)
    : CNetworkCommand(document, text), m_indexes(std::move(indexes))
{
    std::sort(m_indexes.begin(), m_indexes.end());
}

void CRemoveBranches::Apply(std::vector<CNetworkBranch>& branches)
{
    for (auto index = m_indexes.rbegin(); index != m_indexes.rend(); ++index) {
        m_removed.push_back(std::move(branches[static_cast<std::size_t>(*index)]));
        branches.erase(branches.begin() + *index);
    }
    std::reverse(m_removed.begin(), m_removed.end());
}

void CRemoveBranches::Revert(std::vector<CNetworkBranch>& branches)
{
    for (std::size_t i = 0; i < m_indexes.size(); ++i)
        branches.insert(branches.begin() + m_indexes[i], std::move(m_removed[i]));
    m_removed.clear();
}
