// What differs between two parameter files, value by value.
#pragma once

#include "tql/tql.h"

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

struct Difference
{
    enum Kind
    {
        Changed,
        Added,
        Removed
    };
    Kind kind = Changed;
    /// Names of the sections around it, the outermost first, without the file's target; of several of a name with
    /// number: "Branch 2 / Line".
    std::string section{};
    std::string keyword{};         // empty for a whole section, which `section` names
    std::size_t number = 0;        // which of the section's keywords of that name, from 1
    std::size_t line = 0;          // of the file where it stands: of the first for what was removed, else of the second
    int parameter = 0;             // from 1; 0 for a whole line, or a section
    std::string before{}, after{}; // in file notation, but nothing for a number that is not given
                                   // (base/not_given.h); of a section how many lines it has
};

struct Differences
{
    std::vector<Difference> list;                    // in file order, the first of them
    std::size_t changed = 0, added = 0, removed = 0; // all: values, lines and lines
    std::size_t sections = 0;                        // in which they are
    bool areMore = false;                            // than the list has

    bool IsEmpty() const { return changed + added + removed == 0; }
};

/// Compares what two loaded structures say: numbers by value, however they are written. Lines are told to be another
/// line's successor by what stands around them, so that a line put in is one difference. `most`: how many are listed.
Differences FindDifferences(tqlHandle before, tqlHandle after, std::size_t most = 1000);
/// Likewise of two texts; nothing when one of them is no parameter file.
std::optional<Differences> FindDifferences(std::string before, std::string after);
