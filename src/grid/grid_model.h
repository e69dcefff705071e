// The model of a grid: a window on a row source. It holds no copy of the rows; texts are made for the cells that a view
// asks for, and what the user typed since the last store lies over the rows as a small overlay.
//
// A source without rows is shown with one to type into, the offered row. It is the model's own and no part of the
// document: it shows what a new line would hold now, and enters the source, as a step to undo, when something typed
// into it is stored.
#pragma once

#include "grid/row_source.h"
#include "grid/column_spec.h"

#include <QAbstractTableModel>
#include <map>
#include <vector>

class CKsDoc;

/// What an emptied value cell is stored as.
enum class BlankRule
{
    Zero, // as an empty cell converts
    Fill  // as the column's fill value, where it has one
};

class CGridModel : public QAbstractTableModel
{
    Q_OBJECT
public:
    explicit CGridModel(QObject* parent = nullptr);

    void AddColumn(ColumnSpec column);
    /// Only the first `count` columns stay.
    void RemoveColumnsFrom(int count);
    const std::vector<ColumnSpec>& Columns() const { return m_columns; }
    /// Where the rows are (null while there are none); the document keeps the undo steps. Both outlive the model. What
    /// was typed and not stored is dropped.
    void SetSource(CKsDoc& document, std::shared_ptr<IRowSource> rows);
    const std::shared_ptr<IRowSource>& Rows() const { return m_rows; }
    CKsDoc* Document() const { return m_document; }

    /// Shows the source as it is now. Costs the same for any number of rows as long as none came, went or moved.
    void Sync();
    /// Rows are coming or going: no moment to store anything.
    bool IsSyncing() const { return m_syncing; }

    // QAbstractItemModel
    int rowCount(const QModelIndex& parent = {}) const override;
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    Qt::ItemFlags flags(const QModelIndex& index) const override;
    /// Takes what was typed; false for a text that is no value of the column. A text that is the cell's own changes
    /// nothing.
    bool setData(const QModelIndex& index, const QVariant& value, int role) override;

    /// What the cell holds, typed or stored.
    CellValue Value(int row, int column) const;
    /// Why the cell would not take the text; empty when it would. What the other rows have to say is asked as well when
    /// the text goes into this cell alone, and with Fault when it is one of several.
    QString Refusal(int row, int column, const QString& text, bool isAlone = true) const;
    /// Why the rows from `row` on could not take these texts from `column` on; see IRowSource::FindFault.
    std::optional<IRowSource::Fault> Fault(int row, int column, const std::vector<QStringList>& texts) const;
    bool IsLocked(int row, int column) const;
    /// The cell shows a number with fewer digits than it has. A row that the source has no more hides nothing.
    bool HidesDigits(int row, int column) const;

    /// Names the line of a row for as long as the source has it.
    RowKey NameOf(int row) const { return KeyOf(row); }
    /// Where the line of that name stands, looked for at `row` first; where it is gone, the row that is offered instead
    /// of lines, or -1.
    int RowNamed(RowKey name, int row) const;

    /// Rows of the source, without the offered one.
    int StoredRows() const { return m_rows ? int(m_rows->Count()) : 0; }
    /// Writes what the row's cells hold into an object of the source's kind.
    void CopyRow(int row, void* target) const;

    bool HasPending() const { return !m_pending.empty(); }
    /// Moves what was typed into the rows, as one undo step; no other cell is touched. False when nothing changed.
    /// An offered row into which something was typed enters the source.
    bool Store(BlankRule rule = BlankRule::Zero);
    /// Puts `texts` into the cells from (row, column) on, rows past the last one being added: one undo step with the
    /// text `step`. Every text must have passed Refusal.
    void Paste(int row, int column, const std::vector<QStringList>& texts, const QString& step);

    /// New lines with the columns' fill values, not in the source; they fit at its end.
    std::unique_ptr<IRowBlock> NewLines(int count) const { return NewLines(count, StoredRows()); }
    /// A new line before `row`, with the columns' fill values: an undo step. The offered row becomes a line before it.
    /// Returns the row where it went.
    int InsertRow(int row);
    /// A new line behind the last one, with these texts from its first cell on: an undo step.
    void AppendRow(const QStringList& texts);
    /// Rows at the top that are no lines of the table.
    int FixedRows() const { return m_rows ? int(m_rows->FixedRows()) : 0; }
    /// An undo step; the offered row stays. No fixed row is among the rows.
    void RemoveRows(int row, int count);

signals:
    /// The user changed a cell (rows and columns from 1).
    void CellModified(int row, int column);

private:
    using CellKey = std::pair<RowKey, int>;
    struct Typed
    {
        CellValue value;
        std::size_t row; // where the row was
    };
    using Overlay = std::map<CellKey, Typed>;

    CellValue Resolved(int column, const CellValue& value, BlankRule rule) const;
    void PruneOverlay();
    bool OffersRow() const { return m_rows && m_rows->IsEmpty() && !m_rows->MayBeEmpty(); }
    bool IsOffered(int row) const { return OffersRow() && row == StoredRows(); }
    int ShownRows() const { return StoredRows() + OffersRow(); }
    bool IsRow(int row) const { return row >= 0 && row < ShownRows(); }
    void* RowObject(int row) const;
    std::unique_ptr<IRowBlock> NewLines(int count, int at) const;
    template <typename Push>
    int Change(const QString& step, int row, Push push);
    int Arrange(int row);
    RowKey KeyOf(int row) const;
    bool IsGone(const CellKey& cell, std::size_t row) const;
    bool StoreOffered(const Overlay& typed, BlankRule rule);
    bool StoreRows(const Overlay& overlay, BlankRule rule);

    std::vector<ColumnSpec> m_columns;
    CKsDoc* m_document = nullptr;
    std::shared_ptr<IRowSource> m_rows;
    int m_rowCount = 0; // as the views know it
    std::uint64_t m_revision = 0;
    bool m_syncing = false;
    Overlay m_pending;
    mutable std::unique_ptr<IRowBlock> m_offered; // made when it is asked for
};
