// The document of the network editor: one river network file.
#pragma once

#include "editors/common/parameter_doc.h"
#include "editors/network/linear_reference.h"
#include "editors/network/network_file.h"

#include <memory>

class CNetworkDoc : public CParameterDoc
{
    Q_OBJECT
public:
    CNetworkDoc();

    const CNetwork& Network() const { return m_network; }
    /// For undo commands and the rows of tables.
    CNetwork& Network() { return m_network; }
    /// The lines, prepared when first asked for after a change.
    const CLinearReference& Reference() const;

    void DeleteContents() override;

    /// An import: one step to undo. The network names `system` as its coordinate system from then on.
    void AppendBranches(std::vector<CNetworkBranch> branches, const QString& system, const QString& text);
    void UpdateAll(CView* sender = nullptr, int hint = ReloadHint, CHint* object = nullptr) override;

signals:
    /// The network is another one, or a branch changed.
    void NetworkChanged();

protected:
    void Load(tqlHandle structure, LoadReport& report) override;
    Declared Content() const override { return {DeclaredNetworkFile(), &m_network}; }
    std::unique_ptr<QUndoCommand> MakeContentStep(tqlHandle structure, LoadReport& report,
                                                  const CString& text) override;

private:
    CNetwork m_network;
    mutable std::unique_ptr<CLinearReference> m_reference;
};
