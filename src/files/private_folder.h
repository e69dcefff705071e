// Folders, files and locks that belong to the user alone.
#pragma once

#include "base/result.h"

#include <cstdint>
#include <cstdio>
#include <memory>
#include <string>

/// Makes a folder, and those above it that are missing, for nobody but the user. An error where it stands already and
/// is somebody else's, or no folder.
Result<void> MakePrivateFolder(const std::string& path);

struct PrivateFile
{
    struct Close
    {
        void operator()(std::FILE* file) const { std::fclose(file); }
    };
    std::unique_ptr<std::FILE, Close> stream;
    std::uintmax_t size = 0;
};
/// Opens an ordinary file of the user's own for reading: no link to another, nothing that would wait or never end.
Result<PrivateFile> OpenPrivateFile(const std::string& path);

/// A file that one process at a time holds. The system lets go of it when that process has ended, however it did, and
/// with it the copies of it that still work (process_copy.h).
class ProcessLock
{
public:
    /// Holds the file, made if need be. Error device_or_resource_busy when another process does.
    static Result<ProcessLock> Take(const std::string& path);
    /// Whether the process that took it has ended, so that a copy of it is all that still holds it.
    static bool IsOrphan(const std::string& path);
    ProcessLock(ProcessLock&& other) noexcept : m_handle(std::exchange(other.m_handle, None)) {}
    ProcessLock& operator=(ProcessLock&& other) noexcept
    {
        std::swap(m_handle, other.m_handle);
        return *this;
    }
    ~ProcessLock();

private:
    static constexpr std::intptr_t None = -1;
    explicit ProcessLock(std::intptr_t handle) : m_handle(handle) {}

    std::intptr_t m_handle = None;
};
