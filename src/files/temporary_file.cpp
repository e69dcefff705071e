#include "files/temporary_file.h"

#include <algorithm>
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

bool IsOurName(const fs::path& name)
{
    const std::u8string text = name.u8string();
    if (text.size() <= Prefix.size() + Suffix.size() || !std::equal(Prefix.begin(), Prefix.end(), text.begin()) ||
        !std::equal(Suffix.rbegin(), Suffix.rend(), text.rbegin()))
        return false;
    const auto isDigit = [](char8_t c) { return (c >= '0' && c <= '9') || (c >= 'a' && c <= 'f'); };
    return std::all_of(text.begin() + Prefix.size(), text.end() - Suffix.size(), isDigit);
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
        m_path = folder / NewName(); // known before it is there, or it stays should memory end just then
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

std::error_code TemporaryFile::EndNameWith(std::string_view suffix)
{
    fs::path name = m_path;
    name.replace_extension(suffix);
    const std::error_code error = name == m_path ? std::error_code() : m_platform.RenameNew(m_path, name);
    if (!error)
        m_path = std::move(name);
    return error;
}

std::error_code TemporaryFile::Protect()
{
    return EndNameWith(ProtectedSuffix);
}

void TemporaryFile::Unprotect()
{
    try {
        EndNameWith(Suffix);
    } catch (const std::bad_alloc&) { // as where that fails, it goes all the same unless the program ends before
    }
}

std::error_code TemporaryFile::KeepAs(const fs::path& path, std::string_view why, fs::path& kept)
{
    constexpr int most = 100000; // of copies beside one file
    std::error_code error;
    fs::path name = path;
    for (int number = 1; number <= most; ++number) {
        kept = NumberedName(name, why, number);
        error = m_platform.RenameNew(m_path, kept);
        if (error == std::errc::filename_too_long && name == path)
            name.replace_filename("kvr");
        else if (error != std::errc::file_exists)
            break;
    }
    if (!error)
        Release();
    return error;
}

void RemoveLeftOvers(PlatformFile& platform, const fs::path& folder)
{
    std::vector<fs::path> names;
    if (platform.List(folder, names))
        return;
    for (const fs::path& name : names)
        if (IsOurName(name))
            RemoveLeftOver(platform, folder / name);
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
