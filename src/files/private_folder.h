// Folders and files that belong to the user alone.
#pragma once

#include "base/result.h"

#include <cstdint>
#include <cstdio>
#include <memory>
#include <string>

/// Makes a folder, and those above it that are missing, for nobody but the user. An error where it stands already and
/// is somebody else's, or no folder.
Result<void> MakePrivateFolder(const std::string& path);

struct PrivateFile
{
    struct Close
    {
        void operator()(std::FILE* file) const { std::fclose(file); }
    };
    std::unique_ptr<std::FILE, Close> stream;
    std::uintmax_t size = 0;
};
/// Opens an ordinary file of the user's own for reading: no link to another, nothing that would wait or never end.
Result<PrivateFile> OpenPrivateFile(const std::string& path);
