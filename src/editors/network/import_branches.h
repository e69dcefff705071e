// Branches made of the lines of a GIS file.
#pragma once

#include "editors/network/gis_lines.h"
#include "editors/network/network.h"

/// Which fields of a layer say what; -1 for none.
struct CImportFields
{
    int name = -1;
    int start = -1, end = -1; // chainages in metres; without them from 0 to the length of the line
};

/// Whether this build can import.
bool CanImport();
/// Reads a file with the library for it; a missing library is an error like any other.
CGisFile ReadGisFile(const QString& path);
/// Fields that look as if they had a branch's name and chainages.
CImportFields ProposeFields(const CGisLayer& layer);
/// A branch a line. Names that are missing or taken, in `network` or before in the layer, get a number; chainages that
/// are no two different numbers count as missing. `notes` says so, a line each.
std::vector<CNetworkBranch> MakeBranches(const CGisLayer& layer, const CImportFields& fields, const CNetwork& network,
                                         QStringList& notes);
