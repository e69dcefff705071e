// The menus of a grid: on its cells, on the numbers of its lines and on the headers of its columns.
#pragma once

class CGenGrid;
class QMenu;
enum class GridAction;

namespace GridMenus {
void AddForCells(QMenu& menu, CGenGrid& grid);
void AddForLines(QMenu& menu, CGenGrid& grid);
void AddForColumn(QMenu& menu, CGenGrid& grid, int column);
} // namespace GridMenus
