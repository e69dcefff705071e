#include "files/file_lock.h"

#include "base/utf8_path.h"
#include "files/platform_process.h"
#include "files/temporary_file.h"

#include <algorithm>
#include <charconv>
#include <ctime>
#include <mutex>
#include <thread>
#include <vector>

namespace fs = std::filesystem;

namespace {

/// Beside the file that a link leads to. The extension counts in whatever case, for a save may change that.
std::error_code LockPath(PlatformFile& platform, fs::path& path, FileStatus& status)
{
    constexpr std::size_t longest = 240; // with what is put around it, as long as names may be
    if (const std::error_code error = FollowLinks(platform, path, status))
        return error;
    std::string name = Utf8FromPath(path.filename());
    const std::size_t dot = std::min(name.rfind('.'), name.size());
    std::transform(name.begin() + std::ptrdiff_t(dot), name.end(), name.begin() + std::ptrdiff_t(dot),
                   [](char c) { return c >= 'A' && c <= 'Z' ? char(c - 'A' + 'a') : c; });
    if (name.size() > longest)
        name = std::to_string(VersionOfText(name).hash);
    path = FolderOf(path) / PathFromUtf8("." + name + ".lock");
    return {};
}

// What stands in a lock file: a line for each of these, the name and a blank before the value.
constexpr std::string_view ProgramKey = "program ", ProcessKey = "process ", UserKey = "user ", HostKey = "host ",
                           SinceKey = "since ";

std::string ThisHolder(std::string_view program)
{
    const ProcessName process = ThisProcess();
    std::string text;
    const auto add = [&text](std::string_view key, std::string_view value) { text.append(key).append(value) += '\n'; };
    add(ProgramKey, program);
    add(ProcessKey, std::to_string(process.number));
    add(UserKey, process.user);
    add(HostKey, process.host);
    add(SinceKey, std::to_string(std::time(nullptr)));
    return text;
}

/// A value of a file that anybody may have written.
std::string ValueOf(std::string_view text, std::string_view key)
{
    constexpr std::size_t longest = 100;
    std::string line(1, '\n');
    line += key;
    std::size_t begin = text.starts_with(key) ? 0 : text.find(line);
    if (begin == std::string_view::npos)
        return {};
    begin += key.size() + (begin != 0 || text.front() == '\n');
    std::string value(text.substr(begin, std::min(text.find('\n', begin) - begin, longest)));
    std::erase_if(value, [](char c) { return (c >= 0 && c < ' ') || c == 127; });
    return value;
}

std::int64_t NumberOf(std::string_view text, std::string_view key)
{
    const std::string value = ValueOf(text, key);
    std::int64_t number = 0;
    std::from_chars(value.data(), value.data() + value.size(), number);
    return number;
}

constexpr std::size_t LongestText = 1000; // of a lock file

std::string ReadText(PlatformFile& platform, PlatformFile::Handle file)
{
    std::string text(LongestText, '\0');
    std::size_t got = 0;
    if (platform.Read(file, text.data(), text.size(), got))
        got = 0;
    text.resize(got);
    return text;
}

/// Whether it is what this program writes into a lock file, all of it, and nothing else: or zeros, which is what a loss
/// of power leaves of it.
bool IsHolderText(std::string_view text)
{
    if (text.find_first_not_of('\0') == std::string_view::npos)
        return true;
    for (const std::string_view key : {ProgramKey, ProcessKey, UserKey, HostKey, SinceKey}) {
        const std::size_t end = text.find('\n');
        if (end == std::string_view::npos || !text.starts_with(key))
            return false;
        const std::string_view value = text.substr(key.size(), end - key.size());
        const bool isNumber = key == ProcessKey || key == SinceKey;
        if (isNumber && (value.empty() || value.find_first_not_of("0123456789") != std::string_view::npos))
            return false;
        text.remove_prefix(end + 1);
    }
    return text.empty();
}

LockHolder ReadHolder(PlatformFile& platform, PlatformFile::Handle file)
{
    const std::string text = ReadText(platform, file);
    return {.program = ValueOf(text, ProgramKey),
            .user = ValueOf(text, UserKey),
            .host = ValueOf(text, HostKey),
            .process = NumberOf(text, ProcessKey),
            .since = NumberOf(text, SinceKey)};
}

/// Of a file that is locked itself: the lock beside it that names its holder is that of a name which is not known here.
LockHolder HolderOf(const FileStatus& file)
{
    ProcessName process = ProcessLocking(file.device, file.inode);
    return {.program = std::move(process.program),
            .user = std::move(process.user),
            .host = std::move(process.host),
            .process = process.number};
}

std::string TimeText(std::int64_t seconds)
{
    const std::time_t time = std::time_t(seconds);
    char text[32] = {};
    if (const std::tm* local = std::localtime(&time))
        std::strftime(text, sizeof text, "%Y-%m-%d %H:%M:%S", local);
    return text;
}

} // namespace

std::string HolderText(const LockHolder& holder)
{
    std::string text = holder.user.empty() ? "another program" : holder.user;
    if (!holder.host.empty())
        text += " on " + holder.host;
    if (!holder.program.empty() || holder.process)
        text += " (" + holder.program + (holder.program.empty() ? "" : ", ") + "process " +
                std::to_string(holder.process) + ')';
    if (const std::string since = holder.since ? TimeText(holder.since) : std::string(); !since.empty())
        text += " since " + since;
    return text;
}

namespace {

/// Whether what stands under the name of the lock was made for one. A file of the user's that is called so is left
/// alone.
bool IsLockFile(PlatformFile& platform, const fs::path& path, const FileStatus& status)
{
    if (status.kind != FileStatus::Kind::File || status.links > 1)
        return false;
    PlatformFile::Handle file = 0; // one of its own: it is read and then written from the start
    if (status.size == 0 || platform.Open(path, PlatformFile::Purpose::Read, file))
        return status.size == 0;
    const std::string text = ReadText(platform, file);
    platform.Close(file);
    return text.size() == status.size && IsHolderText(text);
}

/// Of this process: a copy of it has their files open, too.
struct HeldFiles
{
    std::mutex guard;
    std::vector<std::pair<PlatformFile*, PlatformFile::Handle>> files;

    void Add(PlatformFile& platform, PlatformFile::Handle file)
    {
        const std::lock_guard held(guard);
        files.emplace_back(&platform, file);
    }
    void Close(PlatformFile& platform, PlatformFile::Handle file)
    {
        {
            const std::lock_guard held(guard);
            std::erase(files, std::pair(&platform, file));
        }
        platform.Close(file);
    }
};
HeldFiles& TheHeldFiles()
{
    static HeldFiles held;
    return held;
}

} // namespace

FileLock& FileLock::operator=(FileLock&& other) noexcept
{
    if (this == &other)
        return *this;
    Release();
    m_heldBy = std::move(other.m_heldBy);
    m_whyNone = other.m_whyNone;
    m_path = std::move(other.m_path);
    m_file = other.m_file;
    m_itself = std::exchange(other.m_itself, std::nullopt);
    m_platform = std::exchange(other.m_platform, nullptr);
    return *this;
}

/// False when the lock file that was opened is no longer the one that others will open.
bool FileLock::TryOnce(const fs::path& path, std::string_view program, PlatformFile& platform)
{
    PlatformFile::Handle file = 0;
    m_path = path; // known before the file is there, or it stays should memory end just then
    m_whyNone = platform.Open(path, PlatformFile::Purpose::Lock, file);
    if (m_whyNone)
        return true;
    const std::error_code locked = platform.Lock(file);
    if (locked == std::errc::resource_unavailable_try_again) {
        m_heldBy = ReadHolder(platform, file);
        platform.Close(file);
        return true;
    }
    FileStatus opened, named;
    std::error_code unknown = platform.StatusOf(file, opened);
    if (!unknown)
        unknown = platform.Status(path, named);
    if (!locked && !unknown && !named.IsSameFile(opened)) { // who had it has removed it meanwhile
        platform.Close(file);
        return false;
    }
    const bool isOurs = !unknown && IsLockFile(platform, path, opened);
    m_whyNone = locked ? locked : unknown;
    if (!m_whyNone && !isOurs)
        m_whyNone = std::make_error_code(std::errc::file_exists);
    if (m_whyNone) {
        // Where there are no locks, a file made for one is of no use; one that holds a name may be another's.
        if (isOurs && (!locked || opened.size == 0))
            platform.Remove(path);
        platform.Close(file);
        return true;
    }
    m_platform = &platform;
    m_file = file;
    TheHeldFiles().Add(platform, file);
    // A lock without a name on it is one, too; half a name is not what the next one takes for left over.
    if (!platform.Cut(file, 0) && WriteAll(platform, file, ThisHolder(program)))
        platform.Cut(file, 0);
    return true;
}

/// Each of its names has a lock beside it, so a file of several is locked itself. False when somebody else has done so.
bool FileLock::TryItself(const fs::path& path)
{
    PlatformFile::Handle file = 0;
    if (m_platform->Open(path, PlatformFile::Purpose::Read, file))
        return true;
    const std::error_code locked = m_platform->Lock(file);
    if (!locked) {
        TheHeldFiles().Add(*m_platform, file);
        m_itself = file;
        return true;
    }
    m_platform->Close(file);
    return locked != std::errc::resource_unavailable_try_again;
}

void FileLock::Follow(const std::string& path)
{
    fs::path file = PathFromUtf8(path), beside = file;
    FileStatus there, locked;
    if (!m_platform || FollowLinks(*m_platform, file, there))
        return;
    if (!LockPath(*m_platform, beside, locked) && IsAt(beside))
        m_path = std::move(beside);
    if (m_itself && !m_platform->StatusOf(*m_itself, locked) && locked.IsSameFile(there))
        return;
    if (const auto before = std::exchange(m_itself, std::nullopt))
        TheHeldFiles().Close(*m_platform, *before);
    if (there.kind == FileStatus::Kind::File && there.links > 1)
        TryItself(file); // who was faster edits it, as this program does
}

FileLock FileLock::Try(const std::string& path, std::string_view program, PlatformFile* platformOrNull)
{
    constexpr int most = 1000; // times that somebody lets go of it just then
    PlatformFile& platform = OrNative(platformOrNull);
    FileLock lock;
    FileStatus status;
    fs::path beside = PathFromUtf8(path), file = beside;
    lock.m_whyNone = LockPath(platform, beside, status);
    if (lock.m_whyNone)
        return lock;
    bool isDone = false;
    for (int attempt = 0; attempt < most && !isDone; ++attempt)
        isDone = lock.TryOnce(beside, program, platform);
    if (!isDone)
        lock.m_heldBy.emplace();
    else if (lock.IsHeld() && status.kind == FileStatus::Kind::File && status.links > 1 && !lock.TryItself(file)) {
        lock.Release();
        lock.m_heldBy = HolderOf(status);
    }
    return lock;
}

FileLock FileLock::WaitFor(const std::string& path, std::string_view program, std::chrono::milliseconds longest,
                           PlatformFile* platform)
{
    using namespace std::chrono_literals;
    const auto end = std::chrono::steady_clock::now() + longest;
    FileLock lock = Try(path, program, platform);
    while (lock.m_heldBy && std::chrono::steady_clock::now() < end) {
        std::this_thread::sleep_for(10ms);
        lock = Try(path, program, platform);
    }
    return lock;
}

bool FileLock::IsFor(const std::string& path) const
{
    fs::path beside = PathFromUtf8(path);
    FileStatus status;
    return m_platform && !LockPath(*m_platform, beside, status) && IsAt(beside);
}

/// Whether the lock file that is held is the one that others find there.
bool FileLock::IsAt(const fs::path& path) const
{
    FileStatus held, named;
    return !m_platform->StatusOf(m_file, held) && !m_platform->Status(path, named) &&
           named.kind != FileStatus::Kind::None && named.IsSameFile(held);
}

std::function<bool()> FileLock::WasRemoved() const
{
    FileStatus held;
    if (!m_platform || m_platform->StatusOf(m_file, held))
        return [] { return false; };
    return [platform = m_platform, path = m_path, held] {
        FileStatus named, folder;
        if (platform->Status(path, named) || (named.kind != FileStatus::Kind::None && named.IsSameFile(held)))
            return false;
        return named.kind != FileStatus::Kind::None ||
               (!platform->Status(FolderOf(path), folder) && folder.kind == FileStatus::Kind::Folder);
    };
}

void FileLock::ShareWithCopies()
{
    HeldFiles& held = TheHeldFiles();
    const std::lock_guard guard(held.guard);
    std::erase(held.files, std::pair(m_platform, m_file));
}

void FileLock::LeaveToOriginal()
{
    HeldFiles& held = TheHeldFiles();
    const std::unique_lock guard(held.guard, std::try_to_lock); // whoever had it is not in the copy
    for (const auto& [platform, file] : held.files)
        platform->Close(file);
}

std::string FileLock::Path() const
{
    return Utf8FromPath(m_path);
}

void FileLock::Release()
{
    if (!m_platform)
        return;
    // Removed while it is locked: whoever has opened it by then finds that it is gone when he gets the lock. Should
    // somebody have removed it before, what stands there is another's.
    FileStatus opened, named;
    if (m_platform->StatusOf(m_file, opened) || m_platform->Status(m_path, named) || named.IsSameFile(opened))
        m_platform->Remove(m_path);
    for (const auto file : {std::optional(m_file), std::exchange(m_itself, std::nullopt)})
        if (file)
            TheHeldFiles().Close(*m_platform, *file);
    m_platform = nullptr;
}
