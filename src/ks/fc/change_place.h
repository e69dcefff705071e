// Where a change of the document shows.
#pragma once

/// Names what changed by its address, and the cell of it; rows and columns count from 1, as in the grid that shows it.
struct ChangePlace
{
    const void* data = nullptr; // a list, a table or a single value; null for nothing that a view shows
    int row = 0, column = 0;    // of a list or a table
    const void* list = nullptr; // the list itself, or the one whose line `listRow` the table is part of
    int listRow = 0;
    bool isGone = false; // what changed is no more; this is where it was
};
