#include "files/platform_file.h"

#define WIN32_LEAN_AND_MEAN
#define NOMINMAX
#include <windows.h>

namespace {

std::error_code LastError()
{
    return {int(::GetLastError()), std::system_category()};
}

std::error_code Outcome(BOOL succeeded)
{
    return succeeded ? std::error_code() : LastError();
}

class WindowsFile final : public PlatformFile
{
public:
    std::error_code Create(const std::filesystem::path& path, Access, Handle& file) override
    {
        const HANDLE handle =
            ::CreateFileW(path.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_NEW, FILE_ATTRIBUTE_NORMAL, nullptr);
        file = reinterpret_cast<Handle>(handle);
        return Outcome(handle != INVALID_HANDLE_VALUE);
    }

    std::error_code Write(Handle file, std::string_view text, std::size_t& written) override
    {
        constexpr std::size_t largest = std::size_t(1) << 30; // a DWORD must hold the length
        DWORD count = 0;
        const BOOL done = ::WriteFile(AsHandle(file), text.data(), DWORD(text.size() < largest ? text.size() : largest),
                                      &count, nullptr);
        written = count;
        if (done && count == 0)
            return std::make_error_code(std::errc::no_space_on_device);
        return Outcome(done);
    }

    // ReplaceFileW carries the access rights of the replaced file over.
    std::error_code TakePermissions(Handle, const std::filesystem::path&) override { return {}; }

    std::error_code Sync(Handle file) override { return Outcome(::FlushFileBuffers(AsHandle(file))); }

    std::error_code Close(Handle file) override { return Outcome(::CloseHandle(AsHandle(file))); }

    std::error_code CheckWritable(const std::filesystem::path& path) override
    {
        const DWORD attributes = ::GetFileAttributesW(path.c_str());
        if (attributes == INVALID_FILE_ATTRIBUTES)
            return LastError();
        return attributes & FILE_ATTRIBUTE_READONLY ? std::make_error_code(std::errc::permission_denied)
                                                    : std::error_code();
    }

    std::error_code Replace(const std::filesystem::path& from, const std::filesystem::path& to) override
    {
        // Without a backup's name a replacement that fails half way deletes the old file.
        const std::filesystem::path backup = from.native() + L".old";
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

    std::error_code Rename(const std::filesystem::path& from, const std::filesystem::path& to) override
    {
        return Outcome(::MoveFileExW(from.c_str(), to.c_str(), MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH));
    }

    std::error_code SyncFolder(const std::filesystem::path&) override { return {}; } // the journal sees to it

private:
    static HANDLE AsHandle(Handle file) { return reinterpret_cast<HANDLE>(file); }
};

} // namespace

PlatformFile& PlatformFile::Native()
{
    static WindowsFile instance;
    return instance;
}
