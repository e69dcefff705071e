// The document of the network editor: one river network file.
#pragma once

#include "editors/common/project_doc.h"
#include "editors/network/linear_reference.h"
#include "editors/network/network.h"

#include <memory>

class CNetworkDoc : public CProjectDoc
{
    Q_OBJECT
public:
    CNetworkDoc();

    const CNetwork& Network() const { return m_network; }
    /// The lines, prepared when first asked for after a change.
    const CLinearReference& Reference() const;

    void DeleteContents() override;

    // Changes; each can be undone, marks the document modified and is told to the project.
    /// `text` names the change in the Edit menu.
    void ReplaceBranch(int index, CNetworkBranch branch, const QString& text);
    void AppendBranches(std::vector<CNetworkBranch> branches, const QString& text);
    /// And the network names a coordinate system from then on.
    void AppendBranches(std::vector<CNetworkBranch> branches, const QString& system, const QString& text);
    /// `indexes` in any order.
    void RemoveBranches(std::vector<int> indexes, const QString& text);
    /// Why a branch may not stand at `index` (-1 for a new one); empty when it may.
    QString WhyNot(int index, const CNetworkBranch& branch) const;

signals:
    /// The network is another one, or a branch changed.
    void NetworkChanged();

protected:
    QString ReadFile(const CString& path) override;
    QString WriteFile(const CString& path) const override;

private:
    friend class CNetworkCommand;
    void Changed();
    CNetwork m_network;
    mutable std::unique_ptr<CLinearReference> m_reference;
};
