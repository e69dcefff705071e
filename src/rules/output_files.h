// Files that the simulation writes, and those that it reads.
#pragma once

#include "data/global_var.h"
#include "rules/problem.h"

/// `path`: of the parameter file; other names are relative to its folder.
void CheckOutputFiles(const HD_Global_Var& global, const std::string& path, CProblems& problems);
