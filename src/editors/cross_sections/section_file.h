// Cross-section files (.kvxs): see docs/cross_sections.md.
#pragma once

#include "editors/cross_sections/section.h"
#include "files/declared_section.h"

/// The sections of a loaded file, sorted by place. What is not in order is reported, with what they have instead.
CCrossSections LoadCrossSections(tqlHandle structure, LoadReport& report);
/// How such a file is declared.
const DeclaredSection& DeclaredSectionFile();
