// The functions that the shell calls.
#include "editors/network/module.h"
#include "ks/fc/single_editor.h"

KS_SINGLE_EDITOR(NetworkModule)
