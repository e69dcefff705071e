#include "grid/line_origin.h"

bool IsLineOf(const KsTracedLine& line, const IRowSource& rows)
{
    if (rows.StaysInMemory() == line.isNamedByPlace)
        return false;
    if (rows.StaysInMemory())
        return rows.Data() == line.data;
    return rows.List() == line.list && rows.ListRow(0) == line.placeInList;
}
