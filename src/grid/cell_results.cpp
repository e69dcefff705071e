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

void CCellResults::Add(int row, int column, const CellValue& before, const CellValue& after)
{
    if (SameCell(before, after))
        return;
    const ColumnSpec& spec = m_rows->Column(column);
    if (m_rows->IsLocked(row, column))
        return Keep(row, column, GridTexts::tr("The cell is locked."));
    if (const auto* number = std::get_if<double>(&after); number && !spec.bounds.Allow(*number))
        return Keep(row, column, OutOfRange());
    PutBack(row, column, before, after);
}

void CCellResults::PutBack(int row, int column, const CellValue& before, const CellValue& after)
{
    const ColumnSpec& spec = m_rows->Column(column);
    if (m_changes.IsEmpty())
        m_firstRow = row;
    if (m_changed.size() < Listed)
        m_changed.push_back({row, column, EditText(spec, before), EditText(spec, after)});
    if (m_hasRules)
        m_ruled[column][row] = after;
    const RowKey name = m_rows->NameOf(row);
    const auto *numberBefore = std::get_if<double>(&before), *numberAfter = std::get_if<double>(&after);
    if (numberBefore && numberAfter)
        m_changes.Add(name, column + 1, spec.access, *numberBefore, *numberAfter);
    else
        m_changes.Add(name, column + 1, spec.access, before, after);
}

void CCellResults::AddShown(int row, int column, const CellValue& before, double after)
{
    using Limits = std::numeric_limits<std::int32_t>;
    const ColumnSpec& spec = m_rows->Column(column);
    const auto* number = std::get_if<double>(&before);
    // What a conversion of units makes of the last place is no change.
    if (number && spec.style.UnitConvertFromBase(*number, 1) == after)
        return;
    if (!std::isfinite(after))
        Keep(row, column, GridTexts::tr("The result is no number."));
    else if (spec.Kind() == CellKind::Number)
        Add(row, column, before, KsFifteenDigits(spec.style.UnitConvertFromBase(after, 0)));
    else if (after != std::floor(after) || after < Limits::min() || after > Limits::max())
        Keep(row, column, GridTexts::tr("The result is no integer."));
    else
        Add(row, column, before, std::int32_t(after));
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
    const auto fault = m_rows->Fault(all);
    return fault ? GridTexts::tr("Line %1: %2")
                       .arg(QString::number(m_rows->LineNumber(top + int(fault->row))), fault->text)
                 : QString();
}
