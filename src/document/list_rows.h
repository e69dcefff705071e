// A record list as the rows of a grid.
#pragma once

#include "grid/row_source.h"

class CGenList;

/// `list` is one of a document's lists.
std::shared_ptr<IRowSource> MakeListRows(CGenList& list);

/// The same behind one fixed row, whose object is `globals`: something else than a record, which the columns know.
std::shared_ptr<IRowSource> MakeGlobalAndListRows(CGenList& list, void* globals);
