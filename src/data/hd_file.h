// HD parameter files on disk: reading one whole, writing one whole.
#pragma once

#include "data/hd_parameters.h"
#include "files/structure.h"

/// Reads a file into fresh parameters. A file without the target "KAVO0_HD" gives the defaults.
Result<HD_Parameters> LoadHDFile(const std::string& path);

/// The file's text.
std::string HDFileText(const HD_Parameters& parameters, bool everySet = false);

struct SaveOptions
{
    bool everySet = false; // write encroachment sets that hold no filled line, too
    SafeFileOptions file{};
};
Result<WriteReport> SaveHDFile(const HD_Parameters& parameters, const std::string& path,
                               const SaveOptions& options = {});
