#include "data/safe_file.h"

#include "data/utf8_path.h"

#include <fstream>
#include <random>

namespace fs = std::filesystem;

namespace {

Error Failed(const char* what, const std::string& path, const std::string& reason)
{
    return {std::string("Could not ") + what + " \"" + path + "\": " + reason + "."};
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
std::error_code CreateTemporary(PlatformFile& platform, const fs::path& folder, fs::path& path,
                                PlatformFile::Handle& file)
{
    std::random_device random;
    std::error_code error;
    for (int attempt = 0; attempt < 100; ++attempt) {
        path = folder / (".kvr-" + std::to_string(random()) + ".tmp");
        error = platform.Create(path, file);
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
std::string Obstacle(PlatformFile& platform, const fs::path& target, bool& exists)
{
    std::error_code error;
    const fs::file_status status = fs::status(target, error);
    exists = fs::exists(status);
    if (!exists)
        return {};
    if (fs::is_directory(status))
        return "it is a folder";
    if (!fs::is_regular_file(status))
        return "it is not an ordinary file";
    error = platform.CheckWritable(target);
    return error ? error.message() : std::string();
}

} // namespace

Result<void> WriteFileSafely(const std::string& path, std::string_view text, const SafeFileOptions& options)
{
    PlatformFile& platform = options.platform ? *options.platform : PlatformFile::Native();
    fs::path target = PathFromUtf8(path);
    std::error_code error = FollowLinks(target);
    if (error)
        return Failed("write", path, error.message());
    bool exists = false;
    if (const std::string obstacle = Obstacle(platform, target, exists); !obstacle.empty())
        return Failed("write", path, obstacle);

    const fs::path folder = target.has_parent_path() ? target.parent_path() : fs::path(".");
    fs::path temporary;
    PlatformFile::Handle file = 0;
    error = CreateTemporary(platform, folder, temporary, file);
    if (error)
        return Failed("write", path, error.message());
    error = Fill(platform, file, text, options.sync, exists ? &target : nullptr);
    if (!error)
        error = platform.Replace(temporary, target);
    if (error) {
        std::error_code ignored;
        fs::remove(temporary, ignored);
        return Failed("write", path, error.message());
    }
    // The new content is in place and whole. Should the folder not reach the medium before the power fails, the old
    // content is found whole instead: nothing that calling this a failure could still undo.
    if (options.sync)
        platform.SyncFolder(folder);
    return {};
}

Result<std::string> KeepUnreadable(const std::string& path, PlatformFile* platformOrNull)
{
    PlatformFile& platform = platformOrNull ? *platformOrNull : PlatformFile::Native();
    const Result<std::string> content = ReadWholeFile(path);
    if (!content)
        return content.error();
    std::string copy;
    PlatformFile::Handle file = 0;
    std::error_code error;
    for (int number = 1;; ++number) {
        copy = path + ".unreadable-" + std::to_string(number);
        error = platform.Create(PathFromUtf8(copy), file);
        if (error != std::errc::file_exists)
            break;
    }
    if (error)
        return Failed("write", copy, error.message());
    const fs::path original = PathFromUtf8(path);
    error = Fill(platform, file, content.value(), true, &original);
    if (error) {
        std::error_code ignored;
        fs::remove(PathFromUtf8(copy), ignored);
        return Failed("write", copy, error.message());
    }
    return copy;
}

Result<std::string> ReadWholeFile(const std::string& path)
{
    std::error_code error;
    const fs::path file = PathFromUtf8(path);
    const auto size = fs::file_size(file, error);
    if (error)
        return Failed("read", path, error.message());
    std::ifstream stream(file, std::ios::binary);
    std::string content(static_cast<std::size_t>(size), '\0');
    if (!stream.read(content.data(), static_cast<std::streamsize>(content.size())))
        return Failed("read", path, "the file could not be opened or ended early");
    return content;
}

bool SameFile(const std::string& a, const std::string& b)
{
    std::error_code error;
    return std::filesystem::equivalent(PathFromUtf8(a), PathFromUtf8(b), error) && !error;
}
