// The content of files: read whole, told apart, and what is wrong when that fails.
//
// Two notions tell whether a file is what it was. FileVersion is its content, and certain: whether somebody's work
// would be lost is decided by it. FileStatus (platform_file.h) is known without reading: which file stands there, and
// when somebody last had to do with it. It says when the content need not be read again, and nothing more.
#pragma once

#include "base/result.h"
#include "files/platform_file.h"

#include <optional>
#include <string>
#include <string_view>

/// Which content a file had when it was read: enough to see later whether somebody has written another.
struct FileVersion
{
    std::uint64_t size = 0, hash = 0;
    bool operator==(const FileVersion&) const = default;
};
FileVersion VersionOfText(std::string_view text);
/// Of a file, which is read for it. One that is larger than any of the product's, or of another size than `expected`,
/// is another content without being read: then the hash is 0.
std::error_code VersionOfFile(PlatformFile& platform, const std::filesystem::path& path, FileVersion& version,
                              const std::optional<FileVersion>& expected = {});

/// The content of a file, byte for byte.
Result<std::string> ReadWholeFile(const std::string& path, PlatformFile* platform = nullptr);

/// Whether both paths lead to one existing file on the disk. Where a name is meant that a user gave, in whatever case,
/// ask the shell's library (KsSameFile).
std::error_code IsSameFile(PlatformFile& platform, const std::filesystem::path& a, const std::filesystem::path& b,
                           bool& same);
/// Likewise of paths in UTF-8; no where the system does not say.
bool IsSameFile(const std::string& a, const std::string& b);
/// What a chain of symbolic links ends at, and its status, whether it exists or not.
std::error_code FollowLinks(PlatformFile& platform, std::filesystem::path& path, FileStatus& status);
/// The status of what a path (UTF-8) leads to; of kind None also where the system does not say.
FileStatus StatusBehind(const std::string& path);
/// The folder of a path, which may be relative.
std::filesystem::path FolderOf(const std::filesystem::path& path);

/// "Could not write ..." and "Could not read ...", with the system's reason.
Error NotWritten(const std::string& path, std::error_code reason);
Error NotRead(const std::string& path, std::error_code reason);

/// The system's own platform when none is given.
inline PlatformFile& OrNative(PlatformFile* platform)
{
    return platform ? *platform : PlatformFile::Native();
}
