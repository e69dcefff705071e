#include "grid/table_rows.h"

#include "grid/cell_changes.h"
#include "grid/cell_text.h"
#include "grid/grid_texts.h"
#include "grid/row_filter.h"

#include <algorithm>

void* CTableRows::RowObject(int row) const
{
    // A row that the source has lost, as long as nobody has looked, is one that it does not have yet.
    if (const std::size_t place = SourceRow(row); place < m_rows->Count())
        return m_rows->At(place);
    if (!m_offered)
        m_offered = NewLines(1);
    return m_offered->At(0);
}

std::unique_ptr<IRowBlock> CTableRows::NewLines(int count, std::size_t at) const
{
    auto lines = m_rows->NewRows(std::size_t(count));
    m_rows->Fit(*lines, at);
    for (const ColumnSpec& column : m_columns) {
        const CellValue value = column.NewLineValue();
        for (std::size_t i = 0; i < lines->Count() && !std::holds_alternative<std::monostate>(value); ++i)
            column.access->set(lines->At(i), value);
    }
    return lines;
}

// ---- which rows, and where ---------------------------------------------------------------------

/// SourceRow of what is sorted or filtered.
std::size_t CTableRows::ArrangedRow(int row) const
{
    const auto shown = std::size_t(row);
    return shown < m_shown.Count() ? m_shown.SourceRow(shown) : m_rows->Count() + shown - m_shown.Count();
}

std::vector<std::size_t> CTableRows::SourceRows(int row, int count) const
{
    std::vector<std::size_t> lines(std::size_t(std::max(count, 0)));
    std::ranges::generate(lines, [this, row]() mutable { return SourceRow(row++); });
    return lines;
}

int CTableRows::ShownRow(std::size_t sourceRow) const
{
    if (m_shown.IsPlain())
        return int(sourceRow);
    const auto row = m_shown.RowOf(sourceRow);
    return row ? int(*row) : -1;
}

QString CTableRows::CountText() const
{
    if (!m_shown.IsFiltered() || LineCount() == 0)
        return {};
    return GridTexts::tr("%1 of %2 shown").arg(StoredRows() - FixedRows()).arg(LineCount());
}

void* CTableRows::StoredObject(int row) const
{
    return row >= 0 && row < StoredRows() ? RowObject(row) : nullptr;
}

void CTableRows::ApplySort()
{
    if (m_rows && !m_sortedBy.empty())
        m_shown.Sort(*m_rows, SortedRows(*m_rows, m_columns, m_sortedBy));
    else
        m_shown.SortAsSource();
}

void CTableRows::ApplyFilters()
{
    auto hidden = m_rows ? HiddenRows(*m_rows, m_columns, m_filters) : std::vector<bool>();
    if (hidden.empty())
        m_shown.HideNothing();
    else
        m_shown.Hide(*m_rows, std::move(hidden));
}

void CTableRows::FollowSource()
{
    if (m_shown.Follow(*m_rows, m_changedAt))
        return;
    ApplySort();
    ApplyFilters();
}

// ---- rows by name ------------------------------------------------------------------------------

RowKey CTableRows::NameOf(int row) const
{
    const std::size_t place = SourceRow(row);
    return place < m_rows->Count() ? m_rows->KeyAt(place) : OfferedKey; // which stands behind the source's rows
}

int CTableRows::RowNamed(RowKey name, int row) const
{
    if (name == OfferedKey && IsRow(row))
        return row; // it may have become a line
    const bool isLine = m_rows && name != OfferedKey;
    const std::size_t found = isLine ? m_rows->RowOf(name, SourceRow(std::max(row, 0))) : 0;
    if (isLine && found < m_rows->Count())
        return ShownRow(found);
    return OffersRow() ? StoredRows() : -1;
}

void CTableRows::PruneOverlay()
{
    std::erase_if(m_pending, [this](const auto& cell) {
        const RowKey row = cell.first.first;
        return row == OfferedKey ? !OffersRow() : m_rows->RowOf(row, cell.second.row) == m_rows->Count();
    });
}

// ---- cells -------------------------------------------------------------------------------------

CellValue CTableRows::Value(int row, int column) const
{
    if (!m_pending.empty()) {
        const auto typed = m_pending.find({NameOf(row), column});
        if (typed != m_pending.end())
            return typed->second.value;
    }
    return Column(column).access->get(RowObject(row));
}

bool CTableRows::IsLocked(int row, int column) const
{
    const ColumnSpec& spec = Column(column);
    if (!spec.locked)
        return false;
    const RowKey key = NameOf(row);
    const auto typed = m_pending.lower_bound({key, 0});
    if (typed == m_pending.end() || typed->first.first != key || row < FixedRows())
        return spec.locked(RowObject(row));
    // A lock follows the cells as the user sees them.
    const auto shown = m_rows->NewRows(1);
    CopyRow(row, shown->At(0));
    return spec.locked(shown->At(0));
}

bool CTableRows::HidesDigits(int row, int column) const
{
    const ColumnSpec& spec = Column(column);
    if (spec.Kind() != CellKind::Number || !IsRow(row))
        return false;
    const CellValue value = Value(row, column);
    return ::HidesDigits(spec, value, ShownText(spec, value));
}

bool CTableRows::IsGlobalValue(int row, int column) const
{
    const ColumnSpec& spec = Column(column);
    const GlobalPlace global = spec.Global();
    return global && row >= FixedRows() && IsRow(row) && SameCell(Value(row, column), global.Value());
}

std::size_t CTableRows::OverrideCount(int column) const
{
    const ColumnSpec& spec = Column(column);
    const CellValue global = spec.Global().Value();
    std::size_t count = 0;
    for (std::size_t row = m_rows->FixedRows(); row < m_rows->Count(); ++row)
        count += !SameCell(spec.access->get(m_rows->At(row)), global);
    return count;
}

CellValue CTableRows::Resolved(int column, const CellValue& value, BlankRule rule) const
{
    const ColumnSpec& spec = Column(column);
    if (!std::holds_alternative<std::monostate>(value))
        return value;
    return rule == BlankRule::Fill && spec.fill ? spec.FillValue() : spec.EmptyValue();
}

void CTableRows::CopyRow(int row, void* target) const
{
    for (int column = 0; column < int(m_columns.size()); ++column)
        Column(column).access->set(target, Resolved(column, Value(row, column)));
}

// ---- what is refused ---------------------------------------------------------------------------

QString CTableRows::Refusal(int row, int column, const QString& text, bool isAlone) const
{
    const ColumnSpec& spec = Column(column);
    if (IsRow(row)) {
        if (text == EditText(spec, Value(row, column)))
            return {}; // a stored number may be one that nobody could type
        if (IsLocked(row, column))
            return GridTexts::tr("The cell is locked.");
    }
    CellReading read = ReadCell(spec, text);
    if (!read.refusal.isEmpty() || !isAlone || !m_rows || !m_rows->HasRules())
        return read.refusal;
    PastedCells cell{{SourceRow(row)}, {{column, {}}}};
    cell.columns.front().values.Add(Resolved(column, read.value));
    const auto faults = Faults(cell, 1);
    return faults.empty() ? QString() : faults.front().text;
}

/// Faults of rows from `first` on, told of the texts, which stand elsewhere. Where it is no text's own row that does
/// not fit, it is the text that the row does not fit with.
static std::vector<IRowSource::Fault> OfTexts(std::vector<IRowSource::Fault> faults, const PastedCells& cells,
                                              std::size_t first, std::size_t count)
{
    constexpr std::size_t none = std::size_t(-1);
    std::vector<std::size_t> textOf(faults.empty() ? 0 : count, none);
    for (std::size_t i = 0; i < cells.rows.size() && !faults.empty(); ++i)
        textOf[cells.rows[i] - first] = i;
    for (IRowSource::Fault& fault : faults) {
        const bool isText = textOf[fault.row] != none || !fault.with;
        const std::size_t text = textOf[isText ? fault.row : *fault.with];
        fault.row = text == none ? 0 : text;
    }
    return faults;
}

std::vector<IRowSource::Fault> CTableRows::Faults(const PastedCells& cells, std::size_t most) const
{
    if (!m_rows || !m_rows->HasRules() || cells.rows.empty())
        return {};
    // The source is asked about the rows from the first to the last one of these, be others among them or not.
    const auto [low, high] = std::ranges::minmax(cells.rows);
    const std::size_t first = low, stored = m_rows->Count();
    const auto rows = m_rows->NewRows(high - low + 1);
    // what the new ones among them start from
    const auto lines = NewLines(int(std::max(high + 1, stored) - stored));
    for (std::size_t i = 0; i < rows->Count(); ++i)
        for (const ColumnSpec& spec : m_columns)
            spec.access->set(rows->At(i), spec.access->get(first + i < stored ? m_rows->At(first + i)
                                                                              : lines->At(first + i - stored)));
    for (const auto& [cell, typed] : m_pending) // seen, and stored before anything is pasted
        if (typed.row >= first && typed.row - first < rows->Count() && typed.row < stored)
            Column(cell.second).access->set(rows->At(typed.row - first), Resolved(cell.second, typed.value));
    for (const auto& column : cells.columns)
        for (std::size_t i = 0; i < cells.rows.size(); ++i)
            if (!column.Leaves(i))
                Column(column.column).access->set(rows->At(cells.rows[i] - first), column.values[i]);
    return OfTexts(m_rows->FindFaults(first, *rows, most), cells, first, rows->Count());
}

namespace {

/// Rows of a source and others, in an order that they would have.
struct RowsInOrder : IRowBlock
{
    std::size_t Count() const override { return rows.size(); }
    void* At(std::size_t index) override { return rows[index]; }
    std::vector<void*> rows = {};
};

QString TextOf(const std::optional<IRowSource::Fault>& fault, std::size_t first)
{
    return fault ? GridTexts::tr("Line %1: %2").arg(QString::number(first + fault->row + 1), fault->text) : QString();
}

} // namespace

QString CTableRows::WhyNotBetween(std::size_t at, IRowBlock& lines) const
{
    if (!m_rows->HasRules())
        return {};
    RowsInOrder rows;
    for (std::size_t i = 0; i < lines.Count(); ++i)
        rows.rows.push_back(lines.At(i));
    for (std::size_t row = at; row < m_rows->Count(); ++row)
        rows.rows.push_back(m_rows->At(row));
    return TextOf(m_rows->FindFault(at, rows), at);
}

QString CTableRows::WhyNotMoved(std::size_t from, std::size_t to) const
{
    if (!m_rows->HasRules())
        return {};
    RowsInOrder rows;
    const auto [first, last] = std::minmax(from, to);
    for (std::size_t row = first; row <= last; ++row)
        rows.rows.push_back(m_rows->At(row));
    const auto at = [&](std::size_t row) { return rows.rows.begin() + std::ptrdiff_t(row - first); };
    if (from < to)
        std::rotate(at(from), at(from + 1), at(to + 1));
    else
        std::rotate(at(to), at(from), at(from + 1));
    return TextOf(m_rows->FindFault(first, rows), first);
}
