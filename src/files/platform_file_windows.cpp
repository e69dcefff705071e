#include "files/platform_file.h"

#include <algorithm>

#define WIN32_LEAN_AND_MEAN
#ifndef NOMINMAX
#define NOMINMAX
#endif
#include <windows.h>

namespace {

constexpr std::size_t LargestPiece = std::size_t(1) << 30; // a DWORD must hold its length
constexpr DWORD Everybody = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;

std::error_code LastError()
{
    return {int(::GetLastError()), std::system_category()};
}

std::error_code Outcome(BOOL succeeded)
{
    return succeeded ? std::error_code() : LastError();
}

std::uint64_t Joined(DWORD high, DWORD low)
{
    return std::uint64_t(high) << 32 | low;
}

/// Nanoseconds since 1970 of hundreds of them since 1601.
std::int64_t Nanoseconds(const FILETIME& time)
{
    return (std::int64_t(Joined(time.dwHighDateTime, time.dwLowDateTime)) - 116'444'736'000'000'000) * 100;
}

class WindowsFile final : public PlatformFile
{
public:
    std::error_code Status(const Path& path, FileStatus& status) override
    {
        status = {};
        const HANDLE handle = ::CreateFileW(path.c_str(), FILE_READ_ATTRIBUTES, Everybody, nullptr, OPEN_EXISTING,
                                            FILE_FLAG_BACKUP_SEMANTICS | FILE_FLAG_OPEN_REPARSE_POINT, nullptr);
        if (handle == INVALID_HANDLE_VALUE) {
            const DWORD error = ::GetLastError();
            return error == ERROR_FILE_NOT_FOUND || error == ERROR_PATH_NOT_FOUND ? std::error_code() : LastError();
        }
        const std::error_code error = StatusOf(reinterpret_cast<Handle>(handle), status);
        ::CloseHandle(handle);
        return error;
    }

    std::error_code List(const Path& folder, std::vector<Path>& names) override
    {
        std::error_code error;
        std::filesystem::directory_iterator entry(folder, error);
        for (; !error && entry != std::filesystem::directory_iterator(); entry.increment(error))
            names.push_back(entry->path().filename());
        return error;
    }

    std::error_code CheckWritable(const Path& path) override
    {
        const DWORD attributes = ::GetFileAttributesW(path.c_str());
        if (attributes == INVALID_FILE_ATTRIBUTES)
            return LastError();
        return attributes & FILE_ATTRIBUTE_READONLY ? std::make_error_code(std::errc::permission_denied)
                                                    : std::error_code();
    }

    std::error_code Open(const Path& path, Purpose purpose, Handle& file) override
    {
        const DWORD access = purpose == Purpose::Read     ? GENERIC_READ
                             : purpose == Purpose::Change ? GENERIC_WRITE
                                                          : GENERIC_READ | GENERIC_WRITE;
        return Opened(::CreateFileW(path.c_str(), access, Everybody, nullptr,
                                    purpose == Purpose::Lock ? OPEN_ALWAYS : OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL,
                                    nullptr),
                      file);
    }

    std::error_code Create(const Path& path, Handle& file) override
    {
        return Opened(
            ::CreateFileW(path.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_NEW, FILE_ATTRIBUTE_NORMAL, nullptr), file);
    }

    std::error_code StatusOf(Handle file, FileStatus& status) override
    {
        using Kind = FileStatus::Kind;
        BY_HANDLE_FILE_INFORMATION is;
        FILE_ATTRIBUTE_TAG_INFO tag; // a file that is not yet fetched from elsewhere has one, too, and is no link
        if (!::GetFileInformationByHandle(AsHandle(file), &is) ||
            !::GetFileInformationByHandleEx(AsHandle(file), FileAttributeTagInfo, &tag, sizeof tag))
            return LastError();
        const bool isLink =
            tag.FileAttributes & FILE_ATTRIBUTE_REPARSE_POINT && tag.ReparseTag == IO_REPARSE_TAG_SYMLINK;
        status = {.kind = isLink                                           ? Kind::Link
                          : is.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY ? Kind::Folder
                                                                           : Kind::File,
                  .isMine = true, // who may remove a file of ours here is the folder's affair
                  .device = is.dwVolumeSerialNumber,
                  .inode = Joined(is.nFileIndexHigh, is.nFileIndexLow),
                  .size = Joined(is.nFileSizeHigh, is.nFileSizeLow),
                  .links = is.nNumberOfLinks,
                  .modified = Nanoseconds(is.ftLastWriteTime),
                  .touched = Nanoseconds(is.ftLastWriteTime)};
        return {};
    }

    std::error_code Read(Handle file, char* buffer, std::size_t size, std::size_t& read) override
    {
        DWORD count = 0;
        const BOOL done = ::ReadFile(AsHandle(file), buffer, DWORD(std::min(size, LargestPiece)), &count, nullptr);
        read = count;
        return Outcome(done);
    }

    std::error_code Write(Handle file, std::string_view text, std::size_t& written) override
    {
        DWORD count = 0;
        const BOOL done =
            ::WriteFile(AsHandle(file), text.data(), DWORD(std::min(text.size(), LargestPiece)), &count, nullptr);
        written = count;
        if (done && count == 0)
            return std::make_error_code(std::errc::no_space_on_device);
        return Outcome(done);
    }

    std::error_code Cut(Handle file, std::uint64_t size) override
    {
        FILE_END_OF_FILE_INFO end;
        end.EndOfFile.QuadPart = LONGLONG(size);
        return Outcome(::SetFileInformationByHandle(AsHandle(file), FileEndOfFileInfo, &end, sizeof end));
    }

    std::error_code Lock(Handle file) override
    {
        OVERLAPPED place{}; // far behind any content, which others may read meanwhile
        place.OffsetHigh = 0x40000000;
        if (::LockFileEx(AsHandle(file), LOCKFILE_EXCLUSIVE_LOCK | LOCKFILE_FAIL_IMMEDIATELY, 0, 1, 0, &place))
            return {};
        return ::GetLastError() == ERROR_LOCK_VIOLATION
                   ? std::make_error_code(std::errc::resource_unavailable_try_again)
                   : LastError();
    }

    // ReplaceFileW carries the access rights of the replaced file over; a new file has those of its folder.
    std::error_code TakePermissions(Handle, const Path&, LostMetadata&) override { return {}; }
    std::error_code TakeNewPermissions(Handle, const Path&) override { return {}; }

    std::error_code Sync(Handle file) override { return Outcome(::FlushFileBuffers(AsHandle(file))); }

    std::error_code Close(Handle file) override { return Outcome(::CloseHandle(AsHandle(file))); }

    std::error_code Exchange(const Path&, const Path&) override
    {
        return std::make_error_code(std::errc::function_not_supported);
    }

    std::error_code Replace(const Path& from, const Path& to) override
    {
        // Without a backup's name a replacement that fails half way deletes the old file.
        const Path backup = from.native() + L".old";
        if (::ReplaceFileW(to.c_str(), from.c_str(), backup.c_str(), REPLACEFILE_IGNORE_MERGE_ERRORS, nullptr,
                           nullptr)) {
            ::DeleteFileW(backup.c_str());
            return {};
        }
        const std::error_code error = LastError();
        if (error.value() == ERROR_UNABLE_TO_MOVE_REPLACEMENT_2)
            ::MoveFileExW(backup.c_str(), to.c_str(), MOVEFILE_WRITE_THROUGH);
        if (error.value() != ERROR_FILE_NOT_FOUND)
            return error;
        return Outcome(::MoveFileExW(from.c_str(), to.c_str(), MOVEFILE_WRITE_THROUGH));
    }

    std::error_code Rename(const Path& from, const Path& to) override
    {
        return Outcome(::MoveFileExW(from.c_str(), to.c_str(), MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH));
    }

    std::error_code RenameNew(const Path& from, const Path& to) override
    {
        return Outcome(::MoveFileExW(from.c_str(), to.c_str(), MOVEFILE_WRITE_THROUGH));
    }

    std::error_code Remove(const Path& path) override { return Outcome(::DeleteFileW(path.c_str())); }

    std::error_code SyncFolder(const Path&) override { return {}; } // the journal sees to it

private:
    static HANDLE AsHandle(Handle file) { return reinterpret_cast<HANDLE>(file); }
    static std::error_code Opened(HANDLE handle, Handle& file)
    {
        file = reinterpret_cast<Handle>(handle);
        return Outcome(handle != INVALID_HANDLE_VALUE);
    }
};

} // namespace

PlatformFile& PlatformFile::Native()
{
    static WindowsFile instance;
    return instance;
}
