// River network files (.kvnw): see docs/network.md.
#pragma once

#include "editors/network/network.h"

/// Reads a file. The reason, for the user and with the line, when that failed and `network` is untouched; otherwise
/// empty.
QString ReadNetwork(const QString& path, CNetwork& network);
/// Writes a file; the old content stays until the new one is complete. The reason when that failed, otherwise empty.
QString WriteNetwork(const QString& path, const CNetwork& network);
