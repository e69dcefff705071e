// The cells of a table: the rows of a source under columns. The rows are not copied; what the user typed since the last
// store lies over them as a small overlay.
//
// A source without rows is shown with one to type into, the offered row. It is no part of the document: it shows what a
// new line would hold now, and enters the source, as a step to undo, when something typed into it is stored.
#pragma once

#include "grid/pasted_cells.h"
#include "grid/row_order.h"

#include <map>
#include <vector>

/// What an emptied value cell is stored as.
enum class BlankRule
{
    Zero, // as an empty cell converts
    Fill  // as the column's fill value, where it has one
};

/// Rows and columns count from 0. A row is a line as it is shown; see CShownRows.
class CTableRows
{
public:
    const std::vector<ColumnSpec>& Columns() const { return m_columns; }
    const ColumnSpec& Column(int column) const { return m_columns[std::size_t(column)]; }
    const std::shared_ptr<IRowSource>& Rows() const { return m_rows; }
    /// Rows that are lines of the source, without the offered one.
    int StoredRows() const { return !m_rows ? 0 : int(m_shown.IsPlain() ? m_rows->Count() : m_shown.Count()); }
    /// Rows at the top that are no lines of the table.
    int FixedRows() const { return m_rows ? int(m_rows->FixedRows()) : 0; }

    /// Which of the source's rows are shown, and where.
    const CShownRows& Shown() const { return m_shown; }
    /// The row of the source; those behind the last row shown go on behind the last one of the source.
    std::size_t SourceRow(int row) const { return m_shown.IsPlain() ? std::size_t(row) : ArrangedRow(row); }
    std::vector<std::size_t> SourceRows(int row, int count) const;
    /// Where a row of the source is shown; -1 for a hidden one.
    int ShownRow(std::size_t sourceRow) const;
    /// How many lines the source has, shown or not, without fixed rows.
    int LineCount() const { return m_rows ? int(m_rows->Count()) - FixedRows() : 0; }
    /// "2 of 5 shown"; empty where no filter hides lines.
    QString CountText() const;
    /// The number of a line, from 1, as the user knows it: that in the file.
    int LineNumber(int row) const { return int(SourceRow(row)) + 1; }
    /// The object of a row of the source; null for the offered one.
    void* StoredObject(int row) const;
    /// Likewise, but null as well while anything is typed: what says all of a row, for whoever goes through many.
    const void* UntouchedObject(int row) const
    {
        const std::size_t place = m_pending.empty() ? SourceRow(row) : m_rows->Count();
        return place < m_rows->Count() ? m_rows->At(place) : nullptr;
    }
    const std::vector<SortKey>& SortedBy() const { return m_sortedBy; }
    /// What the user typed to filter the first columns.
    const QStringList& Filters() const { return m_filters; }
    /// Whether the user may sort and filter.
    bool MayRearrangeView() const { return m_rows && !m_rows->IsSequence(); }

    /// What the cell holds, typed or stored.
    CellValue Value(int row, int column) const;
    bool IsLocked(int row, int column) const;
    /// Something was typed that is not stored yet.
    bool HasTyped() const { return !m_pending.empty(); }
    /// What is stored for a value that was read; an emptied cell stores a value, too.
    CellValue Resolved(int column, const CellValue& value, BlankRule rule = BlankRule::Zero) const;
    /// The cell shows a number with fewer digits than it has. A row that the source has no more hides nothing.
    bool HidesDigits(int row, int column) const;
    /// The cell of a line holds what is the global value of its column.
    bool IsGlobalValue(int row, int column) const;
    /// How many lines of the source have another value in this column, which has a global value.
    std::size_t OverrideCount(int column) const;
    /// Writes what the row's cells hold into an object of the source's kind.
    void CopyRow(int row, void* target) const;

    /// Why the cell would not take the text; empty when it would. What the other rows have to say is asked as well when
    /// the text goes into this cell alone, and with Fault when it is one of several.
    QString Refusal(int row, int column, const QString& text, bool isAlone = true) const;
    /// Why the rows together could not take these cells, and which of `cells.rows` it is; see IRowSource::FindFaults.
    std::vector<IRowSource::Fault> Faults(const PastedCells& cells, std::size_t most) const;

    /// Why the source could not take the lines between its rows `at` - 1 and `at`; empty when it could.
    QString WhyNotBetween(std::size_t at, IRowBlock& lines) const;
    /// Why a line of the source could not go to another place; likewise.
    QString WhyNotMoved(std::size_t from, std::size_t to) const;

    /// Names the line of a row for as long as the source has it.
    RowKey NameOf(int row) const;
    /// Where the line of that name stands, looked for at `row` first; where it is gone, the row that is offered instead
    /// of lines, or -1.
    int RowNamed(RowKey name, int row) const;

    /// New lines with the columns' fill values, not in the source; they fit at its end.
    std::unique_ptr<IRowBlock> NewLines(int count) const { return NewLines(count, m_rows->Count()); }
    /// What a cell of a new line holds.
    CellValue DefaultOf(const ColumnSpec& column) const { return column.access->get(NewLines(1)->At(0)); }

protected:
    using CellKey = std::pair<RowKey, int>;
    struct Typed
    {
        CellValue value;
        std::size_t row; // where the source had it
    };
    using Overlay = std::map<CellKey, Typed>;
    static constexpr RowKey OfferedKey = RowKey(-1); // no place and no address

    bool OffersRow() const { return m_rows && m_rows->IsEmpty() && !m_rows->MayBeEmpty(); }
    std::size_t ArrangedRow(int row) const;
    int ShownRows() const { return StoredRows() + OffersRow(); }
    bool IsRow(int row) const { return row >= 0 && row < ShownRows(); }
    void* RowObject(int row) const;
    std::unique_ptr<IRowBlock> NewLines(int count, std::size_t at) const;
    /// Order and filter, as they are now, on what the source holds now.
    void ApplySort();
    void ApplyFilters();
    /// Rows of the source have come or gone.
    void FollowSource();
    /// Forgets what was typed into rows that are gone.
    void PruneOverlay();

    std::vector<ColumnSpec> m_columns;
    std::shared_ptr<IRowSource> m_rows;
    Overlay m_pending;
    mutable std::unique_ptr<IRowBlock> m_offered; // made when it is asked for
    CShownRows m_shown;
    std::vector<SortKey> m_sortedBy;
    QStringList m_filters;
    std::optional<std::size_t> m_changedAt; // where a step that is being made puts lines in or takes them out
};
