#include "grid/grid_state.h"

#include "grid/gen_grid.h"
#include "grid/grid_widths.h"

#include <algorithm>

namespace {

const QString Columns = QStringLiteral("columns"), Widths = QStringLiteral("widths"), Order = QStringLiteral("order"),
              Filter = QStringLiteral("filter"), Line = QStringLiteral("line"), Column = QStringLiteral("column");

/// Columns from 1 on, negative where the largest value comes first.
QVariantList NumbersOf(const std::vector<SortKey>& keys)
{
    QVariantList numbers;
    for (const SortKey& key : keys)
        numbers << (key.descending ? -1 : 1) * (key.column + 1);
    return numbers;
}

std::vector<SortKey> KeysFrom(const QVariantList& numbers, int columns)
{
    std::vector<SortKey> keys;
    for (const QVariant& number : numbers) {
        const int column = std::abs(number.toInt()) - 1;
        if (column >= 0 && column < columns && std::ranges::find(keys, column, &SortKey::column) == keys.end())
            keys.push_back({column, number.toInt() < 0});
    }
    return keys;
}

void RestoreView(CGenGrid& grid, std::vector<SortKey> keys, const QStringList& filter)
{
    if (!grid.Model()->MayRearrangeView())
        return;
    if (!keys.empty())
        grid.ChangeView([&](CGridModel& model) { model.SortBy(std::move(keys)); });
    if (!std::ranges::all_of(filter, &QString::isEmpty) && filter.size() <= grid.ColumnCount())
        grid.ChangeView([&](CGridModel& model) { model.Filter(filter); });
}

} // namespace

QVariantMap GridState::Of(const CGenGrid& grid)
{
    QVariantMap state;
    if (grid.Widths().AreChosen()) {
        QVariantList widths;
        for (int column = 0; column < grid.ColumnCount(); ++column)
            widths << grid.columnWidth(column);
        state[Widths] = widths;
    }
    if (const auto& keys = grid.Model()->SortedBy(); !keys.empty())
        state[Order] = NumbersOf(keys);
    if (grid.Model()->Shown().IsFiltered())
        state[Filter] = grid.Model()->Filters();
    if (grid.CurrentLine() > grid.Model()->FixedRows() + 1 || grid.CurrentColumn() > 1) {
        state[Line] = grid.CurrentLine();
        state[Column] = grid.CurrentColumn();
    }
    if (!state.isEmpty())
        state[Columns] = grid.ColumnCount();
    return state;
}

void GridState::Restore(CGenGrid& grid, const QVariantMap& state)
{
    if (!grid.Model()->Rows() || state[Columns].toInt() != grid.ColumnCount())
        return;
    const QVariantList widths = state[Widths].toList();
    if (widths.size() == grid.ColumnCount())
        grid.Widths().Choose(widths);
    RestoreView(grid, KeysFrom(state[Order].toList(), grid.ColumnCount()), state[Filter].toStringList());
    const int line = state[Line].toInt(), row = line > 0 ? grid.Model()->ShownRow(std::size_t(line - 1)) : -1;
    if (row >= 0 && row < grid.RowCount())
        grid.SetCurrentCell(row + 1, std::clamp(state[Column].toInt(), 1, grid.ColumnCount()));
}
