// What a file on the disk is, without reading it.
#pragma once

#include "base/utf8_path.h"

#include <cstdint>
#include <string>

/// Whoever writes to a file, or puts another in its place, gives it another stamp.
struct FileStamp
{
    std::uintmax_t size = 0;
    std::filesystem::file_time_type written{};
    bool exists = false;
    bool operator==(const FileStamp&) const = default;

    static FileStamp Of(const std::string& path)
    {
        const std::filesystem::path file = PathFromUtf8(path);
        std::error_code noSize, noTime;
        FileStamp stamp{std::filesystem::file_size(file, noSize), std::filesystem::last_write_time(file, noTime)};
        stamp.exists = !noSize && !noTime;
        return stamp.exists ? stamp : FileStamp();
    }
};
