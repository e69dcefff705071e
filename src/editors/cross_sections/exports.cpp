// The functions that the shell calls.
#include "editors/cross_sections/module.h"
#include "ks/fc/single_editor.h"

KS_SINGLE_EDITOR(CrossSectionModule)
