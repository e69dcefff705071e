#include "grid/selection_summary.h"

#include "grid/cell_text.h"
#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "grid/grid_texts.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace {

constexpr int Pause = 150; // milliseconds
constexpr qsizetype MostCells = 2'000'000;

struct Numbers
{
    qsizetype count = 0;
    double sum = 0, least = std::numeric_limits<double>::infinity(), most = -least;

    void Add(const ColumnSpec& column, const CellValue& value)
    {
        const auto* integer = std::get_if<std::int32_t>(&value);
        const auto* number = std::get_if<double>(&value);
        if (!integer && (!number || std::isnan(*number) || IsEmptyCell(column, value)))
            return;
        const double given = integer ? *integer : *number;
        ++count;
        sum += given;
        least = std::min(least, given);
        most = std::max(most, given);
    }
};

} // namespace

CSelectionSummary::CSelectionSummary(CGenGrid& grid) : QObject(&grid), m_grid(grid)
{
    m_pause.setSingleShot(true);
    m_pause.setInterval(Pause);
    connect(&m_pause, &QTimer::timeout, this, [this] {
        m_text = Found();
        if (m_grid.Host())
            m_grid.Host()->CellCurrent(m_grid);
    });
    connect(grid.selectionModel(), &QItemSelectionModel::selectionChanged, this, &CSelectionSummary::FindAgain);
    connect(grid.Model(), &QAbstractItemModel::dataChanged, this, &CSelectionSummary::FindAgain);
}

/// Also where nothing is selected any more: who shows the text is told that it is gone.
void CSelectionSummary::FindAgain()
{
    if (m_grid.SelectedBlock() || !m_text.isEmpty())
        m_pause.start();
    m_text.clear();
}

QString CSelectionSummary::Found() const
{
    const auto block = m_grid.SelectedBlock();
    if (!block)
        return {};
    const CGridModel& model = *m_grid.Model();
    const qsizetype cells = qsizetype(block->width()) * block->height();
    const QString count = GridTexts::tr("%1 cells selected").arg(cells);
    const ColumnSpec* column = nullptr;
    Numbers numbers;
    for (int c = block->left(); c <= block->right() && cells <= MostCells; ++c) {
        const ColumnSpec& each = model.Column(c);
        if (!each.IsNumeric())
            continue;
        if (column && column->UnitSymbol() != each.UnitSymbol())
            return count;
        column = &each;
        for (int row = block->top(); row <= std::min(block->bottom(), model.StoredRows() - 1); ++row)
            numbers.Add(each, model.Value(row, c));
    }
    if (numbers.count == 0)
        return count;
    const auto shown = [column](double number) {
        return column->Kind() == CellKind::Integer ? number : column->style.UnitConvertFromBase(number, 1);
    };
    const double mean = shown(numbers.sum / double(numbers.count));
    const auto text = [](double number) { return QString::number(number, 'g', 10); };
    return NumberText(GridTexts::tr("%1: sum %2, mean %3, min %4, max %5")
                          .arg(count, text(mean * double(numbers.count)), text(mean), text(shown(numbers.least)),
                               text(shown(numbers.most))),
                      column->UnitSymbol());
}
