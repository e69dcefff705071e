#include "files/safe_file.h"

#include "base/utf8_path.h"

#include <cerrno>
#include <fstream>
#include <random>

namespace fs = std::filesystem;

namespace {

std::string ReasonText(std::error_code reason)
{
    if (reason == std::errc::is_a_directory)
        return "it is a folder";
    if (reason == std::errc::operation_not_supported)
        return "it is not an ordinary file";
    return reason.message();
}

Error NotWritten(const std::string& path, std::error_code reason)
{
    return {.message = "Could not write \"" + path + "\": " + ReasonText(reason) + ".", .code = reason, .path = path};
}

Error NotRead(const std::string& path, std::error_code reason)
{
    return {.message = "Could not read \"" + path + "\": " + ReasonText(reason) + ".",
            .code = reason,
            .path = path,
            .reading = true};
}

/// The file that a chain of symbolic links ends at, whether it exists or not.
std::error_code FollowLinks(fs::path& path)
{
    constexpr int longestChain = 40; // as file systems allow
    std::error_code error;
    for (int step = 0; step < longestChain; ++step) {
        if (!fs::is_symlink(fs::symlink_status(path, error)))
            return {}; // not there yet is fine; what is wrong with the folder shows when it is written to
        const fs::path next = fs::read_symlink(path, error);
        if (error)
            return error;
        path = next.is_absolute() ? next : path.parent_path() / next;
    }
    return std::make_error_code(std::errc::too_many_symbolic_link_levels);
}

/// Creates a file of a name that nobody has. The name does not contain the target's, which may be as long as names get.
std::error_code CreateTemporary(PlatformFile& platform, const fs::path& folder, PlatformFile::Access access,
                                fs::path& path, PlatformFile::Handle& file)
{
    std::random_device random;
    std::error_code error;
    for (int attempt = 0; attempt < 100; ++attempt) {
        path = folder / (".kvr-" + std::to_string(random()) + ".tmp");
        error = platform.Create(path, access, file);
        if (error != std::errc::file_exists)
            break;
    }
    return error;
}

std::error_code WriteAll(PlatformFile& platform, PlatformFile::Handle file, std::string_view text)
{
    while (!text.empty()) {
        std::size_t written = 0;
        if (const std::error_code error = platform.Write(file, text, written))
            return error;
        text.remove_prefix(written);
    }
    return {};
}

/// Writes, syncs and closes a file just created; closes it whatever happens.
std::error_code Fill(PlatformFile& platform, PlatformFile::Handle file, std::string_view text, bool sync,
                     const fs::path* permissionsFrom)
{
    std::error_code error = WriteAll(platform, file, text);
    if (!error && permissionsFrom)
        error = platform.TakePermissions(file, *permissionsFrom);
    if (!error && sync)
        error = platform.Sync(file);
    const std::error_code closed = platform.Close(file);
    return error ? error : closed;
}

/// What stands in the way of replacing an existing target.
std::error_code Obstacle(PlatformFile& platform, const fs::path& target, bool& exists)
{
    std::error_code ignored;
    const fs::file_status status = fs::status(target, ignored);
    exists = fs::exists(status);
    if (!exists)
        return {};
    if (fs::is_directory(status))
        return std::make_error_code(std::errc::is_a_directory);
    if (!fs::is_regular_file(status))
        return std::make_error_code(std::errc::operation_not_supported);
    return platform.CheckWritable(target);
}

/// Puts the finished temporary file in the place of the target. A replacement that fails half way may have cost the
/// target; then the temporary file is all there is, and stays.
Result<void> PutInPlace(PlatformFile& platform, const fs::path& temporary, const fs::path& target, bool existed,
                        const std::string& path)
{
    const std::error_code error = platform.Replace(temporary, target);
    if (!error)
        return {};
    Error failure = NotWritten(path, error);
    std::error_code ignored;
    if (existed && !fs::exists(target, ignored)) {
        failure.kept = Utf8FromPath(temporary);
        failure.message += " The new content is complete in \"" + failure.kept + "\".";
    } else {
        fs::remove(temporary, ignored);
    }
    return failure;
}

} // namespace

Result<void> WriteFileSafely(const std::string& path, std::string_view text, const SafeFileOptions& options)
{
    PlatformFile& platform = options.platform ? *options.platform : PlatformFile::Native();
    fs::path target = PathFromUtf8(path);
    if (const std::error_code error = FollowLinks(target))
        return NotWritten(path, error);
    bool exists = false;
    if (const std::error_code obstacle = Obstacle(platform, target, exists))
        return NotWritten(path, obstacle);

    const fs::path folder = target.has_parent_path() ? target.parent_path() : fs::path(".");
    const auto access = exists ? PlatformFile::Access::OwnerOnly : PlatformFile::Access::New;
    fs::path temporary;
    PlatformFile::Handle file = 0;
    if (const std::error_code error = CreateTemporary(platform, folder, access, temporary, file))
        return NotWritten(path, error);
    if (const std::error_code error = Fill(platform, file, text, options.sync, exists ? &target : nullptr)) {
        std::error_code ignored;
        fs::remove(temporary, ignored);
        return NotWritten(path, error);
    }
    if (Result<void> put = PutInPlace(platform, temporary, target, exists, path); !put)
        return put;
    // The new content is in place and whole. Should the folder not reach the medium before the power fails, the old
    // content is found whole instead: nothing that calling this a failure could still undo.
    if (options.sync)
        platform.SyncFolder(folder);
    return {};
}

Result<void> RenameFile(const std::string& from, const std::string& to, PlatformFile* platformOrNull)
{
    PlatformFile& platform = platformOrNull ? *platformOrNull : PlatformFile::Native();
    const std::error_code error = platform.Rename(PathFromUtf8(from), PathFromUtf8(to));
    return error ? NotWritten(to, error) : Result<void>();
}

std::string FreeCopyName(const std::string& path, std::string_view why)
{
    std::error_code ignored;
    for (int number = 1;; ++number) {
        std::string copy = path + '.' + std::string(why) + '-' + std::to_string(number);
        if (!fs::exists(fs::symlink_status(PathFromUtf8(copy), ignored)))
            return copy;
    }
}

Result<std::string> KeepOriginal(const std::string& path, std::string_view why, PlatformFile* platformOrNull)
{
    PlatformFile& platform = platformOrNull ? *platformOrNull : PlatformFile::Native();
    const Result<std::string> content = ReadWholeFile(path);
    if (!content)
        return content.error();
    std::string copy;
    PlatformFile::Handle file = 0;
    std::error_code error;
    do { // again when somebody else took the name meanwhile
        copy = FreeCopyName(path, why);
        error = platform.Create(PathFromUtf8(copy), PlatformFile::Access::OwnerOnly, file);
    } while (error == std::errc::file_exists);
    if (error)
        return NotWritten(copy, error);
    const fs::path original = PathFromUtf8(path);
    error = Fill(platform, file, content.value(), true, &original);
    if (error) {
        std::error_code ignored;
        fs::remove(PathFromUtf8(copy), ignored);
        return NotWritten(copy, error);
    }
    return copy;
}

Result<std::string> ReadWholeFile(const std::string& path)
{
    std::error_code error;
    const fs::path file = PathFromUtf8(path);
    const auto size = fs::file_size(file, error);
    if (error)
        return NotRead(path, error);
    errno = 0;
    std::ifstream stream(file, std::ios::binary);
    std::string content(std::size_t(size), '\0');
    if (!stream.read(content.data(), std::streamsize(content.size())))
        return NotRead(path,
                       std::make_error_code(errno == EACCES ? std::errc::permission_denied : std::errc::io_error));
    return content;
}

bool SameFile(const std::string& a, const std::string& b)
{
    std::error_code error;
    return std::filesystem::equivalent(PathFromUtf8(a), PathFromUtf8(b), error) && !error;
}
