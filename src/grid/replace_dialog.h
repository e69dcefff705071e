// "Find and Replace": what is looked for, where, and what it becomes, with the first cells before anything changes.
#pragma once

class CGenGrid;

/// Everything found is replaced in one step to undo, or cell by cell.
void FindAndReplace(CGenGrid& grid);
