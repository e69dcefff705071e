// Undo of the network's changes.
#pragma once

#include "editors/network/document.h"

#include <QUndoCommand>

/// A change of the document; branches are named by place, which holds because undo runs strictly backwards.
class CNetworkCommand : public QUndoCommand
{
public:
    CNetworkCommand(CNetworkDoc& document, const QString& text) : QUndoCommand(text), m_document(document) {}
    void undo() final;
    void redo() final;

protected:
    virtual void Apply(CNetwork& network) = 0;
    virtual void Revert(CNetwork& network) = 0;

private:
    CNetworkDoc& m_document;
};

class CReplaceBranch : public CNetworkCommand
{
public:
    CReplaceBranch(CNetworkDoc& document, int index, CNetworkBranch branch, const QString& text);

protected:
    void Apply(CNetwork& network) override;
    void Revert(CNetwork& network) override { Apply(network); }

private:
    std::size_t m_index;
    CNetworkBranch m_other; // the state that is not in the document
};

class CAppendBranches : public CNetworkCommand
{
public:
    /// `system`: the coordinate system that the network names from then on.
    CAppendBranches(CNetworkDoc& document, std::vector<CNetworkBranch> branches, const QString& system,
                    const QString& text);

protected:
    void Apply(CNetwork& network) override;
    void Revert(CNetwork& network) override;

private:
    std::vector<CNetworkBranch> m_added; // empty while they are in the document
    std::size_t m_count;
    QString m_system; // the one that is not in the document
};

class CRemoveBranches : public CNetworkCommand
{
public:
    CRemoveBranches(CNetworkDoc& document, std::vector<int> indexes, const QString& text);

protected:
    void Apply(CNetwork& network) override;
    void Revert(CNetwork& network) override;

private:
    std::vector<int> m_indexes;            // increasing
    std::vector<CNetworkBranch> m_removed; // as m_indexes, while they are out of the document
};
