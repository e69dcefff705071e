// Cells that hold what is looked for, and what they become: texts, numbers and ranges of numbers.
#pragma once

#include "grid/cell_results.h"

#include <functional>

struct ReplaceQuery
{
    /// A text; of numbers what a filter may say (CCellFilter), as 5, >3 or 2..5; "" for empty cells.
    QString find;
    /// A text or a value; for numbers also a formula, "=value*1.1", which leaves other cells alone.
    QString with{};
    bool isWholeCell = false, isCaseSensitive = false; // of texts

    bool IsFormula() const { return with.trimmed().startsWith(u'='); }
};

/// Tells which cells of a column are meant; `column` outlives it. Null where none can be.
std::function<bool(const CellValue& value)> CellFinder(const ColumnSpec& column, const ReplaceQuery& query);

struct CReplaced
{
    CCellResults results;
    std::size_t found = 0;
};
/// Changes nothing; see cell_operations.h.
CReplaced ReplaceCells(const CTableRows& rows, const CellBlock& block, const ReplaceQuery& query);
