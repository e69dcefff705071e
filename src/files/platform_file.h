// The calls of the operating system behind safe saving, and nothing else: platform_file_posix.cpp and
// platform_file_windows.cpp implement them, tests put failures in their place.
#pragma once

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <string_view>
#include <system_error>

class PlatformFile
{
public:
    using Handle = std::intptr_t;

    virtual ~PlatformFile() = default;

    /// Who may read a file that is created: everybody whom the user lets read new files, or, until it is given the
    /// permissions of another, its owner alone.
    enum class Access
    {
        New,
        OwnerOnly
    };
    /// Creates a file that did not exist and opens it for writing; error file_exists when it does.
    virtual std::error_code Create(const std::filesystem::path& path, Access access, Handle& file) = 0;
    /// Writes some of the text and says how much; more than 0 unless there is an error.
    virtual std::error_code Write(Handle file, std::string_view text, std::size_t& written) = 0;
    /// Gives the open file the mode, the access control list, the extended attributes and, where the user may, the
    /// owner of another.
    virtual std::error_code TakePermissions(Handle file, const std::filesystem::path& from) = 0;
    /// Waits until the content is on the medium.
    virtual std::error_code Sync(Handle file) = 0;
    /// Closes in any case; an error means that written content may be lost.
    virtual std::error_code Close(Handle file) = 0;
    /// Whether the user may change an existing file's content.
    virtual std::error_code CheckWritable(const std::filesystem::path& path) = 0;
    /// Puts `from` in the place of `to` in one step. Should that fail half way, with `to` gone, `from` is still there.
    virtual std::error_code Replace(const std::filesystem::path& from, const std::filesystem::path& to) = 0;
    /// Renames an entry of a folder, a symbolic link itself, over `to` if that exists.
    virtual std::error_code Rename(const std::filesystem::path& from, const std::filesystem::path& to) = 0;
    /// Waits until the folder's entries are on the medium.
    virtual std::error_code SyncFolder(const std::filesystem::path& folder) = 0;

    static PlatformFile& Native();
};
