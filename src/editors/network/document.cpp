#include "editors/network/document.h"

#include "editors/network/commands.h"
#include "editors/network/network_file.h"

#include <QUndoStack>
#include <cmath>

namespace {
constexpr int NetworkPackageKind = 1; // what this editor's packages call themselves
} // namespace

CNetworkDoc::CNetworkDoc() : CProjectDoc(NetworkPackageKind) {}

const CLinearReference& CNetworkDoc::Reference() const
{
    if (!m_reference)
        m_reference = std::make_unique<CLinearReference>(m_network);
    return *m_reference;
}

QString CNetworkDoc::ReadFile(const CString& path)
{
    m_reference.reset();
    return ReadNetwork(path, m_network);
}

QString CNetworkDoc::WriteFile(const CString& path) const
{
    return WriteNetwork(path, m_network);
}

void CNetworkDoc::DeleteContents()
{
    CKsDoc::DeleteContents();
    m_network = {};
    m_reference.reset();
}

void CNetworkDoc::Changed()
{
    m_reference.reset();
    emit NetworkChanged();
    DataChanged();
}

void CNetworkDoc::ReplaceBranch(int index, CNetworkBranch branch, const QString& text)
{
    branch.SortChannel();
    UndoStack().push(new CReplaceBranch(*this, index, std::move(branch), text));
}

void CNetworkDoc::AppendBranches(std::vector<CNetworkBranch> branches, const QString& text)
{
    AppendBranches(std::move(branches), m_network.system, text);
}

void CNetworkDoc::AppendBranches(std::vector<CNetworkBranch> branches, const QString& system, const QString& text)
{
    if (!branches.empty())
        UndoStack().push(new CAppendBranches(*this, std::move(branches), system, text));
}

void CNetworkDoc::RemoveBranches(std::vector<int> indexes, const QString& text)
{
    if (!indexes.empty())
        UndoStack().push(new CRemoveBranches(*this, std::move(indexes), text));
}

QString CNetworkDoc::WhyNot(int index, const CNetworkBranch& branch) const
{
    if (branch.name.isEmpty())
        return tr("A branch needs a name.");
    const int other = m_network.FindBranch(branch.name);
    if (other >= 0 && other != index)
        return tr("There is a branch \"%1\" already.").arg(branch.name);
    if (branch.start == branch.end)
        return tr("The chainages of the two ends of a branch have to differ.");
    return {};
}
