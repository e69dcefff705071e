// The locations of the HD documents of the project, and requests about them, in the name of a view. No address outlives
// a call: documents are known by their paths, and their views are asked for anew each time.
#pragma once

#include "editors/network/location_kinds.h"
#include "ks/fc/project_view.h"

namespace LocationSource {

/// Copies the locations of every open HD document of the project, without lines that lack a branch or a chainage; of
/// none when their editor is not there.
std::vector<CMapLocation> Fetch(CKsProjectView& view);
/// Paths of the open HD documents.
QStringList Files(CKsProjectView& view);
/// Asks the location's document to insert or to delete it (KsRequest); nothing when that has been closed.
void Send(CKsProjectView& view, WPARAM request, const CMapLocation& location);
/// Brings the location's line forward in its document, while that is open.
void Show(CKsProjectView& view, const CMapLocation& location);

} // namespace LocationSource
