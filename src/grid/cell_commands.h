// The commands on the selected cells of a grid, or on the current one.
#pragma once

#include "grid/grid_keys.h"

class CGenGrid;

inline constexpr GridAction CellActions[] = {GridAction::FillDown, GridAction::FillSeries, GridAction::Interpolate,
                                             GridAction::Calculate, GridAction::ResetToGlobal};

bool CanRunOnCells(const CGenGrid& grid, GridAction action);
/// Empties the cells, as one who types nothing into each does.
void ClearCells(CGenGrid& grid, const QString& step);
/// Asks for what it has to know, and makes one step to undo.
void RunOnCells(CGenGrid& grid, GridAction action);
