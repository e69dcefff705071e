#include "files/permissions_posix.h"

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <dirent.h>
#include <fcntl.h>
#include <memory>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

std::error_code LastError()
{
    return {errno, std::generic_category()};
}

std::error_code Outcome(int result)
{
    return result == -1 ? LastError() : std::error_code();
}

/// Calls again when a signal interrupted.
template <typename Call>
auto Retry(Call call)
{
    auto result = call();
    while (result == -1 && errno == EINTR)
        result = call();
    return result;
}

std::int64_t Nanoseconds(const timespec& time)
{
    return std::int64_t(time.tv_sec) * 1'000'000'000 + time.tv_nsec;
}

FileStatus StatusFrom(const struct stat& status)
{
    using Kind = FileStatus::Kind;
#ifdef __APPLE__
    const timespec &modified = status.st_mtimespec, &touched = status.st_ctimespec;
#else
    const timespec &modified = status.st_mtim, &touched = status.st_ctim;
#endif
    return {.kind = S_ISREG(status.st_mode)   ? Kind::File
                    : S_ISDIR(status.st_mode) ? Kind::Folder
                    : S_ISLNK(status.st_mode) ? Kind::Link
                                              : Kind::Other,
            .isMine = status.st_uid == ::geteuid(),
            .device = std::uint64_t(status.st_dev),
            .inode = std::uint64_t(status.st_ino),
            .size = std::uint64_t(status.st_size),
            .links = std::uint64_t(status.st_nlink),
            .modified = Nanoseconds(modified),
            .touched = std::max(Nanoseconds(modified), Nanoseconds(touched))};
}

class PosixFile final : public PlatformFile
{
public:
    std::error_code Status(const Path& path, FileStatus& status) override
    {
        struct stat is;
        status = {};
        if (::lstat(path.c_str(), &is) == -1)
            return errno == ENOENT ? std::error_code() : LastError();
        status = StatusFrom(is);
        return {};
    }

    std::error_code List(const Path& folder, std::vector<Path>& names) override
    {
        // Not the standard library's iterator, which ends the program where there is no memory.
        const std::unique_ptr<DIR, int (*)(DIR*)> entries(::opendir(folder.c_str()), &::closedir);
        if (!entries)
            return LastError();
        errno = 0;
        while (const dirent* entry = ::readdir(entries.get())) {
            const std::string_view name = entry->d_name;
            if (name != "." && name != "..")
                names.emplace_back(name);
            errno = 0;
        }
        return errno ? LastError() : std::error_code();
    }

    std::error_code CheckWritable(const Path& path) override { return Outcome(::access(path.c_str(), W_OK)); }

    std::error_code Open(const Path& path, Purpose purpose, Handle& file) override
    {
        // Without waiting: a pipe under the name of a file must not hold up whoever opens it.
        const int flags = O_CLOEXEC | O_NONBLOCK |
                          (purpose == Purpose::Read     ? O_RDONLY
                           : purpose == Purpose::Change ? O_WRONLY
                                                        : O_RDWR | O_CREAT | O_NOFOLLOW);
        int fd = Retry([&] { return ::open(path.c_str(), flags, 0666); });
        // Others have to read a lock to see whose it is, whatever the user keeps to himself otherwise.
        struct stat is;
        if (fd != -1 && purpose == Purpose::Lock && ::fstat(fd, &is) == 0 && is.st_size == 0 && is.st_nlink == 1 &&
            is.st_uid == ::geteuid())
            ::fchmod(fd, 0644);
        if (fd == -1 && errno == EACCES &&
            purpose == Purpose::Lock) // somebody else's, which can be locked all the same
            fd = Retry([&] { return ::open(path.c_str(), O_CLOEXEC | O_NONBLOCK | O_RDONLY | O_NOFOLLOW); });
        file = fd;
        return Outcome(fd);
    }

    std::error_code Create(const Path& path, Handle& file) override
    {
        const int fd = Retry([&] { return ::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0600); });
        file = fd;
        return Outcome(fd);
    }

    std::error_code StatusOf(Handle file, FileStatus& status) override
    {
        struct stat is;
        if (::fstat(Fd(file), &is) == -1)
            return LastError();
        status = StatusFrom(is);
        return {};
    }

    std::error_code Read(Handle file, char* buffer, std::size_t size, std::size_t& read) override
    {
        const ssize_t count = Retry([&] { return ::read(Fd(file), buffer, size); });
        read = count == -1 ? 0 : std::size_t(count);
        return count == -1 ? LastError() : std::error_code();
    }

    std::error_code Write(Handle file, std::string_view text, std::size_t& written) override
    {
        const ssize_t count = Retry([&] { return ::write(Fd(file), text.data(), text.size()); });
        written = count == -1 ? 0 : std::size_t(count);
        if (count == -1)
            return LastError();
        return count == 0 ? std::make_error_code(std::errc::no_space_on_device) : std::error_code();
    }

    std::error_code Cut(Handle file, std::uint64_t size) override
    {
        return Outcome(Retry([&] { return ::ftruncate(Fd(file), off_t(size)); }));
    }

    std::error_code Lock(Handle file) override
    {
        // Of the open file, not of the process: so that two documents of one program are told apart, and nothing else
        // that the program closes lets it go.
        return Outcome(Retry([&] { return ::flock(Fd(file), LOCK_EX | LOCK_NB); }));
    }

    std::error_code TakePermissions(Handle file, const Path& from, LostMetadata& lost) override
    {
        return TakePermissionsOf(Fd(file), from.c_str(), lost);
    }

    std::error_code TakeNewPermissions(Handle file, const Path& folder) override
    {
        return TakePermissionsOfNewFile(Fd(file), folder.c_str());
    }

    std::error_code Sync(Handle file) override
    {
        return Outcome(Retry([&] { return ::fsync(Fd(file)); }));
    }

    std::error_code Close(Handle file) override
    {
        // After an interrupted close the descriptor is gone on Linux; closing again could hit somebody else's file.
        return ::close(Fd(file)) == -1 && errno != EINTR ? LastError() : std::error_code();
    }

    std::error_code Exchange(const Path& a, const Path& b) override
    {
#ifdef RENAME_EXCHANGE
        if (RenameAs(a, b, RENAME_EXCHANGE) == 0)
            return {};
        if (!IsUnknown(errno))
            return LastError();
#else
        (void)a, (void)b;
#endif
        return std::make_error_code(std::errc::function_not_supported);
    }

    std::error_code Replace(const Path& from, const Path& to) override
    {
        return Outcome(::rename(from.c_str(), to.c_str()));
    }

    std::error_code Rename(const Path& from, const Path& to) override
    {
        return Replace(from, to);
    }

    std::error_code RenameNew(const Path& from, const Path& to) override
    {
#ifdef RENAME_NOREPLACE
        if (RenameAs(from, to, RENAME_NOREPLACE) == 0)
            return {};
        if (!IsUnknown(errno))
            return LastError();
#endif
        // A second name is never given over an existing one either; a file system without such is asked before.
        if (::link(from.c_str(), to.c_str()) == 0) {
            const std::error_code error = Remove(from);
            if (error)
                ::unlink(to.c_str());
            return error;
        }
        if (errno == EEXIST)
            return LastError();
        FileStatus status;
        if (const std::error_code error = Status(to, status))
            return error;
        return status.kind == FileStatus::Kind::None ? Replace(from, to) : std::make_error_code(std::errc::file_exists);
    }

    std::error_code Remove(const Path& path) override
    {
        return Outcome(::unlink(path.c_str()));
    }

    std::error_code SyncFolder(const Path& folder) override
    {
        const int fd = Retry([&] { return ::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC); });
        if (fd == -1)
            return LastError();
        const std::error_code error = Sync(fd);
        ::close(fd);
        return error;
    }

private:
    static int Fd(Handle file)
    {
        return int(file);
    }
#ifdef RENAME_NOREPLACE
    static int RenameAs(const Path& from, const Path& to, unsigned how)
    {
        return ::renameat2(AT_FDCWD, from.c_str(), AT_FDCWD, to.c_str(), how);
    }
    /// The kernel or the file system does not know this kind of renaming.
    static bool IsUnknown(int error)
    {
        return error == EINVAL || error == ENOSYS || error == ENOTSUP;
    }
#endif
};

} // namespace

PlatformFile& PlatformFile::Native()
{
    static PosixFile instance;
    return instance;
}
