// The commands on the selected cells of a grid, or on the current one.
#pragma once

#include "grid/grid_keys.h"
#include "ks/fc/frames.h"

#include <vector>

class CGenGrid;

inline constexpr GridAction CellActions[] = {GridAction::FillDown, GridAction::FillSeries, GridAction::Interpolate,
                                             GridAction::Calculate, GridAction::Replace};

bool CanRunOnCells(const CGenGrid& grid, GridAction action);
/// Asks for what it has to know, and makes one step to undo.
void RunOnCells(CGenGrid& grid, GridAction action);

/// As commands of a view.
class CCellCommands
{
public:
    static std::vector<CKsMenuCommand> MenuCommands();
    static bool Knows(int command);
    /// `grid` is the one that the user means; null for none.
    static bool CanRun(int command, const CGenGrid* grid);
    static void Run(int command, CGenGrid& grid);
};
