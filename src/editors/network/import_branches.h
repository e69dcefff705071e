// Branches made of the lines of a GIS file, and what became of each line.
#pragma once

#include "editors/network/gis_lines.h"
#include "editors/network/network.h"

/// Which fields of a layer say what; -1 for none.
struct CImportFields
{
    int name = -1;
    int start = -1, end = -1; // chainages in metres; without them from 0, and on by the length of the line
};

/// What becomes of a line whose parts do not meet.
enum class CImportParts
{
    Branches,       // a branch each, from 0 to its length
    ShareChainages, // a branch each, with its share of the line's chainages in proportion to the lengths
    LeaveOut
};

struct CImportOptions
{
    CImportFields fields{};
    CImportParts parts = CImportParts::Branches;
    bool unnamed = true; // lines without a name are taken, and numbered
};

struct CImportPlan
{
    std::vector<CNetworkBranch> branches;
    QStringList leftOut, changed; // for the user: the line with its number in the file, and what happened to it
};

/// Whether this build can import.
bool CanImport();
/// The library that reads GIS files; null, with the reason, when it could not be loaded.
const CGisLibrary* GisLibrary(QString& reason);
/// What a geometry is, in the words of the user.
QString GeometryText(const QString& geometry);
/// A length or a chainage in the user's unit.
QString LengthText(double metres);
/// Fields that look as if they had a branch's name and chainages.
CImportFields ProposeFields(const CGisLayer& layer);
/// The branches that the lines of `layer` become, where `map` has them. Names that are missing or taken, in `network`
/// or before in the layer, get a number. Whatever is not as in the file is noted.
CImportPlan PlanImport(const CGisLayer& layer, const CGisMap& map, const CImportOptions& options,
                       const CNetwork& network);
