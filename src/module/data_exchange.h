// Requests of other editors that name a document instead of a view.
#pragma once

#include "module/data_items.h"

#include "ks/fc/types.h"

class CKsDoc;

using MakeItems = std::unique_ptr<CObList> (*)(HD_Parameters& parameters);

/// Items of `document` when it is one of this editor's, as it is stored there: what is being typed goes on undisturbed
/// and is told when it is stored. Otherwise those of the file `path`, as it was last saved. Null, with a line in the
/// debug log, when there is neither.
std::unique_ptr<CObList> ItemsOf(const CString& path, CKsDoc* document, MakeItems make);
