// Cells that come from outside of a table, read already: where they go, and what they will hold.
#pragma once

#include "grid/cell_changes.h"

struct PastedCells
{
    struct Column
    {
        int column;               // of the table
        CCellValues values;       // one for each row
        std::vector<bool> left{}; // cells that stay as they are; empty where none does
        bool Leaves(std::size_t row) const { return !left.empty() && left[row]; }
    };
    std::vector<std::size_t> rows; // of the source; those from its count on are new, in their order, none left out
    std::vector<Column> columns;
};
