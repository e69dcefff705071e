// A file under a name of its own until it is whole, and what killed programs have left of such files.
#pragma once

#include "files/file_content.h"

#include <chrono>
#include <string>
#include <string_view>
#include <vector>

/// What may stand under a protected name: the content that a save was about to put in the place of a file, the one that
/// it meant to replace, or what somebody else wrote to that file at the last moment.
struct ProtectedAs
{
    std::filesystem::path target;
    FileVersion replacement{}, replaced{}; // what is not known is 0
};

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
    /// takes it for left over, however this program ends meanwhile and whatever fails. The name says what of.
    std::error_code Protect(const ProtectedAs& what);
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
    std::error_code MoveTo(std::filesystem::path path);

    PlatformFile& m_platform;
    std::filesystem::path m_path, m_created; // where it stands, and where it was made
    PlatformFile::Handle m_file = 0;
    bool m_isOpen = false;
};

/// Removes temporary files that programs of this user have left in a folder: those of that name that nobody has open
/// and nobody has touched for an hour. What is protected stays, and what cannot be removed. `names`: of its entries.
void RemoveLeftOvers(PlatformFile& platform, const std::filesystem::path& folder,
                     const std::vector<std::filesystem::path>& names);
/// What saves of `target` that were cut off have left under protected names. What somebody else wrote gets the name of
/// a displaced version, PATH.displaced-1, ..., and is given back, under the name that it has where it can have no
/// other; the rest is removed. Nobody else may be saving the file.
std::vector<std::filesystem::path> TakeProtected(PlatformFile& platform, const std::filesystem::path& target,
                                                 const std::vector<std::filesystem::path>& names);

std::error_code WriteAll(PlatformFile& platform, PlatformFile::Handle file, std::string_view text);

/// How long ago a time of a FileStatus was.
std::chrono::nanoseconds TimeSince(std::int64_t time);

/// Why a version that somebody else wrote stands beside a file.
inline constexpr std::string_view DisplacedSuffix = "displaced";
/// Why the new content of a file of several names stands beside it.
inline constexpr std::string_view UnfinishedSuffix = "new";
/// PATH.WHY-NUMBER
std::filesystem::path NumberedName(const std::filesystem::path& path, std::string_view why, int number);
