#include "files/permissions_posix.h"

#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <string>
#include <sys/stat.h>
#include <unistd.h>
#ifdef __linux__
#include <sys/xattr.h>
#endif

namespace {

std::error_code LastError()
{
    return {errno, std::generic_category()};
}

/// What the user's rights or the file system do not allow; other errors are failures.
bool IsForbidden(int error)
{
    return error == ENOTSUP || error == EPERM || error == EACCES || error == ENOSYS;
}

#ifdef __linux__
constexpr const char* AccessControlList = "system.posix_acl_access";

/// Calls `get(buffer, size)` for the size and for the content.
template <typename Get>
bool Fetch(Get get, std::string& value)
{
    const ssize_t size = get(nullptr, 0);
    value.assign(size > 0 ? std::size_t(size) : 0, '\0');
    const ssize_t read = size == -1 ? -1 : get(value.data(), value.size());
    value.resize(read > 0 ? std::size_t(read) : 0);
    return read != -1;
}

std::error_code CopyAttribute(int file, const char* from, const char* name, bool& lost)
{
    std::string value, present;
    if (!Fetch([&](char* buffer, std::size_t size) { return ::getxattr(from, name, buffer, size); }, value)) {
        lost = lost || (errno != ENODATA && IsForbidden(errno));
        return errno == ENODATA || IsForbidden(errno) ? std::error_code() : LastError();
    }
    // Some come by themselves and may not be set, such as labels that the system gives every file.
    if (Fetch([&](char* buffer, std::size_t size) { return ::fgetxattr(file, name, buffer, size); }, present) &&
        present == value)
        return {};
    if (::fsetxattr(file, name, value.data(), value.size(), 0) == 0)
        return {};
    lost = lost || IsForbidden(errno);
    return IsForbidden(errno) ? std::error_code() : LastError();
}

/// Extended attributes, the access control list among them.
std::error_code CopyAttributes(int file, const char* from, LostMetadata& lost)
{
    if (::fremovexattr(file, AccessControlList) == -1 && errno != ENODATA && !IsForbidden(errno))
        return LastError(); // the folder may have given it one
    std::string names;
    if (!Fetch([&](char* buffer, std::size_t size) { return ::listxattr(from, buffer, size); }, names))
        return errno == ENOTSUP || errno == ENOSYS ? std::error_code() // the file system has none, so none gets lost
                                                   : LastError();
    for (std::size_t begin = 0; begin < names.size(); begin += std::strlen(&names[begin]) + 1) {
        const char* const name = &names[begin];
        const bool isList = std::strncmp(name, "system.", 7) == 0;
        if (isList && lost.group) { // it would speak of another group
            lost.accessList = true;
            continue;
        }
        if (const std::error_code error = CopyAttribute(file, from, name, isList ? lost.accessList : lost.attributes))
            return error;
    }
    return {};
}
#else
std::error_code CopyAttributes(int, const char*, LostMetadata&)
{
    return {};
}
#endif

/// Only the owner of everything may give files away; others may give one to the groups that they are in.
std::error_code CopyOwner(int file, const struct stat& wanted, LostMetadata& lost)
{
    struct stat is;
    if (::fchown(file, wanted.st_uid, wanted.st_gid) == -1 && ::fchown(file, uid_t(-1), wanted.st_gid) == -1 &&
        !IsForbidden(errno) && errno != EINVAL) // a file system may know one owner only
        return LastError();
    if (::fstat(file, &is) == -1)
        return LastError();
    lost.owner = is.st_uid != wanted.st_uid;
    lost.group = is.st_gid != wanted.st_gid;
    return {};
}

std::error_code SetMode(int file, mode_t mode, bool& lost)
{
    struct stat is;
    if (::fchmod(file, mode) == -1 && errno != EPERM && errno != ENOTSUP)
        return LastError();
    if (::fstat(file, &is) == -1)
        return LastError();
    lost = lost || (is.st_mode & 07777) != mode;
    return {};
}

} // namespace

std::error_code TakePermissionsOf(int file, const char* from, LostMetadata& lost)
{
    struct stat wanted;
    if (::stat(from, &wanted) == -1)
        return LastError();
    if (const std::error_code error = CopyOwner(file, wanted, lost))
        return error;
    if (const std::error_code error = CopyAttributes(file, from, lost))
        return error;
    // Bits that let programs run as somebody else do not speak of the new owner; what the old group might do, another
    // might only if everybody may.
    mode_t mode = wanted.st_mode & 07777;
    if (lost.owner || lost.group)
        mode &= 0777;
    if (lost.group)
        mode = (mode & ~mode_t(070)) | (mode & 07) << 3;
    lost.mode = mode != (wanted.st_mode & 07777);
    return SetMode(file, mode, lost.mode);
}

std::error_code TakePermissionsOfNewFile(int file, const char* folder)
{
    mode_t mode = 0;
#ifdef O_TMPFILE
    // What the mask of the process and the folder's access list make of a new file is seen on one without a name.
    const int model = ::open(folder, O_TMPFILE | O_WRONLY | O_CLOEXEC, 0666);
    struct stat status;
    if (model != -1 && ::fstat(model, &status) == 0) {
        mode = status.st_mode & 0777;
        std::string list;
        if (Fetch([&](char* buffer, std::size_t size) { return ::fgetxattr(model, AccessControlList, buffer, size); },
                  list))
            ::fsetxattr(file, AccessControlList, list.data(), list.size(), 0);
    }
    if (model != -1)
        ::close(model);
#else
    (void)folder;
#endif
    if (mode == 0) {
        const mode_t mask = ::umask(077);
        ::umask(mask);
        mode = 0666 & ~mask;
    }
    bool foreign = false; // a file system may know one mode only
    return SetMode(file, mode, foreign);
}
