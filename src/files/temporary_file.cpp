#include "files/temporary_file.h"

#include "base/utf8_path.h"

#include <algorithm>
#include <cstdio>
#include <new>
#include <random>

namespace fs = std::filesystem;

namespace {

constexpr std::string_view Prefix = ".kvr-", Suffix = ".tmp", ProtectedSuffix = ".kept";

/// The name does not contain the target's, which may be as long as names get.
fs::path NewName()
{
    static constexpr char digits[] = "0123456789abcdef";
    std::random_device random;
    std::string name(Prefix);
    for (int word = 0; word < 2; ++word)
        for (std::uint32_t bits = random(), i = 0; i < 8; ++i, bits >>= 4)
            name += digits[bits & 15];
    return name.append(Suffix);
}

/// What stands between prefix and suffix of a name that has both; empty for any other.
std::string Between(const fs::path& name, std::string_view suffix)
{
    const std::string text = Utf8FromPath(name);
    if (text.size() <= Prefix.size() + suffix.size() || !text.starts_with(Prefix) || !text.ends_with(suffix))
        return {};
    return text.substr(Prefix.size(), text.size() - Prefix.size() - suffix.size());
}

bool IsOurName(const fs::path& name)
{
    const std::string text = Between(name, Suffix);
    return !text.empty() && text.find_first_not_of("0123456789abcdef") == std::string::npos;
}

std::string Hexadecimal(std::uint64_t number)
{
    char digits[17] = {};
    std::snprintf(digits, sizeof digits, "%016llx", static_cast<unsigned long long>(number));
    return digits;
}

/// Part of a protected name: whose it is. A save may change the case of the extension.
std::string MarkOf(const fs::path& target)
{
    fs::path name = target.filename();
    std::string extension = Utf8FromPath(name.extension());
    std::ranges::transform(extension, extension.begin(),
                           [](char each) { return each >= 'A' && each <= 'Z' ? char(each - 'A' + 'a') : each; });
    return '-' + Hexadecimal(VersionOfText(Utf8FromPath(name.replace_extension(PathFromUtf8(extension)))).hash);
}

std::string MarkOf(const FileVersion& version)
{
    return '-' + Hexadecimal(version.size) + '-' + Hexadecimal(version.hash);
}

/// Whether the name says that this content is one of the two that nobody misses.
bool IsMarked(PlatformFile& platform, const fs::path& path, std::string_view marks)
{
    FileVersion version;
    return !VersionOfFile(platform, path, version) && version.hash != 0 &&
           marks.find(MarkOf(version)) != std::string_view::npos;
}

/// Removes it while it is locked, so that nobody begins to use it meanwhile.
void RemoveLeftOver(PlatformFile& platform, const fs::path& path)
{
    FileStatus named, opened;
    if (platform.Status(path, named) || named.kind != FileStatus::Kind::File || !named.isMine ||
        TimeSince(named.touched) < std::chrono::hours(1))
        return;
    PlatformFile::Handle file = 0;
    if (platform.Open(path, PlatformFile::Purpose::Read, file))
        return;
    if (!platform.StatusOf(file, opened) && opened.IsUnchanged(named) && !platform.Lock(file))
        platform.Remove(path);
    platform.Close(file);
}

} // namespace

TemporaryFile::~TemporaryFile()
{
    if (m_isOpen)
        Close();
    if (!m_path.empty())
        m_platform.Remove(m_path);
}

std::error_code TemporaryFile::Create(const fs::path& folder)
{
    std::error_code error;
    for (int attempt = 0; attempt < 100; ++attempt) {
        m_path = m_created = folder / NewName(); // known before it is there, or it stays should memory end just then
        error = m_platform.Create(m_path, m_file);
        if (!error)
            break;
        m_path.clear();
        if (error != std::errc::file_exists)
            break;
    }
    m_isOpen = !error;
    if (error)
        return error;
    m_platform.Lock(m_file); // where there are no locks, its age alone protects it
    return {};
}

std::error_code TemporaryFile::Write(std::string_view text)
{
    return WriteAll(m_platform, m_file, text);
}

std::error_code TemporaryFile::Finish(bool sync)
{
    const std::error_code error = sync ? m_platform.Sync(m_file) : std::error_code();
    const std::error_code closed = Close();
    return error ? error : closed;
}

std::error_code TemporaryFile::Close()
{
    m_isOpen = false;
    return m_platform.Close(m_file);
}

std::error_code TemporaryFile::MoveTo(fs::path path)
{
    const std::error_code error = path == m_path ? std::error_code() : m_platform.RenameNew(m_path, path);
    if (!error)
        m_path = std::move(path); // which asks for no memory
    return error;
}

std::error_code TemporaryFile::Protect(const ProtectedAs& what)
{
    std::string name(Prefix);
    name += Between(m_created.filename(), Suffix) + MarkOf(what.target) + MarkOf(what.replacement);
    name += MarkOf(what.replaced);
    name += ProtectedSuffix;
    return MoveTo(FolderOf(m_created) / name);
}

void TemporaryFile::Unprotect()
{
    try {
        MoveTo(m_created);
    } catch (const std::bad_alloc&) { // as where that fails, it goes all the same unless the program ends before
    }
}

static std::error_code MoveToFreeName(PlatformFile& platform, const fs::path& from, const fs::path& path,
                                      std::string_view why, fs::path& kept)
{
    constexpr int most = 100000; // of copies beside one file
    std::error_code error;
    fs::path name = path;
    for (int number = 1; number <= most; ++number) {
        kept = NumberedName(name, why, number);
        error = platform.RenameNew(from, kept);
        if (error == std::errc::filename_too_long && name == path)
            name.replace_filename("kvr");
        else if (error != std::errc::file_exists)
            break;
    }
    return error;
}

std::error_code TemporaryFile::KeepAs(const fs::path& path, std::string_view why, fs::path& kept)
{
    const std::error_code error = MoveToFreeName(m_platform, m_path, path, why, kept);
    if (!error)
        Release();
    return error;
}

void RemoveLeftOvers(PlatformFile& platform, const fs::path& folder, const std::vector<fs::path>& names)
{
    for (const fs::path& name : names)
        if (IsOurName(name))
            RemoveLeftOver(platform, folder / name);
}

std::vector<fs::path> TakeProtected(PlatformFile& platform, const fs::path& target, const std::vector<fs::path>& names)
{
    std::vector<fs::path> found;
    const std::string mark = MarkOf(target);
    for (const fs::path& name : names) {
        const std::string marks = Between(name, ProtectedSuffix);
        const std::size_t begin = marks.find(mark);
        FileStatus status;
        fs::path path = FolderOf(target) / name, kept;
        // The first mark is the target's.
        if (begin == std::string::npos || begin != marks.find('-') || platform.Status(path, status) ||
            status.kind != FileStatus::Kind::File)
            continue;
        if (IsMarked(platform, path, std::string_view(marks).substr(begin + mark.size())) && status.isMine)
            platform.Remove(path);
        else
            found.push_back(MoveToFreeName(platform, path, target, DisplacedSuffix, kept) ? path : kept);
    }
    return found;
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

std::chrono::nanoseconds TimeSince(std::int64_t time)
{
    const auto now = std::chrono::system_clock::now().time_since_epoch();
    return std::chrono::duration_cast<std::chrono::nanoseconds>(now) - std::chrono::nanoseconds(time);
}

fs::path NumberedName(const fs::path& path, std::string_view why, int number)
{
    fs::path copy = path;
    copy += '.';
    copy += why;
    copy += '-' + std::to_string(number);
    return copy;
}
