#include "files/platform_file.h"

#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#ifdef __linux__
#include <string>
#include <sys/xattr.h>
#endif

namespace {

std::error_code LastError()
{
    return {errno, std::generic_category()};
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

#ifdef __linux__
constexpr const char* AccessControlList = "system.posix_acl_access";

/// What a file system or the user's rights do not allow is not asked for: the file has never had it here.
bool IsForeign(int error)
{
    return error == ENOTSUP || error == EPERM || error == EACCES;
}

std::error_code CopyAttribute(int file, const char* from, const char* name)
{
    const ssize_t size = ::getxattr(from, name, nullptr, 0);
    std::string value(size > 0 ? std::size_t(size) : 0, '\0');
    const ssize_t read = size == -1 ? -1 : ::getxattr(from, name, value.data(), value.size());
    const bool copied = read != -1 && ::fsetxattr(file, name, value.data(), std::size_t(read), 0) == 0;
    return copied || errno == ENODATA || IsForeign(errno) ? std::error_code() : LastError();
}

/// Extended attributes, the access control list among them.
std::error_code CopyAttributes(int file, const char* from)
{
    ::fremovexattr(file, AccessControlList); // the folder may have given it one
    const ssize_t size = ::listxattr(from, nullptr, 0);
    std::string names(size > 0 ? std::size_t(size) : 0, '\0');
    const ssize_t read = size == -1 ? -1 : ::listxattr(from, names.data(), names.size());
    if (read == -1)
        return IsForeign(errno) ? std::error_code() : LastError();
    names.resize(std::size_t(read));
    for (std::size_t begin = 0; begin < names.size(); begin += std::char_traits<char>::length(&names[begin]) + 1)
        if (const std::error_code error = CopyAttribute(file, from, &names[begin]))
            return error;
    return {};
}
#else
std::error_code CopyAttributes(int, const char*)
{
    return {};
}
#endif

class PosixFile final : public PlatformFile
{
public:
    std::error_code Create(const std::filesystem::path& path, Access access, Handle& file) override
    {
        const mode_t mode = access == Access::OwnerOnly ? 0600 : 0666;
        const int fd = Retry([&] { return ::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode); });
        file = fd;
        return fd == -1 ? LastError() : std::error_code();
    }

    std::error_code Write(Handle file, std::string_view text, std::size_t& written) override
    {
        const ssize_t count = Retry([&] { return ::write(Fd(file), text.data(), text.size()); });
        written = count == -1 ? 0 : std::size_t(count);
        if (count == -1)
            return LastError();
        return count == 0 ? std::make_error_code(std::errc::no_space_on_device) : std::error_code();
    }

    std::error_code TakePermissions(Handle file, const std::filesystem::path& from) override
    {
        struct stat status;
        if (::stat(from.c_str(), &status) == -1)
            return LastError();
        // Only the owner of everything may give files away; others keep the mode without the bits that would then
        // speak of somebody else.
        mode_t mode = status.st_mode & 07777;
        if (::fchown(Fd(file), status.st_uid, status.st_gid) == -1 &&
            ::fchown(Fd(file), uid_t(-1), status.st_gid) == -1)
            mode &= 0777;
        if (const std::error_code error = CopyAttributes(Fd(file), from.c_str()))
            return error;
        return ::fchmod(Fd(file), mode) == -1 ? LastError() : std::error_code();
    }

    std::error_code Sync(Handle file) override
    {
        return Retry([&] { return ::fsync(Fd(file)); }) == -1 ? LastError() : std::error_code();
    }

    std::error_code Close(Handle file) override
    {
        // After an interrupted close the descriptor is gone on Linux; closing again could hit somebody else's file.
        return ::close(Fd(file)) == -1 && errno != EINTR ? LastError() : std::error_code();
    }

    std::error_code CheckWritable(const std::filesystem::path& path) override
    {
        return ::access(path.c_str(), W_OK) == -1 ? LastError() : std::error_code();
    }

    std::error_code Replace(const std::filesystem::path& from, const std::filesystem::path& to) override
    {
        return ::rename(from.c_str(), to.c_str()) == -1 ? LastError() : std::error_code();
    }

    std::error_code Rename(const std::filesystem::path& from, const std::filesystem::path& to) override
    {
        return Replace(from, to);
    }

    std::error_code SyncFolder(const std::filesystem::path& folder) override
    {
        const int fd = Retry([&] { return ::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC); });
        if (fd == -1)
            return LastError();
        const std::error_code error = Sync(fd);
        ::close(fd);
        return error;
    }

private:
    static int Fd(Handle file) { return int(file); }
};

} // namespace

PlatformFile& PlatformFile::Native()
{
    static PosixFile instance;
    return instance;
}
