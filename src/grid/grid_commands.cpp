#include "grid/grid_commands.h"

#include "grid/cell_commands.h"
#include "grid/line_commands.h"

#include <algorithm>
#include <iterator>

namespace {

constexpr int FirstCommand = 42640; // of the menu; the actions follow

constexpr int CommandOf(GridAction action)
{
    return FirstCommand + int(action);
}

constexpr GridAction ActionOf(int command)
{
    return GridAction(command - FirstCommand);
}

bool IsOnLines(GridAction action)
{
    return std::ranges::find(LineActions, action) != std::end(LineActions);
}

bool IsOnCells(GridAction action)
{
    return std::ranges::find(CellActions, action) != std::end(CellActions);
}

} // namespace

std::vector<GridAction> GridCommands::OnLines()
{
    return {std::begin(LineActions), std::end(LineActions)};
}

std::vector<GridAction> GridCommands::OnCells()
{
    return {std::begin(CellActions), std::end(CellActions)};
}

bool GridCommands::Knows(GridAction action)
{
    return IsOnLines(action) || IsOnCells(action);
}

bool GridCommands::SaysWhyNot(GridAction action)
{
    return IsOnLines(action);
}

bool GridCommands::CanRun(GridAction action, const CGenGrid& grid)
{
    return IsOnLines(action) ? CanRunOnLines(grid, action) : IsOnCells(action) && CanRunOnCells(grid, action);
}

void GridCommands::Run(GridAction action, CGenGrid& grid)
{
    IsOnLines(action) ? RunOnLines(grid, action) : RunOnCells(grid, action);
}

std::vector<CKsMenuCommand> GridCommands::MenuCommands(const std::vector<GridAction>& actions)
{
    std::vector<CKsMenuCommand> commands;
    for (const GridAction action : actions)
        commands.push_back({CommandOf(action), MenuText(action), KeyOf(action), TextOf(action)});
    return commands;
}

bool GridCommands::Knows(int command)
{
    return command >= FirstCommand && command < CommandOf(GridAction::None) && Knows(ActionOf(command));
}

bool GridCommands::CanRun(int command, const CGenGrid* grid)
{
    return Knows(command) && grid && CanRun(ActionOf(command), *grid);
}

void GridCommands::Run(int command, CGenGrid& grid)
{
    Run(ActionOf(command), grid);
}
