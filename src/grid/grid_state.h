// How the user has arranged a grid, for the next time that its document is opened: the widths that he chose, order and
// filter of the lines, and the cell that was current.
#pragma once

#include <QVariantMap>

class CGenGrid;

namespace GridState {
/// Empty for a grid as it comes.
QVariantMap Of(const CGenGrid& grid);
/// Changes nothing in the document. What does not fit the grid is left out: anybody may have written it.
void Restore(CGenGrid& grid, const QVariantMap& state);
} // namespace GridState
