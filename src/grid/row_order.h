// The rows of a table in the order of their values.
#pragma once

#include "grid/column_spec.h"
#include "grid/shown_rows.h"

struct SortKey
{
    int column;
    bool descending = false;
    friend bool operator==(const SortKey&, const SortKey&) = default;
};

/// All rows of the source, by the first key, where that is the same by the second, and so on; else as they stand. Fixed
/// rows stay first, and what is empty comes last in both directions.
SourceRows SortedRows(IRowSource& rows, const std::vector<ColumnSpec>& columns, const std::vector<SortKey>& keys);
