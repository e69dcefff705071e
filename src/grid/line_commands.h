// The commands on the selected lines of a grid, or on the current one.
#pragma once

#include "grid/grid_keys.h"

class CGenGrid;

inline constexpr GridAction LineActions[] = {GridAction::InsertAbove, GridAction::InsertBelow, GridAction::Duplicate,
                                             GridAction::MoveUp,      GridAction::MoveDown,    GridAction::InsertAlong};

/// A grid that is sorted can be asked to move lines: it says why it does not.
bool CanRunOnLines(const CGenGrid& grid, GridAction action);
/// One step to undo.
void RunOnLines(CGenGrid& grid, GridAction action);
