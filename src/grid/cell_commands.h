// The commands on the selected cells of a grid, or on the current one.
#pragma once

#include "grid/grid_keys.h"

class CGenGrid;

inline constexpr GridAction CellActions[] = {
    GridAction::FillDown, GridAction::FillSeries,    GridAction::Interpolate,  GridAction::Calculate,
    GridAction::Replace,  GridAction::ResetToGlobal, GridAction::RevertToSaved};

/// Those that empty cells.
inline constexpr GridAction EmptyingActions[] = {GridAction::Cut, GridAction::Clear};

bool CanRunOnCells(const CGenGrid& grid, GridAction action);
/// Asks for what it has to know, and makes one step to undo. Cut takes whole lines out that are selected by their
/// numbers.
void RunOnCells(CGenGrid& grid, GridAction action);
