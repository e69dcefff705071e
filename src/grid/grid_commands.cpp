#include "grid/grid_commands.h"

#include "grid/cell_commands.h"
#include "grid/gen_grid.h"
#include "grid/grid_clipboard.h"
#include "grid/grid_texts.h"
#include "grid/line_commands.h"
#include "ks/fc/doc.h"

#include <algorithm>

namespace {

constexpr int FirstCommand = 42640; // of the first action; that of the others follows

bool IsOfLines(GridAction action)
{
    return std::ranges::find(LineActions, action) != std::end(LineActions);
}

bool IsOfCells(GridAction action)
{
    return std::ranges::find(CellActions, action) != std::end(CellActions) ||
           std::ranges::find(EmptyingActions, action) != std::end(EmptyingActions);
}

bool IsOfClipboard(GridAction action)
{
    return std::ranges::find(ClipboardActions, action) != std::end(ClipboardActions);
}

std::vector<CKsMenuCommand> MenuOf(const auto& actions)
{
    std::vector<CKsMenuCommand> commands;
    for (const GridAction action : actions)
        commands.push_back({FirstCommand + int(action), MenuText(action), KeyOf(action), TextOf(action)});
    return commands;
}

GridAction ActionOf(int command)
{
    const int action = command - FirstCommand;
    return action >= 0 && action < int(GridAction::None) ? GridAction(action) : GridAction::None;
}

} // namespace

std::vector<CKsMenuCommand> CGridCommands::LineMenu()
{
    return MenuOf(LineActions);
}

std::vector<CKsMenuCommand> CGridCommands::CellMenu()
{
    return MenuOf(CellActions);
}

std::vector<CKsMenuCommand> CGridCommands::ClipboardMenu()
{
    return MenuOf(ClipboardActions);
}

CKsMenuCommand CGridCommands::ClearEntry(const CGenGrid* grid)
{
    constexpr GridAction action = GridAction::Clear;
    return {FirstCommand + int(action), TextFor(action, grid), KeyOf(action), TextOf(action)};
}

QString CGridCommands::TextFor(GridAction action, const CGenGrid* grid)
{
    if (action == GridAction::DeleteLine)
        return DeleteText(grid, MenuText(action));
    if (action != GridAction::Clear || !grid || !CanRun(action, *grid))
        return MenuText(action);
    const auto block = grid->SelectedBlock();
    const auto cells = block ? std::size_t(block->height()) * std::size_t(block->width()) : 1;
    return GridTexts::Counted(cells, GridTexts::tr("Clear the Cell"), GridTexts::tr("Clear %1 Cells"));
}

QString CGridCommands::DeleteText(const CGenGrid* grid, const QString& otherwise)
{
    if (!grid || !grid->HasLinesToDelete())
        return otherwise;
    const CGridModel& model = *grid->Model();
    const auto lines = grid->Selection().Lines(model.FixedRows());
    const int count = std::min(lines->bottom() + 1, model.StoredRows()) - lines->top();
    return count <= 0 ? otherwise
                      : GridTexts::Counted(std::size_t(count), GridTexts::tr("&Delete the Line"),
                                           GridTexts::tr("&Delete %1 Lines"));
}

bool CGridCommands::Knows(int command)
{
    return Knows(ActionOf(command));
}

bool CGridCommands::Knows(GridAction action)
{
    return IsOfLines(action) || IsOfCells(action) || IsOfClipboard(action);
}

bool CGridCommands::CanRun(int command, const CGenGrid* grid)
{
    return grid && CanRun(ActionOf(command), *grid);
}

bool CGridCommands::CanRun(GridAction action, const CGenGrid& grid)
{
    if (action == GridAction::CopyWithHeaders)
        return CanCopyCells(grid);
    if (action == GridAction::PasteWithPreview)
        return CanPasteCells(grid) && !grid.Model()->Document()->IsReadOnly();
    return IsOfLines(action) ? CanRunOnLines(grid, action) : IsOfCells(action) && CanRunOnCells(grid, action);
}

void CGridCommands::Run(int command, CGenGrid& grid)
{
    Run(ActionOf(command), grid);
}

void CGridCommands::Run(GridAction action, CGenGrid& grid)
{
    if (action == GridAction::CopyWithHeaders)
        CopyCellsWithHeaders(grid);
    else if (action == GridAction::PasteWithPreview)
        PasteCellsWithPreview(grid);
    else if (CanRun(action, grid))
        IsOfLines(action) ? RunOnLines(grid, action) : RunOnCells(grid, action);
    else if (grid.MayChange() && grid.Model()->Rows())
        if (const QString why = WhyNot(action, grid); !why.isEmpty())
            grid.Model()->Document()->Say(why);
}

/// A key that does nothing says why: whoever pressed it would look for what it did.
QString CGridCommands::WhyNot(GridAction action, const CGenGrid& grid)
{
    const CGridModel& model = *grid.Model();
    switch (action) {
    case GridAction::FillDown:
        return GridTexts::tr("Nothing stands above the first line that could be filled down.");
    case GridAction::FillSeries:
    case GridAction::Interpolate:
        return GridTexts::tr("Numbers in two lines or more have to be selected first.");
    case GridAction::Calculate:
        return GridTexts::tr("There is no number among the selected cells.");
    case GridAction::ResetToGlobal:
        return GridTexts::tr("No global value stands for this column.");
    case GridAction::RevertToSaved:
        return GridTexts::tr("Nothing here differs from the last save.");
    case GridAction::MoveUp:
    case GridAction::MoveDown:
        if (!model.Rows()->MayMove())
            return GridTexts::tr("The lines of this table stand in an order of their own.");
        return action == GridAction::MoveUp ? GridTexts::tr("The first line cannot go up.")
                                            : GridTexts::tr("The last line cannot go down.");
    default:
        return IsOfLines(action) && !grid.MayGrow() ? GridTexts::tr("Lines cannot be added to this table.") : QString();
    }
}
