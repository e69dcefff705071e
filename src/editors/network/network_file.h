// River network files (.kvnw): see docs/network.md.
#pragma once

#include "editors/network/network.h"
#include "files/finding.h"
#include "files/safe_file.h"

/// The network of a loaded file. What is not in order is reported, with what the network has instead.
CNetwork LoadNetwork(tqlHandle structure, LoadReport& report);
/// Puts the network into the place of a file (safe_file.h).
Result<WriteReport> SaveNetwork(const CNetwork& network, const std::string& path,
                                const SafeFileOptions& options = {});
/// The text of that file.
Result<std::string> NetworkText(const CNetwork& network);
