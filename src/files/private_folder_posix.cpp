#include "files/private_folder.h"

#include "base/utf8_path.h"

#include <cerrno>
#include <charconv>
#include <csignal>
#include <fcntl.h>
#include <sys/file.h>
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

bool IsSame(const struct stat& a, const struct stat& b)
{
    return a.st_dev == b.st_dev && a.st_ino == b.st_ino;
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

Result<ProcessLock> ProcessLock::Take(const std::string& path)
{
    while (true) {
        const int fd = ::open(path.c_str(), O_RDWR | O_CREAT | O_NOFOLLOW | O_CLOEXEC, 0600);
        if (fd == -1)
            return Refused(path, errno);
        ProcessLock lock(fd);
        if (::flock(fd, LOCK_EX | LOCK_NB) == -1)
            return Refused(path, errno == EWOULDBLOCK ? EBUSY : errno);
        struct stat held, there;
        if (::fstat(fd, &held) == -1)
            return Refused(path, errno);
        if (::lstat(path.c_str(), &there) == -1 || !IsSame(held, there))
            continue; // whoever held it took the file away
        const std::string process = std::to_string(::getpid());
        if (::ftruncate(fd, 0) == -1 || ::pwrite(fd, process.data(), process.size(), 0) == -1)
            return Refused(path, errno);
        return lock;
    }
}

bool ProcessLock::IsOrphan(const std::string& path)
{
    const Result<PrivateFile> file = OpenPrivateFile(path);
    if (!file)
        return false;
    char text[24] = {};
    const std::size_t length = std::fread(text, 1, sizeof text - 1, file.value().stream.get());
    long process = 0;
    const auto end = std::from_chars(text, text + length, process);
    return end.ec == std::errc() && process > 0 && ::kill(pid_t(process), 0) == -1 && errno == ESRCH;
}

ProcessLock::~ProcessLock()
{
    if (m_handle != None)
        ::close(int(m_handle));
}
