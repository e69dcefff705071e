// When two names mean one branch of the river network.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

/// A name as a cell for branch names stores what was typed or pasted: in capitals, without blanks around it and without
/// characters that nobody sees (KsWithoutUnseen). Names of which this is the same are one branch, so it is the key
/// for looking one up.
KS_API CString KsBranchKey(const CString& name);
/// Whether two names mean one branch.
KS_API bool KsSameBranch(const CString& a, const CString& b);
