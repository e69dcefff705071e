// River network files (.kvnw): see docs/network.md.
#pragma once

#include "editors/network/network.h"
#include "files/declared_section.h"

/// The network of a loaded file. What is not in order is reported, with what the network has instead.
CNetwork LoadNetwork(tqlHandle structure, LoadReport& report);
/// How such a file is declared.
const DeclaredSection& DeclaredNetworkFile();
