// Cells of a grid on the clipboard, as a table (table_text.h).
#pragma once

#include "grid/grid_keys.h"

class CGenGrid;

/// Those that the Edit menu does not have anyway.
inline constexpr GridAction ClipboardActions[] = {GridAction::CopyWithHeaders, GridAction::PasteWithPreview};

bool CanCopyCells(const CGenGrid& grid);
/// Puts the selected cells of a grid, or the current one, on the clipboard.
void CopyCells(const CGenGrid& grid);
/// Likewise below a line with the columns' headers and units.
void CopyCellsWithHeaders(const CGenGrid& grid);
bool CanPasteCells(const CGenGrid& grid);
/// Pastes at the selection. What is doubtful - texts that their cells refuse, headers in another order - is shown
/// first, to be decided by the user. False when he thinks better of it; then nothing changed.
bool PasteCells(CGenGrid& grid);
/// Likewise; always shows first what would come of it.
bool PasteCellsWithPreview(CGenGrid& grid);
