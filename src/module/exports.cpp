// The functions that the shell calls.
#include "module/kavo0_hd.h"

KS_SINGLE_EDITOR(HDEditor)
