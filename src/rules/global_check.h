// The global values, checked: each by itself, and what they have to do with one another.
#pragma once

#include "data/global_var.h"
#include "rules/problem.h"

/// `path`: of the file that holds them, in UTF-8; empty for one that has never been saved.
void CheckGlobals(const HD_Global_Var& global, const std::string& path, CProblems& problems);
