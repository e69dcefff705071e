// Cross-section files (.kvxs): see docs/cross_sections.md.
#pragma once

#include "editors/cross_sections/section.h"
#include "files/finding.h"
#include "files/safe_file.h"

/// The sections of a loaded file, sorted by place. What is not in order is reported, with what they have instead.
CCrossSections LoadCrossSections(tqlHandle structure, LoadReport& report);
/// Puts the sections into the place of a file (safe_file.h).
Result<WriteReport> SaveCrossSections(const CCrossSections& sections, const std::string& path,
                                      const SafeFileOptions& options = {});
/// The text of that file.
Result<std::string> CrossSectionsText(const CCrossSections& sections);
