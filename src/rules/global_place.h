// Where a global value stands in its file.
#pragma once

#include "data/global_var.h"
#include "rules/problem.h"

/// Of a member of the global values that is declared.
ProblemPlace GlobalPlace(const HD_Global_Var& global, const void* member);
/// Of a field of an element, where the member is a group.
ProblemPlace GlobalPlace(const HD_Global_Var& global, const void* member, const Field& field, std::size_t element);
