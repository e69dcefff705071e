// The commands on the selected cells of a grid, or on the current one.
#pragma once

#include "grid/cell_results.h"
#include "grid/grid_keys.h"

class CGenGrid;

inline constexpr GridAction CellActions[] = {
    GridAction::FillDown, GridAction::FillSeries,    GridAction::Interpolate,  GridAction::Calculate,
    GridAction::Replace,  GridAction::ResetToGlobal, GridAction::RevertToSaved};

/// Those that empty cells.
inline constexpr GridAction EmptyingActions[] = {GridAction::Cut, GridAction::Clear};

/// What an operation came to becomes one step to undo, which is told by one of the texts: for one cell, and for "%1
/// cells". False when what the rows together do not allow kept it from that: the user has been told.
bool MakeResults(CGenGrid& grid, CCellResults results, const QString& step, const QString& one, const QString& many);

bool CanRunOnCells(const CGenGrid& grid, GridAction action);
/// Asks for what it has to know, and makes one step to undo. Cut takes whole lines out that are selected by their
/// numbers.
void RunOnCells(CGenGrid& grid, GridAction action);
