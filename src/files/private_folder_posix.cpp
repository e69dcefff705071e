#include "files/private_folder.h"

#include "base/utf8_path.h"

#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

Error Refused(const std::string& path, int reason, bool reading = false)
{
    const std::error_code code(reason, std::generic_category());
    return {.message = "Could not use \"" + path + "\": " + code.message() + ".",
            .code = code,
            .path = path,
            .reading = reading};
}

} // namespace

Result<void> MakePrivateFolder(const std::string& path)
{
    const std::filesystem::path folder = PathFromUtf8(path);
    struct stat status;
    if (folder.has_parent_path() && folder.parent_path() != folder &&
        ::stat(folder.parent_path().c_str(), &status) == -1 && errno == ENOENT)
        if (Result<void> above = MakePrivateFolder(Utf8FromPath(folder.parent_path())); !above)
            return above;
    if (::mkdir(folder.c_str(), 0700) == -1 && errno != EEXIST)
        return Refused(path, errno);
    if (::lstat(folder.c_str(), &status) == -1)
        return Refused(path, errno);
    if (!S_ISDIR(status.st_mode))
        return Refused(path, ENOTDIR);
    if (status.st_uid != ::geteuid())
        return Refused(path, EPERM);
    if ((status.st_mode & 0077) && ::chmod(folder.c_str(), 0700) == -1)
        return Refused(path, errno);
    return {};
}

Result<PrivateFile> OpenPrivateFile(const std::string& path)
{
    const int fd = ::open(path.c_str(), O_RDONLY | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC);
    if (fd == -1)
        return Refused(path, errno, true);
    struct stat status;
    const int reason = ::fstat(fd, &status) == -1     ? errno
                       : !S_ISREG(status.st_mode)     ? EINVAL
                       : status.st_uid != ::geteuid() ? EPERM
                                                      : 0;
    std::FILE* const stream = reason ? nullptr : ::fdopen(fd, "rb");
    if (!stream) {
        const int why = reason ? reason : errno;
        ::close(fd);
        return Refused(path, why, true);
    }
    PrivateFile file;
    file.stream.reset(stream);
    file.size = std::uintmax_t(status.st_size);
    return file;
}
