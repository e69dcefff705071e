// The tables beside the plot: the cross sections, and the points of one of them.
#pragma once

#include "editors/common/lines_table.h"
#include "editors/cross_sections/document.h"

/// What both tables do alike.
class CSectionLines : public CLinesTable
{
    Q_OBJECT
public:
    Qt::ItemFlags flags(const QModelIndex& index) const override;
    /// The lines as text for a spreadsheet, in the user's units with every digit: cells separated by tabs.
    QString TextOf(const std::vector<int>& rows) const;

protected:
    CSectionLines(CCrossSectionDoc& document, QObject* parent) : CLinesTable(parent), m_document(document) {}
    bool RefuseNumber(const QModelIndex& index, const QString& typed);
    /// Puts a changed section in its place, unless it may not stand there.
    bool Replace(const QModelIndex& index, int section, CCrossSection changed, const QString& text);
    CCrossSectionDoc& m_document;
};

class CSectionTable : public CSectionLines
{
    Q_OBJECT
public:
    enum Column
    {
        Branch,
        Chainage,
        Radius,
        Width,
        TopoId,
        ColumnCount
    };
    CSectionTable(CCrossSectionDoc& document, QObject* parent);
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    bool setData(const QModelIndex& index, const QVariant& value, int role = Qt::EditRole) override;
    void RemoveLines(const std::vector<int>& rows) override;
    /// Adds a section without points behind `row` (-1: at the end), on the same branch between it and the next one; the
    /// first of all is on `branch`. Returns its row.
    int InsertLine(int row, const QString& branch);

protected:
    int Lines() const override;
};

class CPointTable : public CSectionLines
{
    Q_OBJECT
public:
    enum Column
    {
        Offset,
        Level,
        ColumnCount
    };
    CPointTable(CCrossSectionDoc& document, QObject* parent);
    /// -1 for none.
    void SetSection(int section);
    int Section() const { return m_section; }
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    bool setData(const QModelIndex& index, const QVariant& value, int role = Qt::EditRole) override;
    void RemoveLines(const std::vector<int>& rows) override;
    /// Adds a point behind `row` (-1: at the end), half way to the next one. Returns its row; -1 without a section.
    int InsertLine(int row);
    /// Adds the points of a text behind `row`: lines of offset and bed level in the user's units, separated by tabs or
    /// semicolons. All or none. Returns the row of the last one; -1 when there is none, after a message when that is
    /// the text's fault.
    int InsertText(int row, const QString& text);

protected:
    int Lines() const override;

private:
    const CCrossSection* Current() const { return m_document.Section(m_section); }
    int m_section = -1;
};
