// When two names mean one branch of the river network.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <string_view>

/// The capitals that a cell for branch names makes of what is typed. Names with the same capitals are one branch, so
/// this is the key for looking one up.
KS_API CString KsBranchKey(const CString& name);
/// Whether two names mean one branch; spelt alike they are compared without making their keys.
KS_API bool KsSameBranch(const CString& a, const CString& b);
/// Likewise for names as the records hold them, in UTF-8.
KS_API bool KsSameBranch(std::string_view a, std::string_view b);
