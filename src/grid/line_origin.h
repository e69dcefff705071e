// What steps on the rows of a source mean to a line that is followed back to the last save.
#pragma once

#include "grid/row_source.h"
#include "ks/fc/unsaved_changes.h"

/// Whether the line stands in this source, or did at the moment it has been followed to.
bool IsLineOf(const KsTracedLine& line, const IRowSource& rows);

/// The row of the source where the line stands.
inline std::size_t RowOf(const KsTracedLine& line, const IRowSource& rows)
{
    return line.place + rows.FixedRows();
}

/// A line in `row`, or the one that it belongs to, stood in another row before: in the one that `rowBefore` knows;
/// where it knows none the line was not there.
template <typename RowBefore>
void CarryBack(KsTracedLine& line, std::size_t& place, std::size_t fixedRows, const RowBefore& rowBefore)
{
    if (const std::optional<std::size_t> before = rowBefore(place + fixedRows))
        place = *before - fixedRows;
    else
        line.origin = KsLineOrigin::New;
}

/// The same for every line that rows which come, go or move in the source mean something to.
template <typename RowBefore>
void CarryBack(KsTracedLine& line, const IRowSource& rows, const RowBefore& rowBefore)
{
    if (rows.MovesContentOf(line.data))
        line.origin = KsLineOrigin::Unknown;
    else if (IsLineOf(line, rows))
        CarryBack(line, line.place, rows.FixedRows(), rowBefore);
    else if (line.list && line.list == rows.Data())
        CarryBack(line, line.placeInList, rows.FixedRows(), rowBefore);
}
