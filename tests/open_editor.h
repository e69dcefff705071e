// The editor that a user has open in a grid.
#pragma once

#include "grid/gen_grid.h"
#include "grid/grid_editors.h"

/// Null where no cell is being edited.
inline QWidget* OpenEditor(const CGenGrid& grid)
{
    return static_cast<CGridDelegate*>(grid.itemDelegate())->Editor();
}
