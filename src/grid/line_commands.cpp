#include "grid/line_commands.h"

#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "grid/grid_texts.h"
#include "grid/grid_widths.h"
#include "ks/fc/doc.h"

namespace {

struct LineRange
{
    int first, last; // rows, from 0
};

LineRange LinesOf(const CGenGrid& grid)
{
    const auto selected = grid.SelectedBlock();
    const int row = grid.CurrentRow() - 1;
    return selected ? LineRange{selected->top(), selected->bottom()} : LineRange{row, row};
}

bool Moves(GridAction action)
{
    return action == GridAction::MoveLinesUp || action == GridAction::MoveLinesDown;
}

/// Why lines of this table cannot be moved; empty when they can.
QString WhyNotMoved(const CGridModel& model)
{
    if (!model.MayRearrangeView())
        return GridTexts::tr("The lines of this table stand in an order of their own.");
    if (model.Shown().IsSorted())
        return GridTexts::tr("Lines cannot be moved while they are sorted.");
    return {};
}

/// Lines that were selected stay so, be there one or many.
void ShowLines(CGenGrid& grid, LineRange lines, int column)
{
    grid.SetCurrentCell(lines.first + 1, column);
    if (lines.last > lines.first)
        grid.SelectLines(lines.first + 1, lines.last + 1);
}

void Move(CGenGrid& grid, LineRange lines, int step)
{
    CGridModel& model = *grid.Model();
    const int column = grid.CurrentColumn();
    if (const QString reason = WhyNotMoved(model); !reason.isEmpty())
        return model.Document()->Say(reason);
    if (!model.MoveRows(lines.first, lines.last, step))
        return;
    if (grid.Host())
        grid.Host()->LineEdited(grid);
    grid.Reload();
    ShowLines(grid, {lines.first + step, lines.last + step}, column);
}

void Duplicate(CGenGrid& grid, LineRange lines)
{
    const int column = grid.CurrentColumn(), first = grid.Model()->Duplicate(lines.first, lines.last);
    if (grid.Host())
        grid.Host()->LineEdited(grid);
    grid.Reload();
    grid.Widths().Update();
    ShowLines(grid, {first, first + lines.last - lines.first}, column);
}

void Insert(CGenGrid& grid, LineRange lines, GridAction action)
{
    CGridModel& model = *grid.Model();
    const int row = action == GridAction::InsertAbove ? model.InsertRow(lines.first) : model.InsertBelow(lines.last);
    if (grid.Host())
        grid.Host()->LineEdited(grid);
    grid.Reload();
    grid.Widths().Update();
    grid.SetCurrentCell(row + 1, 1);
}

} // namespace

bool CanRunOnLines(const CGenGrid& grid, GridAction action)
{
    const CGridModel& model = *grid.Model();
    if (!grid.isEnabled() || !model.Document() || model.Document()->IsReadOnly() || !model.Rows())
        return false;
    const LineRange lines = LinesOf(grid);
    const bool areLines = lines.first >= model.FixedRows() && lines.last < model.StoredRows();
    if (Moves(action)) {
        const int neighbour = action == GridAction::MoveLinesUp ? lines.first - 1 : lines.last + 1;
        return areLines && neighbour >= model.FixedRows() && neighbour < model.StoredRows() &&
               WhyNotMoved(model).isEmpty();
    }
    return grid.MayGrow() && (action != GridAction::DuplicateLines || areLines);
}

void RunOnLines(CGenGrid& grid, GridAction action)
{
    if (!grid.MayChange())
        return;
    grid.StoreEditedLine();
    const LineRange lines = LinesOf(grid);
    if (Moves(action))
        return Move(grid, lines, action == GridAction::MoveLinesUp ? -1 : 1);
    if (!CanRunOnLines(grid, action))
        return;
    action == GridAction::DuplicateLines ? Duplicate(grid, lines) : Insert(grid, lines, action);
}
