// Sections and keywords that no table of this version knows: a newer version's, another tool's. Each holder of a known
// section keeps what it found there beside its own and writes it back behind it.
#pragma once

#include "tql/tql.h"

#include <functional>
#include <string>
#include <string_view>
#include <vector>

class LoadReport;

struct UnknownNode
{
    std::string Name;
    bool IsSection = false;
    std::string Params;                // of a keyword, in file notation
    std::vector<UnknownNode> Children; // of a section: keywords, then sections

    bool operator==(const UnknownNode&) const = default;
};
using UnknownNodes = std::vector<UnknownNode>;

/// How many occurrences of a name the reader of a section takes for itself.
enum class Known
{
    No,
    First,
    Every
};
using KnownNames = std::function<Known(std::string_view name, bool isSection)>;

/// Appends copies of the section's direct children that its reader does not take, keywords and then sections, with
/// everything in them, and reports them.
void CollectUnknown(tqlHandle section, const KnownNames& known, UnknownNodes& nodes, LoadReport* report = nullptr);
/// Writes the nodes into the section being written, or as targets.
void WriteUnknown(tqlHandle structure, const UnknownNodes& nodes);
void WriteUnknownTargets(tqlHandle structure, const UnknownNodes& nodes);

/// What stands in the target beside the known sections, and beside the target.
struct UnknownContent
{
    UnknownNodes InTarget;
    UnknownNodes Targets;

    void Clear() { *this = {}; }
};
