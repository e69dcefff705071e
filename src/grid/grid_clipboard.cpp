#include "grid/grid_clipboard.h"

#include "grid/cell_text.h"
#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "grid/grid_texts.h"
#include "grid/grid_widths.h"
#include "grid/table_text.h"
#include "ks/fc/doc.h"
#include "ks/fc/message_box.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QMimeData>
#include <algorithm>
#include <numeric>

bool CanCopyCells(const CGenGrid& grid)
{
    return grid.selectionModel()->hasSelection() || grid.currentIndex().isValid();
}

/// As one line: "Initial h [m]".
static QString HeaderText(const ColumnSpec& column)
{
    return (column.header() + u' ' + column.UnitLine()).simplified();
}

static void Copy(const CGenGrid& grid, bool withHeaders)
{
    if (!CanCopyCells(grid))
        return;
    const QItemSelection selection = grid.selectionModel()->selection();
    const QItemSelectionRange range =
        selection.isEmpty() ? QItemSelectionRange(grid.currentIndex()) : selection.front();
    std::vector<QStringList> rows;
    rows.reserve(std::size_t(range.height()) + withHeaders);
    if (withHeaders) {
        QStringList& headers = rows.emplace_back();
        for (int column = range.left(); column <= range.right(); ++column)
            headers << HeaderText(grid.Model()->Column(column));
    }
    for (int row = range.top(); row <= range.bottom(); ++row) {
        QStringList& cells = rows.emplace_back();
        for (int column = range.left(); column <= range.right(); ++column)
            cells << EditText(grid.Model()->Column(column), grid.Model()->Value(row, column));
    }
    QGuiApplication::clipboard()->setText(WriteTable(rows));
}

void CopyCells(const CGenGrid& grid)
{
    Copy(grid, false);
}

void CopyCellsWithHeaders(const CGenGrid& grid)
{
    Copy(grid, true);
}

bool CanPasteCells(const CGenGrid& grid)
{
    const QMimeData* content = QGuiApplication::clipboard()->mimeData();
    return content && content->hasText() && !content->text().isEmpty() && grid.Model()->Rows() &&
           (grid.currentIndex().isValid() || grid.RowCount() == 0);
}

/// Why the cells cannot go to row `top` and column `left`; empty when they can.
static QString PasteRefusal(const CGridModel& model, int top, int left, const std::vector<QStringList>& cells)
{
    const auto header = [&](int column) { return model.Column(column).header(); };
    const auto refused = [&](int row, int column, const QString& text, const QString& reason) {
        return GridTexts::tr("Nothing was pasted. Line %1, column \"%2\" cannot take \"%3\":\n%4")
            .arg(QString::number(model.LineNumber(row)), header(column), text, reason);
    };
    if (!model.Rows()->MayGrow() && top + int(cells.size()) > model.StoredRows())
        return GridTexts::tr("Nothing was pasted. From line %1 on the table has only %2 lines.")
            .arg(model.LineNumber(top))
            .arg(model.StoredRows() - top);
    for (std::size_t r = 0; r < cells.size(); ++r) {
        const int row = top + int(r), width = int(cells[r].size());
        if (left + width > model.columnCount())
            return GridTexts::tr("Nothing was pasted. The copied cells are %1 columns wide; from column \"%2\" on the "
                                 "table has only %3.")
                .arg(width)
                .arg(header(left))
                .arg(model.columnCount() - left);
        for (int c = 0; c < width; ++c) {
            const QString refusal = model.Refusal(row, left + c, cells[r][c], false);
            if (!refusal.isEmpty())
                return refused(row, left + c, cells[r][c], refusal);
        }
    }
    if (const auto fault = model.Fault(top, left, cells))
        return refused(top + int(fault->row), left, cells[fault->row].join(QStringLiteral("  ")), fault->text);
    return {};
}

/// The first line names the columns, with the units that they show or without: it says what follows, and is no line.
static bool IsHeaderLine(const CGridModel& model, int left, const QStringList& cells)
{
    if (cells.isEmpty() || left + cells.size() > model.columnCount())
        return false;
    const auto names = [&](qsizetype cell) {
        const ColumnSpec& column = model.Column(left + int(cell));
        const QString text = cells[cell].simplified();
        return text.compare(HeaderText(column), Qt::CaseInsensitive) == 0 ||
               text.compare(column.header().simplified(), Qt::CaseInsensitive) == 0;
    };
    for (qsizetype cell = 0; cell < cells.size(); ++cell)
        if (!names(cell))
            return false;
    return true;
}

/// What was pasted is selected, its beginning in sight.
static void ShowPasted(CGenGrid& grid, int top, int left, const std::vector<QStringList>& cells)
{
    const auto width = [](const QStringList& row) { return int(row.size()); };
    const int right = left + width(std::ranges::max(cells, {}, width)) - 1, bottom = top + int(cells.size()) - 1;
    if (bottom >= grid.RowCount() || right >= grid.ColumnCount() || (bottom == top && right == left))
        return;
    grid.SetCurrentCell(top + 1, left + 1);
    grid.selectionModel()->select({grid.Model()->index(top, left), grid.Model()->index(bottom, right)},
                                  QItemSelectionModel::ClearAndSelect);
}

bool PasteCells(CGenGrid& grid)
{
    if (!CanPasteCells(grid) || !grid.Model()->Document()->MayChange())
        return false;
    const auto selected = grid.SelectedBlock();
    const int top = selected ? selected->top() : std::max(0, grid.currentIndex().row());
    const int left = selected ? selected->left() : std::max(0, grid.currentIndex().column());
    auto cells = ReadTable(QGuiApplication::clipboard()->text());
    const bool hasHeaders = cells.size() > 1 && IsHeaderLine(*grid.Model(), left, cells.front());
    if (hasHeaders)
        cells.erase(cells.begin());
    if (selected && cells.size() == 1 && cells.front().size() == 1) // one copied cell fills the selection
        cells.assign(std::size_t(selected->height()), QStringList(selected->width(), cells.front().front()));
    if (const QString refusal = PasteRefusal(*grid.Model(), top, left, cells); !refusal.isEmpty()) {
        KsMessageBox(refusal, QMessageBox::Ok, &grid);
        return false;
    }
    grid.StoreEditedLine();
    const int current = std::max(1, grid.CurrentRow());
    grid.Model()->Paste(top, left, cells, GridTexts::tr("Paste"));
    const auto count = std::accumulate(cells.begin(), cells.end(), std::size_t(0),
                                       [](std::size_t sum, const auto& row) { return sum + std::size_t(row.size()); });
    QString done = GridTexts::Counted(count, GridTexts::tr("1 cell pasted"), GridTexts::tr("%1 cells pasted"));
    if (std::ranges::any_of(cells, [&](const QStringList& row) { return row.size() != cells.front().size(); }))
        done += GridTexts::tr("; shorter lines leave their other cells as they were");
    if (hasHeaders)
        done += GridTexts::tr("; the line with the headers was left out");
    grid.Model()->Document()->Say(done);
    if (grid.Host())
        grid.Host()->LineEdited(grid); // the project is told when locations came in
    grid.Reload();
    grid.Widths().MakeRoom();
    if (grid.CurrentRow() ==
        current) // else the table puts its lines in order, and the current one has gone to its place
        ShowPasted(grid, top, left, cells);
    return true;
}
