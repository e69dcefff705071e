#include "editors/network/document.h"

#include "editors/network/network_tables.h"
#include "grid/row_commands.h"

#include <QUndoStack>

namespace {
constexpr int NetworkPackageKind = 1; // what this editor's packages call themselves
} // namespace

CNetworkDoc::CNetworkDoc() : CParameterDoc(NetworkPackageKind) {}

const CLinearReference& CNetworkDoc::Reference() const
{
    if (!m_reference)
        m_reference = std::make_unique<CLinearReference>(m_network);
    return *m_reference;
}

void CNetworkDoc::Load(tqlHandle structure, LoadReport& report)
{
    m_reference.reset();
    m_network = LoadNetwork(structure, report);
}

std::unique_ptr<QUndoCommand> CNetworkDoc::MakeContentStep(tqlHandle structure, LoadReport& report, const CString& text)
{
    return std::make_unique<CReplaceContent<CNetwork>>(*this, text, m_network, LoadNetwork(structure, report));
}

void CNetworkDoc::DeleteContents()
{
    CKsDoc::DeleteContents();
    m_network = {};
    m_reference.reset();
}

void CNetworkDoc::UpdateAll(CView* sender, int hint, CHint* object)
{
    m_reference.reset();
    emit NetworkChanged(); // the map first: the views show on it what is current in their tables
    CParameterDoc::UpdateAll(sender, hint, object);
}

void CNetworkDoc::AppendBranches(std::vector<CNetworkBranch> branches, const QString& system, const QString& text)
{
    if (branches.empty() || !MayChange())
        return;
    const auto rows = MakeBranchRows(*this);
    auto added = rows->NewRows(branches.size());
    for (std::size_t i = 0; i < branches.size(); ++i) {
        branches[i].SortChannel();
        *static_cast<CNetworkBranch*>(added->At(i)) = std::move(branches[i]);
    }
    UndoStack().beginMacro(text);
    if (system != m_network.System())
        UndoStack().push(new CSetValue<std::string>(*this, text, m_network.system, system.toStdString()));
    InsertLines(*this, rows, rows->Count(), std::move(added));
    UndoStack().endMacro();
}
