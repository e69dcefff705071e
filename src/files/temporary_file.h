// A file under a name of its own until it is whole, and what killed programs have left of such files.
#pragma once

#include "files/platform_file.h"

#include <chrono>
#include <string>
#include <string_view>

/// Created for the user alone under a name that nobody can guess, locked while it is open, and removed with this
/// object unless it was released.
class TemporaryFile
{
public:
    explicit TemporaryFile(PlatformFile& platform) : m_platform(platform) {}
    ~TemporaryFile();
    TemporaryFile(const TemporaryFile&) = delete;
    TemporaryFile& operator=(const TemporaryFile&) = delete;

    std::error_code Create(const std::filesystem::path& folder);
    std::error_code Write(std::string_view text);
    /// Waits for the medium if asked to, and closes.
    std::error_code Finish(bool sync);

    /// Before what stands under the temporary name is swapped for somebody's file: gives it a name by which nobody
    /// takes it for left over, however this program ends meanwhile and whatever fails.
    std::error_code Protect();
    /// It is this object's again.
    void Unprotect();
    /// Moves what stands under the temporary name to the first of PATH.WHY-1, -2, ... that is free; where that is
    /// longer than names may be, of kvr.WHY-1, ... in the same folder.
    std::error_code KeepAs(const std::filesystem::path& path, std::string_view why, std::filesystem::path& kept);
    /// What stands under the temporary name is no longer this object's.
    void Release() { m_path.clear(); }

    PlatformFile::Handle Handle() const { return m_file; }
    const std::filesystem::path& Path() const { return m_path; }

private:
    std::error_code Close();
    std::error_code EndNameWith(std::string_view suffix);

    PlatformFile& m_platform;
    std::filesystem::path m_path;
    PlatformFile::Handle m_file = 0;
    bool m_isOpen = false;
};

/// Removes temporary files that programs of this user have left in a folder: those of that name that nobody has open
/// and nobody has touched for an hour. What is protected stays, and what cannot be removed.
void RemoveLeftOvers(PlatformFile& platform, const std::filesystem::path& folder);

std::error_code WriteAll(PlatformFile& platform, PlatformFile::Handle file, std::string_view text);

/// How long ago a time of a FileStatus was.
std::chrono::nanoseconds TimeSince(std::int64_t time);

/// PATH.WHY-NUMBER
std::filesystem::path NumberedName(const std::filesystem::path& path, std::string_view why, int number);
