// Loaded before the C library (LD_PRELOAD): counts the calls on files of one folder, and lets one of them fail, come
// back with less than was asked for, or be the last thing the program does; before one it may wait until it is let on.
// faults.py maps the same record and says which.
#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstdarg>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <dlfcn.h>
#include <fcntl.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <sys/types.h>
#include <unistd.h>

namespace {

constexpr int Kill = -1, Short = -2, MostCalls = 4000, NameLength = 24;

/// As faults.py lays it out.
struct Orders
{
    std::int32_t armed, number, fault, sticky; // which call, counted from 1, and what it meets: an errno, Kill, Short
    std::int32_t seen;                         // calls since it was armed
    std::int32_t waits;                        // before which call; 0 once it may go on
    char folder[236];
    char names[MostCalls][NameLength];
};

Orders* orders = nullptr;
bool isOurs[1024]; // descriptors of files in the folder

template <typename Call>
Call* Next(Call*, const char* name)
{
    return reinterpret_cast<Call*>(::dlsym(RTLD_NEXT, name));
}

__attribute__((constructor)) void Map()
{
    const char* const path = std::getenv("KVR_FAULTS");
    const int file = path ? Next(&::open, "open")(path, O_RDWR | O_CLOEXEC) : -1;
    if (file == -1)
        return;
    void* const place = ::mmap(nullptr, sizeof(Orders), PROT_READ | PROT_WRITE, MAP_SHARED, file, 0);
    orders = place == MAP_FAILED ? nullptr : static_cast<Orders*>(place);
    Next(&::close, "close")(file);
}

bool IsInFolder(const char* path)
{
    if (!orders || !orders->armed || !path)
        return false;
    const std::size_t length = std::strlen(orders->folder);
    return std::strncmp(path, orders->folder, length) == 0 && (path[length] == '/' || path[length] == '\0');
}

bool IsInFolder(int file)
{
    return orders && orders->armed && file >= 0 && file < 1024 && isOurs[file];
}

/// What this call meets: 0 for nothing.
template <typename Where>
int Meets(const char* name, Where where)
{
    if (!IsInFolder(where))
        return 0;
    const int number = ++orders->seen;
    if (number <= MostCalls)
        std::strncpy(orders->names[number - 1], name, NameLength - 1);
    while (number == __atomic_load_n(&orders->waits, __ATOMIC_ACQUIRE))
        ::usleep(100);
    const bool hit = number == orders->number || (orders->sticky && orders->number > 0 && number > orders->number);
    if (hit && orders->fault == Kill)
        ::kill(::getpid(), SIGKILL);
    return hit ? orders->fault : 0;
}

int Opened(int file, bool ours)
{
    if (file >= 0 && file < 1024)
        isOurs[file] = ours;
    return file;
}

} // namespace

// A call on a path or a descriptor that answers -1 and errno.
#define KVR_CALL(Type, name, where, parameters, arguments)                                                             \
    extern "C" __attribute__((visibility("default"))) Type name parameters                                             \
    {                                                                                                                  \
        if (const int fault = Meets(#name, where); fault > 0) {                                                        \
            errno = fault;                                                                                             \
            return -1;                                                                                                 \
        }                                                                                                              \
        static auto* const next = Next(&::name, #name);                                                                \
        return next arguments;                                                                                         \
    }

// One that opens a file.
#define KVR_OPEN(name, parameters, last, path, given)                                                                  \
    extern "C" __attribute__((visibility("default"))) int name parameters                                              \
    {                                                                                                                  \
        va_list more;                                                                                                  \
        va_start(more, last);                                                                                          \
        const mode_t mode = (flags & (O_CREAT | O_TMPFILE)) ? va_arg(more, mode_t) : 0;                                \
        va_end(more);                                                                                                  \
        if (const int fault = Meets(#name, path); fault > 0) {                                                         \
            errno = fault;                                                                                             \
            return -1;                                                                                                 \
        }                                                                                                              \
        static auto* const next = Next(&::name, #name);                                                                \
        return Opened(next given, IsInFolder(path));                                                                   \
    }

KVR_OPEN(open, (const char* path, int flags, ...), flags, path, (path, flags, mode))
KVR_OPEN(open64, (const char* path, int flags, ...), flags, path, (path, flags, mode))
KVR_OPEN(openat, (int folder, const char* path, int flags, ...), flags, path, (folder, path, flags, mode))
KVR_OPEN(openat64, (int folder, const char* path, int flags, ...), flags, path, (folder, path, flags, mode))

KVR_CALL(int, access, path, (const char* path, int mode), (path, mode))
KVR_CALL(int, faccessat, path, (int folder, const char* path, int mode, int flags), (folder, path, mode, flags))
KVR_CALL(int, stat, path, (const char* path, struct stat* status), (path, status))
KVR_CALL(int, lstat, path, (const char* path, struct stat* status), (path, status))
KVR_CALL(int, stat64, path, (const char* path, struct stat64* status), (path, status))
KVR_CALL(int, lstat64, path, (const char* path, struct stat64* status), (path, status))
KVR_CALL(int, fstat, file, (int file, struct stat* status), (file, status))
KVR_CALL(int, fstat64, file, (int file, struct stat64* status), (file, status))
KVR_CALL(int, statx, path, (int folder, const char* path, int flags, unsigned mask, struct statx* status),
         (folder, path, flags, mask, status))
KVR_CALL(ssize_t, readlink, path, (const char* path, char* text, size_t size), (path, text, size))
KVR_CALL(int, rename, to, (const char* from, const char* to), (from, to))
KVR_CALL(int, renameat, to, (int a, const char* from, int b, const char* to), (a, from, b, to))
KVR_CALL(int, renameat2, to, (int a, const char* from, int b, const char* to, unsigned flags), (a, from, b, to, flags))
KVR_CALL(int, link, to, (const char* from, const char* to), (from, to))
KVR_CALL(int, linkat, to, (int a, const char* from, int b, const char* to, int flags), (a, from, b, to, flags))
KVR_CALL(int, unlink, path, (const char* path), (path))
KVR_CALL(int, unlinkat, path, (int folder, const char* path, int flags), (folder, path, flags))
KVR_CALL(int, remove, path, (const char* path), (path))
KVR_CALL(ssize_t, getxattr, path, (const char* path, const char* name, void* value, size_t size),
         (path, name, value, size))
KVR_CALL(ssize_t, listxattr, path, (const char* path, char* names, size_t size), (path, names, size))
KVR_CALL(ssize_t, fgetxattr, file, (int file, const char* name, void* value, size_t size), (file, name, value, size))
KVR_CALL(ssize_t, flistxattr, file, (int file, char* names, size_t size), (file, names, size))
KVR_CALL(int, fsetxattr, file, (int file, const char* name, const void* value, size_t size, int flags),
         (file, name, value, size, flags))
KVR_CALL(int, fremovexattr, file, (int file, const char* name), (file, name))
KVR_CALL(int, fchmod, file, (int file, mode_t mode), (file, mode))
KVR_CALL(int, fchown, file, (int file, uid_t owner, gid_t group), (file, owner, group))
KVR_CALL(int, fsync, file, (int file), (file))
KVR_CALL(int, fdatasync, file, (int file), (file))
KVR_CALL(int, ftruncate, file, (int file, off_t size), (file, size))
KVR_CALL(int, flock, file, (int file, int operation), (file, operation))

/// Half of what was asked for, and at least a byte.
static size_t Some(int fault, size_t size)
{
    return fault == Short && size > 1 ? size / 2 : size;
}

extern "C" __attribute__((visibility("default"))) ssize_t write(int file, const void* text, size_t size)
{
    const int fault = Meets("write", file);
    if (fault > 0) {
        errno = fault;
        return -1;
    }
    static auto* const next = Next(&::write, "write");
    return next(file, text, Some(fault, size));
}

extern "C" __attribute__((visibility("default"))) ssize_t read(int file, void* text, size_t size)
{
    const int fault = Meets("read", file);
    if (fault > 0) {
        errno = fault;
        return -1;
    }
    static auto* const next = Next(&::read, "read");
    return next(file, text, Some(fault, size));
}

/// The descriptor goes even when closing fails, as the system's does.
extern "C" __attribute__((visibility("default"))) int close(int file)
{
    static auto* const next = Next(&::close, "close");
    const int fault = Meets("close", file);
    Opened(file, false);
    const int closed = next(file);
    if (fault <= 0)
        return closed;
    errno = fault;
    return -1;
}
