// The tables beside the map: the branches, and the channel of one of them.
#pragma once

#include "editors/common/lines_table.h"
#include "editors/network/document.h"

/// What both tables do alike.
class CNetworkTable : public CLinesTable
{
    Q_OBJECT
signals:
    /// The line that was edited stands in another row now.
    void LineMoved(int row, int column);

protected:
    CNetworkTable(CNetworkDoc& document, QObject* parent) : CLinesTable(parent), m_document(document) {}
    CNetworkDoc& m_document;
};

class CBranchTable : public CNetworkTable
{
    Q_OBJECT
public:
    enum Column
    {
        Name,
        From,
        To,
        Vertices,
        Flow,
        ColumnCount
    };
    CBranchTable(CNetworkDoc& document, QObject* parent);
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    Qt::ItemFlags flags(const QModelIndex& index) const override;
    bool setData(const QModelIndex& index, const QVariant& value, int role = Qt::EditRole) override;
    void RemoveLines(const std::vector<int>& rows) override;

protected:
    int Lines() const override;
};

class CChannelTable : public CNetworkTable
{
    Q_OBJECT
public:
    enum Column
    {
        Chainage,
        Radius,
        Width,
        ColumnCount
    };
    CChannelTable(CNetworkDoc& document, QObject* parent);
    /// -1 for none.
    void SetBranch(int branch);
    int Branch() const { return m_branch; }
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    Qt::ItemFlags flags(const QModelIndex& index) const override;
    bool setData(const QModelIndex& index, const QVariant& value, int role = Qt::EditRole) override;
    void RemoveLines(const std::vector<int>& rows) override;
    /// Adds a line half way from `row` to what follows, the branch's end at last; without radius and width. Returns its
    /// row; -1 without a branch.
    int InsertLine(int row);

protected:
    int Lines() const override;

private:
    const CNetworkBranch* Current() const;
    int m_branch = -1;
};
