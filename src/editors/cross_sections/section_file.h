// Cross-section files (.kvxs): see docs/cross_sections.md.
#pragma once

#include "editors/cross_sections/section.h"

/// Reads a file; the sections come sorted by place. The reason, for the user and with the line, when that failed and
/// `sections` is untouched; otherwise empty.
QString ReadCrossSections(const QString& path, CCrossSections& sections);
/// Writes a file; the old content stays until the new one is complete. The reason when that failed, otherwise empty.
QString WriteCrossSections(const QString& path, const CCrossSections& sections);
