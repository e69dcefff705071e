// A record list as the rows of a grid.
#pragma once

#include "module/row_source.h"

class CKavo0_hdDoc;

/// `list` is one of the document's lists.
std::shared_ptr<IRowSource> MakeListRows(CKavo0_hdDoc& document, CGenList& list);

/// The same behind one fixed row, whose object is `globals`: something else than a record, which the columns know.
std::shared_ptr<IRowSource> MakeGlobalAndListRows(CKavo0_hdDoc& document, CGenList& list, void* globals);
