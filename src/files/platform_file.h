// The calls of the operating system behind safe saving and locks, and nothing else: platform_file_posix.cpp and
// platform_file_windows.cpp implement them, tests put failures and a memory that forgets in their place.
#pragma once

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <string_view>
#include <system_error>
#include <vector>

/// What is known of an entry of a folder, or of an open file.
struct FileStatus
{
    enum class Kind
    {
        None, // nothing of that name is there
        File,
        Folder,
        Link,
        Other
    };
    Kind kind = Kind::None;
    bool isMine = false; // the user owns it
    std::uint64_t device = 0, inode = 0, size = 0, links = 0;
    std::int64_t modified = 0; // the content, in nanoseconds since 1970
    std::int64_t touched = 0;  // likewise, or the entry, whichever was later

    bool IsSameFile(const FileStatus& other) const { return device == other.device && inode == other.inode; }
    /// The same file, and nobody has written to it in between as far as can be seen without reading it.
    bool IsUnchanged(const FileStatus& other) const
    {
        return kind == other.kind && IsSameFile(other) && size == other.size && modified == other.modified;
    }
};

/// What of a file another could not be given. What the file never had is not lost.
struct LostMetadata
{
    bool owner = false, group = false, mode = false, accessList = false, attributes = false;
    bool Any() const { return owner || group || mode || accessList || attributes; }
};

class PlatformFile
{
public:
    using Handle = std::intptr_t;
    using Path = std::filesystem::path;

    virtual ~PlatformFile() = default;

    /// A symbolic link itself. That nothing is there is no error; whatever else keeps the answer back is one.
    virtual std::error_code Status(const Path& path, FileStatus& status) = 0;
    virtual std::error_code ReadLink(const Path& path, Path& target);
    /// The names of a folder's entries.
    virtual std::error_code List(const Path& folder, std::vector<Path>& names) = 0;
    /// Whether the user may change an existing file's content.
    virtual std::error_code CheckWritable(const Path& path) = 0;

    enum class Purpose
    {
        Read,
        Change, // what is there stays until it is written over
        Lock    // likewise, and the file is made when it is not there; a symbolic link is refused
    };
    virtual std::error_code Open(const Path& path, Purpose purpose, Handle& file) = 0;
    /// Creates a file that did not exist, for the user alone, and opens it for writing; error file_exists when it does.
    virtual std::error_code Create(const Path& path, Handle& file) = 0;
    virtual std::error_code StatusOf(Handle file, FileStatus& status) = 0;
    /// Reads some of the content and says how much; 0 at its end.
    virtual std::error_code Read(Handle file, char* buffer, std::size_t size, std::size_t& read) = 0;
    /// Writes some of the text and says how much; more than 0 unless there is an error.
    virtual std::error_code Write(Handle file, std::string_view text, std::size_t& written) = 0;
    /// Makes the content that long.
    virtual std::error_code Cut(Handle file, std::uint64_t size) = 0;
    /// Keeps others from locking the file until it is closed, be it by the end of the process. Error
    /// resource_unavailable_try_again when another has it locked; any other: the file takes no locks.
    virtual std::error_code Lock(Handle file) = 0;
    /// Gives the open file the owner, the group, the mode, the access control list and the extended attributes of
    /// another, as far as the user and the file system may, and says what not.
    virtual std::error_code TakePermissions(Handle file, const Path& from, LostMetadata& lost) = 0;
    /// Gives the open file what the folder and the user let a new file have.
    virtual std::error_code TakeNewPermissions(Handle file, const Path& folder) = 0;
    /// Waits until the content is on the medium.
    virtual std::error_code Sync(Handle file) = 0;
    /// Closes in any case; an error means that written content may be lost.
    virtual std::error_code Close(Handle file) = 0;

    /// Swaps two existing entries of a folder in one step; error function_not_supported where there is no such step.
    virtual std::error_code Exchange(const Path& a, const Path& b) = 0;
    /// Puts `from` in the place of `to` in one step. Should that fail half way, with `to` gone, `from` is still there.
    virtual std::error_code Replace(const Path& from, const Path& to) = 0;
    /// Renames an entry of a folder, a symbolic link itself, over `to` if that exists.
    virtual std::error_code Rename(const Path& from, const Path& to) = 0;
    /// Renames an entry to a name that nobody has; error file_exists when somebody does.
    virtual std::error_code RenameNew(const Path& from, const Path& to) = 0;
    virtual std::error_code Remove(const Path& path) = 0;
    /// Waits until the folder's entries are on the medium.
    virtual std::error_code SyncFolder(const Path& folder) = 0;

    static PlatformFile& Native();
};
