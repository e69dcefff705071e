// The commands on the lines and cells of a grid, for keys and menus.
#pragma once

#include "grid/grid_keys.h"
#include "ks/fc/frames.h"

#include <vector>

class CGenGrid;

namespace GridCommands {
std::vector<GridAction> OnLines();
std::vector<GridAction> OnCells();

bool Knows(GridAction action);
bool CanRun(GridAction action, const CGenGrid& grid);
/// Whether it says itself what keeps it from running.
bool SaysWhyNot(GridAction action);
void Run(GridAction action, CGenGrid& grid);

// As commands of a view. Null is for no grid.
std::vector<CKsMenuCommand> MenuCommands(const std::vector<GridAction>& actions);
bool Knows(int command);
bool CanRun(int command, const CGenGrid* grid);
void Run(int command, CGenGrid& grid);
} // namespace GridCommands
