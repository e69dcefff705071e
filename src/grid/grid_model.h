// A table as Qt's views see it: a window on its rows, whose texts are made for the cells that a view asks for. Each
// change that is stored is a step to undo.
#pragma once

#include "grid/cell_changes.h"
#include "grid/line_notes.h"
#include "grid/saved_lines.h"
#include "grid/table_rows.h"

#include <QAbstractTableModel>

class CKsDoc;

class CGridModel : public QAbstractTableModel, public CTableRows
{
    Q_OBJECT
public:
    using QAbstractTableModel::QAbstractTableModel;

    void AddColumn(ColumnSpec column);
    /// Only the first `count` columns stay.
    void RemoveColumnsFrom(int count);
    /// Where the rows are (null while there are none); the document keeps the undo steps. Both outlive the model. What
    /// was typed and not stored is dropped.
    void SetSource(CKsDoc& document, std::shared_ptr<IRowSource> rows);
    CKsDoc* Document() const { return m_document; }
    /// What differs from the last save.
    const CSavedLines& Saved() const { return m_saved; }

    /// What others say about lines, until they say something else.
    void SetNotes(LineNotes notes);
    /// Null for a line of which nothing is said.
    const LineNote* NoteOf(int row) const;

    /// Shows the source as it is now. Costs the same for any number of rows, unless they are sorted or filtered.
    void Sync();

    // What is shown, and in which order: no step of the document. What was typed is stored before.
    /// By these keys, the most important one first; by none as in the file. Changes of cells move no line until then.
    void SortBy(std::vector<SortKey> keys);
    /// Hides the lines that do not pass what the user typed for the first columns (CCellFilter).
    void Filter(const QStringList& texts);
    /// Sorts and filters by the values of now.
    void ShowAfresh();
    /// A hidden line of the source comes into sight, until the filter is another. False when it was no hidden one.
    bool Unhide(std::size_t sourceRow);
    /// The order shown becomes the file's, hidden lines included: an undo step. Returns where the source has the line
    /// of `row` then.
    std::size_t KeepOrder(int row);
    /// Rows are coming or going: no moment to store anything.
    bool IsSyncing() const { return m_syncing; }

    // QAbstractItemModel
    int rowCount(const QModelIndex& parent = {}) const override { return parent.isValid() ? 0 : m_rowCount; }
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    Qt::ItemFlags flags(const QModelIndex& index) const override;
    /// Takes what was typed; false for a text that is no value of the column. A text that is the cell's own changes
    /// nothing.
    bool setData(const QModelIndex& index, const QVariant& value, int role) override;

    /// Moves what was typed into the rows, as one undo step; no other cell is touched. False when nothing changed.
    /// An offered row into which something was typed enters the source.
    bool Store(BlankRule rule = BlankRule::Zero);
    /// Puts these values, none of which the cells refuse, into the cells: one undo step with the text `step`. What was
    /// typed is stored before.
    void Paste(const PastedCells& cells, const QString& step);
    /// Changes cells, the first of which stands in `row`: one undo step with the text `step`. What was typed is stored.
    void ChangeCells(const QString& step, int row, CCellChanges changes);
    /// A new line before `row`, with the columns' fill values: an undo step. The offered row becomes a line before it.
    /// Returns the row where it went.
    int InsertRow(int row);
    /// Lines go in before a row of the source: an undo step with the text `step`. Returns where the first one stands
    /// there. What was typed is stored.
    std::size_t PutLines(const QString& step, std::size_t at, std::unique_ptr<IRowBlock> lines);
    /// A new line below `row`: the next one in the source.
    int InsertRowBelow(int row);
    /// Lines that hold what these do, below the last of them: an undo step. Where no two lines may hold the same, they
    /// hold what fits there. Returns the row where the first one went, or why none did.
    std::pair<int, QString> DuplicateRows(int row, int count);
    /// The rows change places with the one above them, or below: an undo step. Not while they are sorted. Returns why
    /// they did not.
    QString MoveRows(int row, int count, bool up);
    /// A new line behind the last one, with these texts in its first cells, which take them: an undo step.
    void AppendRow(const QStringList& texts);
    /// An undo step; the offered row stays. No fixed row is among the rows.
    void RemoveRows(int row, int count);

signals:
    /// The user changed a cell.
    void CellModified(const QModelIndex& cell);
    /// Sorted or filtered by something else, or by nothing.
    void ViewChanged();
    void NotesChanged();

private:
    QString HeaderToolTip(int column) const;
    QString CellDetails(int row, int column) const;
    QString WithNote(int row, const QString& text) const;
    QVariant LineNumberData(int row, int role) const;
    std::size_t Change(const QString& step, std::size_t row, const std::function<void()>& make);
    std::size_t Arrange(std::size_t row);
    std::size_t PutBelow(const QString& step, std::size_t row, std::unique_ptr<IRowBlock> lines);
    void RemoveScattered(const std::vector<std::size_t>& lines);
    bool StoreOffered(const Overlay& typed, BlankRule rule);
    bool StoreRows(const Overlay& typed, BlankRule rule);

    CKsDoc* m_document = nullptr;
    CSavedLines m_saved{*this};
    LineNotes m_notes;
    int m_rowCount = 0; // as the views know it
    bool m_syncing = false;
    QStringList m_headers; // as the views know them
    int m_contents = 0;    // which content of the document is shown
};
