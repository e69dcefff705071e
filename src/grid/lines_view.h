// The commands that sort and filter the lines of a grid, for menus, keys and the headers.
#pragma once

#include "ks/fc/frames.h"

class CGenGrid;
class QMenu;
enum class GridAction;

/// Numbered behind those of grid/grid_search.h and the pages.
namespace Command {
inline constexpr int SortAscending = 42610;
inline constexpr int SortDescending = 42611;
inline constexpr int SortByPlace = 42612; // branch, then chainage
inline constexpr int FileOrder = 42613;
inline constexpr int KeepOrder = 42614;
inline constexpr int ShowAfresh = 42615;
inline constexpr int Filter = 42616;
inline constexpr int ShowAllLines = 42617;
} // namespace Command

namespace LinesView {
/// The menu entries of these commands.
std::vector<CKsMenuCommand> MenuCommands();
bool Knows(int command);
/// Null is for no grid.
bool CanRun(int command, const CGenGrid* grid);
/// Takes what is being typed first. Sorts and filters by the current column.
void Run(int command, CGenGrid& grid);
/// The command of a key; 0 for none.
int CommandOf(GridAction action);
/// A double click on a header: sorts by the column, and the other way round when it is sorted by it.
void SortByClick(CGenGrid& grid, int column);
/// The commands for a column, in the menu of its header or its cells.
void AddTo(QMenu& menu, CGenGrid& grid, int column);
} // namespace LinesView
