#include "files/file_content.h"

#include "base/utf8_path.h"

#include <array>
#include <bit>
#include <cstring>

namespace {

std::string ReasonText(std::error_code reason)
{
    if (reason == std::errc::is_a_directory)
        return "it is a folder";
    if (reason == std::errc::operation_not_supported)
        return "it is not an ordinary file";
    if (reason == std::errc::text_file_busy)
        return "another program has changed it since it was read";
    if (reason == std::errc::operation_canceled)
        return "the user did not want it";
    const std::string text = reason.message();
    return text.empty() || text.starts_with("Unknown")
               ? "the system gives the error number " + std::to_string(reason.value())
               : text;
}

/// A hash that keeps up with the memory: four lanes side by side, each step of which can be undone, so that no change
/// of a single word gets lost.
class ContentHash
{
public:
    static constexpr std::size_t BlockSize = 32;

    /// Any number of whole blocks.
    void AddBlocks(const char* data, std::size_t size)
    {
        for (; size >= BlockSize; data += BlockSize, size -= BlockSize)
            for (std::size_t i = 0; i < m_lanes.size(); ++i) {
                std::uint64_t word = 0;
                std::memcpy(&word, data + i * sizeof word, sizeof word);
                m_lanes[i] = std::rotl(m_lanes[i] + word * B, 31) * A;
            }
    }
    /// The last bytes, fewer than a block, and how many there were in all.
    std::uint64_t Finish(std::string_view tail, std::uint64_t size)
    {
        char block[BlockSize] = {};
        tail.copy(block, BlockSize);
        AddBlocks(block, BlockSize);
        std::uint64_t hash = size;
        for (const std::uint64_t lane : m_lanes) {
            hash = (hash ^ lane) * A;
            hash ^= hash >> 29;
        }
        hash *= B;
        return hash ^ hash >> 32;
    }

private:
    static constexpr std::uint64_t A = 0x9E3779B97F4A7C15, B = 0xD6E8FEB86659FD93; // odd, with bits all over
    std::array<std::uint64_t, 4> m_lanes{A, B, ~A, ~B};
};

/// Reads until the buffer is full or the content ends.
std::error_code ReadSome(PlatformFile& platform, PlatformFile::Handle file, char* buffer, std::size_t size,
                         std::size_t& got)
{
    got = 0;
    for (std::size_t read = 1; got < size && read > 0; got += read)
        if (const std::error_code error = platform.Read(file, buffer + got, size - got, read))
            return error;
    return {};
}

/// Opens an ordinary file, gives `use(handle, size)` its content to read, and closes it.
template <typename Use>
std::error_code WithContent(PlatformFile& platform, const std::filesystem::path& path, Use use)
{
    PlatformFile::Handle file = 0;
    if (const std::error_code error = platform.Open(path, PlatformFile::Purpose::Read, file))
        return error;
    FileStatus status;
    std::error_code error = platform.StatusOf(file, status);
    if (!error && status.kind == FileStatus::Kind::Folder)
        error = std::make_error_code(std::errc::is_a_directory);
    else if (!error && status.kind != FileStatus::Kind::File)
        error = std::make_error_code(std::errc::operation_not_supported);
    if (!error)
        error = use(file, status.size);
    platform.Close(file); // nothing was written
    return error;
}

} // namespace

FileVersion VersionOfText(std::string_view text)
{
    const std::size_t whole = text.size() / ContentHash::BlockSize * ContentHash::BlockSize;
    ContentHash hash;
    hash.AddBlocks(text.data(), whole);
    return {text.size(), hash.Finish(text.substr(whole), text.size())};
}

std::error_code VersionOfFile(PlatformFile& platform, const std::filesystem::path& path, FileVersion& version,
                              const std::optional<FileVersion>& expected)
{
    constexpr std::uint64_t largest = std::uint64_t(1) << 31; // the library of parameter files reads none
    return WithContent(platform, path, [&](PlatformFile::Handle file, std::uint64_t size) {
        version = {.size = size};
        if (size >= largest || (expected && size != expected->size))
            return std::error_code();
        std::array<char, std::size_t(1) << 16>
            buffer; // a save looks at files when it can no longer do without an answer
        ContentHash hash;
        version = {};
        for (std::size_t got = buffer.size(); got == buffer.size(); version.size += got) {
            if (const std::error_code error = ReadSome(platform, file, buffer.data(), buffer.size(), got))
                return error;
            if (got == buffer.size())
                hash.AddBlocks(buffer.data(), got);
        }
        const std::size_t last = std::size_t(version.size % buffer.size());
        const std::size_t whole = last / ContentHash::BlockSize * ContentHash::BlockSize;
        hash.AddBlocks(buffer.data(), whole);
        version.hash = hash.Finish({buffer.data() + whole, last - whole}, version.size);
        return std::error_code();
    });
}

Result<std::string> ReadWholeFile(const std::string& path, PlatformFile* platformOrNull)
{
    PlatformFile& platform = OrNative(platformOrNull);
    std::string content;
    const std::error_code error =
        WithContent(platform, PathFromUtf8(path), [&](PlatformFile::Handle file, std::uint64_t size) {
            std::size_t filled = 0;
            content.resize(std::size_t(size) + 1); // a byte more shows the end without growing
            for (;;) {
                std::size_t got = 0;
                if (const std::error_code failed =
                        ReadSome(platform, file, content.data() + filled, content.size() - filled, got))
                    return failed;
                filled += got;
                if (filled < content.size())
                    break;
                content.resize(content.size() * 2); // it has grown meanwhile
            }
            content.resize(filled);
            return std::error_code();
        });
    return error ? Result<std::string>(NotRead(path, error)) : std::move(content);
}

std::error_code FollowLinks(PlatformFile& platform, std::filesystem::path& path, FileStatus& status)
{
    constexpr int longestChain = 40; // as file systems allow
    for (int step = 0; step < longestChain; ++step) {
        if (const std::error_code error = platform.Status(path, status); error || status.kind != FileStatus::Kind::Link)
            return error; // not there yet is fine; what is wrong with the folder shows when it is written to
        std::filesystem::path next;
        if (const std::error_code error = platform.ReadLink(path, next))
            return error;
        path = next.is_absolute() ? next : path.parent_path() / next;
    }
    return std::make_error_code(std::errc::too_many_symbolic_link_levels);
}

FileStatus StatusBehind(const std::string& path)
{
    std::filesystem::path target = PathFromUtf8(path);
    FileStatus status;
    return FollowLinks(PlatformFile::Native(), target, status) ? FileStatus() : status;
}

std::error_code IsSameFile(PlatformFile& platform, const std::filesystem::path& a, const std::filesystem::path& b,
                           bool& same)
{
    std::filesystem::path pathA = a, pathB = b;
    FileStatus statusA, statusB;
    same = false;
    if (const std::error_code error = FollowLinks(platform, pathA, statusA))
        return error;
    if (const std::error_code error = FollowLinks(platform, pathB, statusB))
        return error;
    same = statusA.kind != FileStatus::Kind::None && statusA.IsSameFile(statusB);
    return {};
}

bool IsSameFile(const std::string& a, const std::string& b)
{
    bool same = false;
    return !IsSameFile(PlatformFile::Native(), PathFromUtf8(a), PathFromUtf8(b), same) && same;
}

std::filesystem::path FolderOf(const std::filesystem::path& path)
{
    return path.has_parent_path() ? path.parent_path() : std::filesystem::path(".");
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
