// Which names of the editors mean one branch of the river network.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

/// The key of a name (files/branch_key.h), as the editors' texts are.
KS_API CString KsBranchKey(const CString& name);
/// Whether two names mean one branch.
KS_API bool KsSameBranch(const CString& a, const CString& b);
