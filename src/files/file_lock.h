// A lock beside a file, by which programs that write it keep out of each other's way, and which says who has it.
#pragma once

#include "files/file_content.h"

#include <chrono>
#include <functional>
#include <optional>

/// Who has a file; what is not known is empty or 0.
struct LockHolder
{
    std::string program, user, host;
    std::int64_t process = 0, since = 0; // seconds since 1970
};
/// "anna on server (kvrshell, process 4711) since 2026-03-05 14:07:00"
std::string HolderText(const LockHolder& holder);

/// One lock for a file, whichever of its links, its names and the spellings of its extension it is named by. The kernel
/// lets go of it when the process ends, however it ends: a lock file that is left over keeps nobody out. It is held, or
/// somebody else has it, or the folder takes no locks; a program then says so and goes on.
class FileLock
{
public:
    FileLock() = default; // of nothing
    ~FileLock() { Release(); }
    FileLock(FileLock&& other) noexcept { *this = std::move(other); }
    FileLock& operator=(FileLock&& other) noexcept;

    /// `program` is the name by which others are told of this one.
    static FileLock Try(const std::string& path, std::string_view program, PlatformFile* platform = nullptr);
    /// Tries again for as long as somebody else has it.
    static FileLock WaitFor(const std::string& path, std::string_view program, std::chrono::milliseconds longest,
                            PlatformFile* platform = nullptr);

    bool IsHeld() const { return m_platform != nullptr; }
    /// Whether it is held, and is the one of this file; its folder may have got another name since.
    bool IsFor(const std::string& path) const;
    /// A question for any thread: whether somebody has taken the lock file away, so that others find none, or another.
    /// Not when its folder is no longer there either: the lock goes on wherever that is.
    std::function<bool()> WasRemoved() const;
    /// Who else has it.
    const std::optional<LockHolder>& HeldBy() const { return m_heldBy; }
    /// Why the folder takes no lock.
    std::error_code WhyNone() const { return m_whyNone; }
    /// The file that is the lock, or would be, in UTF-8; empty where the system does not say to which folder the file's
    /// links lead.
    std::string Path() const;
    /// What stands there may be another file by now, stand in a folder of another name, or have got further names (hard
    /// links): these are kept out, too.
    void Follow(const std::string& path);
    void Release();
    /// Copies of the process (process_copy.h) hold it, too, for as long as they work.
    void ShareWithCopies();
    /// In a copy of the process: what is not shared is the original's alone, and ends with it.
    static void LeaveToOriginal();

private:
    bool TryItself(const std::filesystem::path& file);
    bool IsAt(const std::filesystem::path& path) const;
    bool TryOnce(const std::filesystem::path& path, std::string_view program, PlatformFile& platform);

    std::optional<LockHolder> m_heldBy;
    std::error_code m_whyNone;
    std::filesystem::path m_path;
    PlatformFile::Handle m_file = 0;
    std::optional<PlatformFile::Handle> m_itself; // the file, where it has several names
    PlatformFile* m_platform = nullptr;           // while it is held
};
