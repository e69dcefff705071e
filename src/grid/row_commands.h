// Undo steps on the rows of a grid: cells changed, lines inserted, removed and put in order. Each is made at once, on
// the document's undo stack.
#pragma once

#include "grid/cell_changes.h"
#include "ks/fc/doc_command.h"

#include <vector>

/// The place of a row of the source; of the last one for a row past the end.
ChangePlace PlaceOf(const IRowSource& rows, std::size_t row, int column = 1);

/// Puts new lines into a list. The text is that of an insertion unless one is given.
void InsertLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row, std::unique_ptr<IRowBlock> lines,
                 const QString& text = {});
/// Removes lines from a list.
void DeleteLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row, std::size_t count);
/// A line goes to another place. The lines to look at begin at `row`, and then at `rowAfter`.
void MoveLine(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::size_t from, std::size_t to, std::size_t row,
              std::size_t rowAfter);
/// Puts the lines of a list into an order: for each place the row to stand there. The line to look at is the one at
/// `row`.
void ArrangeLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::vector<std::size_t> order, std::size_t row);

/// Changes cells, and nothing but them. `changes` is not empty; `row` (from 0) is where the first of them stands.
void SetCells(CKsDoc& document, std::shared_ptr<IRowSource> rows, CCellChanges changes, std::size_t row);
