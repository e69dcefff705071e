// The names of branches that an editor offers the project.
#pragma once

#include "ks/fc/package.h"

#include <QStringList>

/// Appends the branches that no other editor has named yet, as CKvrCBEText.
void AppendBranchNames(const QStringList& branches, CObList& objects);
