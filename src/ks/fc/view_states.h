// How the user had arranged the views of his files when he left them: kept in his settings, never in a file.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QVariantMap>

namespace KsViewStates {
/// Of the file, whichever of its paths is given; empty when nothing is known of it. What stands in settings may be
/// damaged: whoever reads it takes what he can.
KS_API QVariantMap Of(const CString& path);
/// Forgets the file that was left the longest ago when there are many. A document without a path is nothing to keep.
KS_API void Keep(const CString& path, const QVariantMap& state);
} // namespace KsViewStates
