#include "grid/table_rows.h"

#include "grid/cell_text.h"
#include "grid/grid_texts.h"

#include <algorithm>

void* CTableRows::RowObject(int row) const
{
    if (!IsOffered(row))
        return m_rows->At(std::size_t(row));
    if (!m_offered)
        m_offered = NewLines(1);
    return m_offered->At(0);
}

std::unique_ptr<IRowBlock> CTableRows::NewLines(int count, int at) const
{
    auto lines = m_rows->NewRows(std::size_t(count));
    m_rows->Fit(*lines, std::size_t(at));
    for (const ColumnSpec& column : m_columns) {
        const CellValue value = column.NewLineValue();
        for (std::size_t i = 0; i < lines->Count() && !std::holds_alternative<std::monostate>(value); ++i)
            column.access->set(lines->At(i), value);
    }
    return lines;
}

// ---- rows by name ------------------------------------------------------------------------------

RowKey CTableRows::NameOf(int row) const
{
    return IsOffered(row) ? OfferedKey : m_rows->KeyAt(std::size_t(row));
}

int CTableRows::RowNamed(RowKey name, int row) const
{
    if (name == OfferedKey && IsRow(row))
        return row; // it may have become a line
    const bool isLine = m_rows && name != OfferedKey;
    const int found = isLine ? int(m_rows->RowOf(name, std::size_t(std::max(row, 0)))) : StoredRows();
    return found < ShownRows() ? found : -1;
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
    const QString refusal = ReadCell(spec, text).refusal;
    if (!refusal.isEmpty() || !isAlone)
        return refusal;
    const auto fault = Fault(row, column, {{text}});
    return fault ? fault->text : QString();
}

std::optional<IRowSource::Fault> CTableRows::Fault(int row, int column, const std::vector<QStringList>& texts) const
{
    if (!m_rows || !m_rows->HasRules())
        return std::nullopt;
    const int last = StoredRows();
    const auto rows = m_rows->NewRows(texts.size());
    const auto lines = NewLines(std::max(0, row + int(texts.size()) - last)); // what the new ones among them start from
    for (int r = 0; r < int(texts.size()); ++r) {
        const QStringList& given = texts[std::size_t(r)];
        for (int c = 0; c < int(m_columns.size()); ++c) {
            const ColumnSpec& spec = Column(c);
            const bool isGiven = c >= column && c - column < given.size();
            const CellValue value = isGiven          ? ReadCell(spec, given[c - column]).value
                                    : row + r < last ? Value(row + r, c)
                                                     : spec.access->get(lines->At(std::size_t(row + r - last)));
            spec.access->set(rows->At(std::size_t(r)), Resolved(c, value));
        }
    }
    return m_rows->FindFault(std::size_t(row), *rows);
}
