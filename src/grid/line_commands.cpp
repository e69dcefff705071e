#include "grid/line_commands.h"

#include "grid/branch_lines_dlg.h"
#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "grid/grid_texts.h"
#include "grid/grid_widths.h"
#include "ks/fc/doc.h"
#include "ks/fc/message_box.h"

#include <algorithm>

namespace {

/// Rows of the table, from 0.
struct LineRange
{
    int first = 0, last = -1;
    int Count() const { return last - first + 1; }
};

/// The lines with selected cells, or the current one; fixed rows and the offered one are none.
LineRange LinesOf(const CGenGrid& grid)
{
    const auto selected = grid.SelectedBlock();
    const QItemSelectionRange block = selected ? *selected : QItemSelectionRange(grid.currentIndex());
    if (!block.isValid())
        return {};
    return {std::max(block.top(), grid.Model()->FixedRows()), std::min(block.bottom(), grid.Model()->StoredRows() - 1)};
}

void Insert(CGenGrid& grid, bool above)
{
    CGridModel& model = *grid.Model();
    const auto selected = grid.SelectedBlock();
    const int top = selected ? selected->top() : grid.currentIndex().row();
    const int bottom = selected ? selected->bottom() : top;
    const int row = above ? model.InsertRow(top) : model.InsertRowBelow(bottom);
    grid.clearSelection();
    grid.SetCurrentCell(row + 1, 1);
}

void Duplicate(CGenGrid& grid)
{
    const LineRange lines = LinesOf(grid);
    const CGridSelection::Shape shape = grid.Selection().ShapeNow();
    const auto [row, fault] = grid.Model()->DuplicateRows(lines.first, lines.Count());
    if (!fault.isEmpty())
        KsMessageBox(GridTexts::tr("Nothing was duplicated. %1").arg(fault), QMessageBox::Ok, &grid);
    else if (row >= 0)
        grid.Selection().SelectAgain(shape, row, row + lines.Count() - 1);
}

void Move(CGenGrid& grid, bool up)
{
    CGridModel& model = *grid.Model();
    if (model.Shown().IsSorted())
        return model.Document()->Say(
            GridTexts::tr("Lines are moved in the order of the file. These are sorted: Lines > "
                          "%1 shows them as they stand in the file.")
                .arg(NameOf(GridAction::FileOrder)));
    const LineRange lines = LinesOf(grid);
    const CGridSelection::Shape shape = grid.Selection().ShapeNow();
    if (const QString fault = model.MoveRows(lines.first, lines.Count(), up); !fault.isEmpty())
        KsMessageBox(GridTexts::tr("Nothing was moved. %1").arg(fault), QMessageBox::Ok, &grid);
    else
        grid.Selection().SelectAgain(shape, lines.first + (up ? -1 : 1), lines.last + (up ? -1 : 1));
}

} // namespace

bool CanRunOnLines(const CGenGrid& grid, GridAction action)
{
    const CGridModel& model = *grid.Model();
    if (!grid.isEnabled() || !model.Document() || model.Document()->IsReadOnly() || !model.Rows() ||
        (!grid.currentIndex().isValid() && action != GridAction::InsertAlong))
        return false;
    const LineRange lines = LinesOf(grid);
    const bool hasLines = lines.Count() > 0, moves = hasLines && model.Rows()->MayMove();
    switch (action) {
    case GridAction::InsertAbove:
        return grid.MayGrow() && grid.currentIndex().row() >= model.FixedRows();
    case GridAction::InsertBelow:
        return grid.MayGrow();
    case GridAction::Duplicate:
        return grid.MayGrow() && hasLines;
    case GridAction::InsertAlong:
        return grid.MayGrow() && grid.Host() && grid.Host()->CanSearch(grid);
    case GridAction::MoveUp:
        return moves && (lines.first > model.FixedRows() || model.Shown().IsSorted());
    default:
        return moves && (lines.last + 1 < model.StoredRows() || model.Shown().IsSorted());
    }
}

void RunOnLines(CGenGrid& grid, GridAction action)
{
    grid.StoreEditedLine();
    if (!CanRunOnLines(grid, action)) // what was typed may have changed it
        return;
    switch (action) {
    case GridAction::InsertAbove:
    case GridAction::InsertBelow:
        Insert(grid, action == GridAction::InsertAbove);
        break;
    case GridAction::Duplicate:
        Duplicate(grid);
        break;
    case GridAction::InsertAlong:
        InsertLinesAlong(grid);
        break;
    default:
        Move(grid, action == GridAction::MoveUp);
    }
    grid.Widths().Update();
}
