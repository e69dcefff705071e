// The functions that the shell calls.
#include "editors/network/module.h"

KS_SINGLE_EDITOR(NetworkEditor)
