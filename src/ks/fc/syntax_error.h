// What is wrong with a parameter file, in the user's language.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

struct TqlSyntaxError;

/// "river.hdkv, line 812, column 14: expected [/InitList], found [/WindList]", or why the file cannot be read; empty
/// when nothing is wrong.
KS_API CString KsSyntaxErrorText(const TqlSyntaxError& error);
