#include "grid/cell_results.h"

#include "grid/cell_text.h"
#include "grid/grid_texts.h"
#include "grid/typing.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace {

constexpr std::size_t Listed = 100; // more is nothing that anybody reads

} // namespace

const CShownNumbers& CCellResults::NumbersOf(int column)
{
    if (!m_numbers || m_numbers->column != column)
        m_numbers.emplace(column, CShownNumbers(*m_rows, column));
    return m_numbers->shown;
}

/// Whether the cell may be changed, and to this number where it is one. What may not be is kept.
bool CCellResults::IsTaken(int row, int column, const ColumnSpec& spec, const double* number)
{
    const bool isLocked = spec.locked && m_rows->IsLocked(row, column);
    if (!isLocked && (!number || spec.bounds.Allow(*number)))
        return true;
    Keep(row, column, isLocked ? GridTexts::tr("The cell is locked.") : OutOfRange());
    return false;
}

void CCellResults::List(int row, int column, const CellValue& before, const CellValue& after)
{
    const ColumnSpec& spec = m_rows->Column(column);
    if (m_changed.size() < Listed)
        m_changed.push_back({row, column, EditText(spec, before), EditText(spec, after)});
    if (m_hasRules)
        m_ruled[column][row] = after;
}

template <typename T>
void CCellResults::Change(int row, int column, const ColumnSpec& spec, const T& before, const T& after)
{
    if (m_changes.IsEmpty())
        m_firstRow = row;
    if (m_changed.size() < Listed || m_hasRules)
        List(row, column, before, after);
    m_changes.Add(m_rows->NameOf(row), column + 1, spec.access, before, after);
}

void CCellResults::Add(int row, int column, const CellValue& before, const CellValue& after)
{
    if (!SameCell(before, after) && IsTaken(row, column, m_rows->Column(column), std::get_if<double>(&after)))
        PutBack(row, column, before, after);
}

void CCellResults::PutBack(int row, int column, const CellValue& before, const CellValue& after)
{
    const ColumnSpec& spec = m_rows->Column(column);
    const auto *numberBefore = std::get_if<double>(&before), *numberAfter = std::get_if<double>(&after);
    if (numberBefore && numberAfter)
        Change(row, column, spec, *numberBefore, *numberAfter);
    else
        Change(row, column, spec, before, after);
}

void CCellResults::AddShown(int row, int column, const void* untouchedObject, double after)
{
    using Limits = std::numeric_limits<std::int32_t>;
    if (!std::isfinite(after))
        return Keep(row, column, GridTexts::tr("The result is no number."));
    const CShownNumbers& numbers = NumbersOf(column);
    if (const double* const kept = numbers.Kept(untouchedObject))
        return AddNumber(row, column, numbers, *kept, after);
    const CellValue before = m_rows->Value(row, column);
    const bool isNumber = numbers.Spec().Kind() == CellKind::Number;
    if (const auto* number = std::get_if<double>(&before); number && isNumber)
        AddNumber(row, column, numbers, *number, after);
    else if (isNumber)
        Add(row, column, before, KsFifteenDigits(numbers.Conversion().ToBase(after)));
    else if (after != std::floor(after) || after < Limits::min() || after > Limits::max())
        Keep(row, column, GridTexts::tr("The result is no integer."));
    else
        Add(row, column, before, std::int32_t(after));
}

void CCellResults::AddNumber(int row, int column, const CShownNumbers& numbers, double before, double after)
{
    // What a conversion of units makes of the last place is no change.
    if (numbers.Conversion().ToShown(before) == after)
        return;
    const double number = KsFifteenDigits(numbers.Conversion().ToBase(after));
    if (!SameCell(before, number) && IsTaken(row, column, numbers.Spec(), &number))
        Change(row, column, numbers.Spec(), before, number);
}

void CCellResults::Keep(int row, int column, const QString& why)
{
    if (m_keptCount++ < Listed)
        m_kept.push_back({row, column, EditText(m_rows->Column(column), m_rows->Value(row, column)), why});
}

QString CCellResults::RuleFault() const
{
    if (m_ruled.empty())
        return {};
    int top = std::numeric_limits<int>::max(), bottom = 0;
    for (const auto& [column, cells] : m_ruled) {
        top = std::min(top, cells.begin()->first);
        bottom = std::max(bottom, cells.rbegin()->first);
    }
    PastedCells all{m_rows->SourceRows(top, bottom - top + 1), {}};
    for (const auto& [column, cells] : m_ruled) {
        auto& place = all.columns.emplace_back(column);
        for (int row = top; row <= bottom; ++row) {
            const auto cell = cells.find(row);
            place.left.push_back(cell == cells.end());
            place.values.Add(cell == cells.end() ? m_rows->Value(row, column) : cell->second);
        }
    }
    const auto faults = m_rows->Faults(all, 1);
    return faults.empty()
               ? QString()
               : GridTexts::tr("Line %1: %2")
                     .arg(QString::number(m_rows->LineNumber(top + int(faults.front().row))), faults.front().text);
}
