// The functions that the shell calls.
#include "editors/cross_sections/module.h"

KS_SINGLE_EDITOR(CrossSectionEditor)
