// The commands on the selected lines of a grid, or on the current one.
#pragma once

#include "grid/grid_keys.h"

class CGenGrid;

inline constexpr GridAction LineActions[] = {GridAction::InsertAbove, GridAction::InsertBelow,
                                             GridAction::DuplicateLines, GridAction::MoveLinesUp,
                                             GridAction::MoveLinesDown};

bool CanRunOnLines(const CGenGrid& grid, GridAction action);
/// Makes one step to undo. What cannot be done is said in the status bar.
void RunOnLines(CGenGrid& grid, GridAction action);
