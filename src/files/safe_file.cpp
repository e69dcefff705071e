#include "files/safe_file.h"

#include "base/utf8_path.h"
#include "files/temporary_file.h"

#include <new>

namespace fs = std::filesystem;

namespace {

using Kind = FileStatus::Kind;

std::vector<std::string> Utf8(const std::vector<fs::path>& paths)
{
    std::vector<std::string> texts;
    for (const fs::path& path : paths)
        texts.push_back(Utf8FromPath(path));
    return texts;
}

/// One save, step by step.
class SafeWriter
{
public:
    SafeWriter(const std::string& path, const SafeFileOptions& options)
        : m_path(path), m_options(options), m_platform(OrNative(options.platform)), m_target(PathFromUtf8(path))
    {
    }
    Result<WriteReport> Write(std::string_view text);

private:
    std::error_code Look();
    Result<void> AskBefore();
    WriteAnswer Ask(WriteQuestion::Kind kind) const;
    std::error_code Fill(TemporaryFile& temporary, std::string_view text);
    bool IsExpected(const fs::path& path);
    Result<void> PutInPlace(TemporaryFile& temporary);
    void KeepDisplaced(TemporaryFile& temporary);
    Result<void> Replace(TemporaryFile& temporary);
    Result<void> WriteInPlace(TemporaryFile& temporary, std::string_view text);
    std::error_code Overwrite(std::string_view text, bool& begun);
    Result<void> KeepTarget();
    bool Rename(const fs::path& from, const fs::path& to);
    void TellLeftBehind(const std::vector<fs::path>& names);
    Error Failed(std::error_code reason) const { return NotWritten(m_path, reason); }
    Error FailedKeeping(std::error_code reason, const fs::path& kept) const;

    const std::string m_path;
    const SafeFileOptions& m_options;
    PlatformFile& m_platform;
    fs::path m_target, m_folder;
    FileStatus m_seen;         // the target when the save began
    bool m_isExpected = false; // it held what was expected then
    bool m_isSettled = false;  // and nobody had touched it for a while
    bool m_replacesOther = false;
    WriteReport m_report;
};

/// Finds out what is there. A question that the system does not answer ends the save: whoever takes "I do not know" for
/// "nothing" replaces links by files and forgets modes.
std::error_code SafeWriter::Look()
{
    for (const std::string& path : {m_path, m_options.renameTo})
        if (path.find('\0') != std::string::npos) // the system would take what stands before it for the name
            return std::make_error_code(std::errc::invalid_argument);
    if (const std::error_code error = FollowLinks(m_platform, m_target, m_seen))
        return error;
    m_folder = FolderOf(m_target);
    if (m_seen.kind == Kind::Folder)
        return std::make_error_code(std::errc::is_a_directory);
    if (m_seen.kind != Kind::File && m_seen.kind != Kind::None)
        return std::make_error_code(std::errc::operation_not_supported);
    m_isSettled = TimeSince(m_seen.modified) > std::chrono::seconds(2); // the coarsest clock of a file system
    if (m_seen.kind == Kind::File)
        if (const std::error_code error = m_platform.CheckWritable(m_target))
            return error;
    if (m_options.renameTo.empty())
        return {};
    FileStatus other;
    const std::error_code error = m_platform.Status(PathFromUtf8(m_options.renameTo), other);
    m_replacesOther = other.kind != Kind::None;
    return error;
}

WriteAnswer SafeWriter::Ask(WriteQuestion::Kind kind) const
{
    return m_options.ask({kind, m_path, m_report.lost, m_seen.links});
}

Result<void> SafeWriter::AskBefore()
{
    const Error cancelled = Failed(std::make_error_code(std::errc::operation_canceled));
    if (m_seen.kind == Kind::None)
        return {};
    if (m_options.expected) {
        FileVersion found;
        if (const std::error_code error = VersionOfFile(m_platform, m_target, found, m_options.expected))
            return Failed(error);
        m_isExpected = found == *m_options.expected;
        if (!m_isExpected && !m_options.ask)
            return Failed(std::make_error_code(ChangedOutside));
        if (!m_isExpected && Ask(WriteQuestion::ChangedOutside) != WriteAnswer::Yes)
            return cancelled;
    }
    m_report.inPlace = m_seen.links > 1;
    if (!m_report.inPlace || !m_options.ask)
        return {};
    const WriteAnswer answer = Ask(WriteQuestion::HardLinks);
    m_report.inPlace = answer == WriteAnswer::Yes;
    return answer == WriteAnswer::Cancel ? cancelled : Result<void>();
}

std::error_code SafeWriter::Fill(TemporaryFile& temporary, std::string_view text)
{
    if (const std::error_code error = temporary.Create(m_folder))
        return error;
    if (const std::error_code error = temporary.Write(text))
        return error;
    if (m_report.inPlace) // what is there keeps its own
        return {};
    return m_seen.kind == Kind::File ? m_platform.TakePermissions(temporary.Handle(), m_target, m_report.lost)
                                     : m_platform.TakeNewPermissions(temporary.Handle(), m_folder);
}

/// Whether a file is what the save was meant to replace. Where the content is known, it is read again unless the time
/// of the last change is far enough back that another one would show in it. What the system does not answer is no, and
/// the report says why.
bool SafeWriter::IsExpected(const fs::path& path)
{
    FileStatus status;
    std::error_code& unknown = m_report.unknown;
    unknown = m_platform.Status(path, status);
    if (unknown || m_seen.kind == Kind::None || status.kind != Kind::File)
        return false;
    if (!m_options.expected || (m_isExpected && m_isSettled && status.IsUnchanged(m_seen)))
        return status.IsUnchanged(m_seen);
    FileVersion found;
    unknown = VersionOfFile(m_platform, path, found, m_options.expected);
    return !unknown && found == *m_options.expected;
}

/// Puts the finished temporary file in the place of the target. Whether somebody wrote to the target in the last moment
/// is seen for certain only afterwards, on what has just been swapped out.
Result<void> SafeWriter::PutInPlace(TemporaryFile& temporary)
{
    bool exists = m_seen.kind == Kind::File;
    std::error_code error;
    for (int attempt = 0; attempt < 2; ++attempt) {
        if (exists &&
            (error = temporary.Protect({m_target, m_report.version, m_options.expected.value_or(FileVersion())})))
            break;
        std::string name = exists ? Utf8FromPath(temporary.Path()) : std::string();
        m_report.displaced.swap(name); // should it have to stay there; behind the swap there may be no memory
        error =
            exists ? m_platform.Exchange(temporary.Path(), m_target) : m_platform.RenameNew(temporary.Path(), m_target);
        if (error != (exists ? std::errc::no_such_file_or_directory : std::errc::file_exists))
            break;
        exists = !exists; // it has come or gone meanwhile
    }
    if (error || !exists)
        m_report.displaced.clear();
    if (error == std::errc::function_not_supported)
        return Replace(temporary);
    if (error)
        return Failed(error);
    if (exists)
        KeepDisplaced(temporary);
    else
        temporary.Release();
    return {};
}

/// What was swapped out now stands under the temporary name, and goes with it if it is what was meant to. Otherwise it
/// is somebody's, and stays under that name where it can be given no better one.
void SafeWriter::KeepDisplaced(TemporaryFile& temporary)
{
    if (IsExpected(temporary.Path())) {
        m_report.displaced.clear();
        temporary.Unprotect(); // waiting for the disk takes long enough for the program to end meanwhile
        return;
    }
    try {
        fs::path kept;
        if (!temporary.KeepAs(m_target, DisplacedSuffix, kept))
            m_report.displaced = Utf8FromPath(kept);
    } catch (const std::bad_alloc&) { // the file is written, and what came out stays, be it under that name
    }
    temporary.Release();
}

Result<void> SafeWriter::KeepTarget()
{
    const Result<KeptCopy> kept = KeepOriginal(Utf8FromPath(m_target), DisplacedSuffix, &m_platform);
    if (!kept)
        return kept.error();
    m_report.displaced = kept.value().path;
    return {};
}

/// Where files cannot be swapped: a last look, as late as can be, and one for the other. A replacement that fails half
/// way may have cost the target; unless that is seen to be there the temporary file may be all there is, and stays.
Result<void> SafeWriter::Replace(TemporaryFile& temporary)
{
    FileStatus now, last;
    if (const std::error_code error = m_platform.Status(m_target, now))
        return Failed(error);
    if (now.kind != Kind::None &&
        (!IsExpected(m_target) || (m_report.unknown = m_platform.Status(m_target, last)) || !last.IsUnchanged(now)))
        if (Result<void> kept = KeepTarget(); !kept)
            return kept;
    const std::error_code error = m_platform.Replace(temporary.Path(), m_target);
    if (!error) {
        temporary.Release();
        return {};
    }
    FileStatus left;
    const bool isThere = !m_platform.Status(m_target, left) && left.kind != Kind::None;
    if (m_seen.kind == Kind::None || isThere)
        return Failed(error);
    const fs::path kept = temporary.Path();
    temporary.Release();
    return FailedKeeping(error, kept);
}

/// Writes over a file that has several names. Until that is done, the whole new content stands beside it under a name
/// that speaks for itself.
Result<void> SafeWriter::WriteInPlace(TemporaryFile& temporary, std::string_view text)
{
    fs::path copy;
    if (const std::error_code error = temporary.KeepAs(m_target, UnfinishedSuffix, copy))
        return Failed(error);
    if (m_options.sync)
        m_platform.SyncFolder(m_folder); // where there is no such thing, the copy has to do as it is
    bool begun = false;
    const std::error_code error = Overwrite(text, begun);
    if (error && begun)
        return FailedKeeping(error, copy);
    m_platform.Remove(copy);
    return error ? Result<void>(Failed(error)) : Result<void>();
}

std::error_code SafeWriter::Overwrite(std::string_view text, bool& begun)
{
    PlatformFile::Handle file = 0;
    if (const std::error_code error = m_platform.Open(m_target, PlatformFile::Purpose::Change, file))
        return error;
    FileStatus now;
    std::error_code error = m_platform.StatusOf(file, now);
    if (!error && (!now.IsUnchanged(m_seen) || !IsExpected(m_target)))
        if (const Result<void> kept = KeepTarget(); !kept)
            error = kept.error().code;
    begun = !error;
    if (!error)
        error = WriteAll(m_platform, file, text);
    if (!error && now.size > text.size())
        error = m_platform.Cut(file, text.size());
    if (!error && m_options.sync)
        error = m_platform.Sync(file);
    const std::error_code closed = m_platform.Close(file);
    return error ? error : closed;
}

/// Gives the entry - a link itself - its new spelling, if any. The content is safe already.
bool SafeWriter::Rename(const fs::path& from, const fs::path& to)
{
    if (to.empty())
        return false;
    if (m_options.sync && !m_report.displaced.empty()) // it has its name on the medium before the file loses its own
        m_platform.SyncFolder(m_folder);
    m_report.notRenamed = m_replacesOther ? m_platform.Rename(from, to) : m_platform.RenameNew(from, to);
    return !m_report.notRenamed;
}

Error SafeWriter::FailedKeeping(std::error_code reason, const fs::path& kept) const
{
    Error failure = Failed(reason);
    failure.kept = Utf8FromPath(kept);
    failure.message += " The new content is complete in \"" + failure.kept + "\".";
    return failure;
}

Result<WriteReport> SafeWriter::Write(std::string_view text)
{
    if (const std::error_code error = Look())
        return Failed(error);
    if (const Result<void> agreed = AskBefore(); !agreed)
        return agreed.error();
    std::vector<fs::path> before; // in the folder
    if (!m_platform.List(m_folder, before))
        RemoveLeftOvers(m_platform, m_folder, before);
    TemporaryFile temporary(m_platform);
    if (const std::error_code error = Fill(temporary, text))
        return Failed(error);
    if (m_report.lost.Any() && m_options.ask && Ask(WriteQuestion::LosesMetadata) != WriteAnswer::Yes)
        return Failed(std::make_error_code(std::errc::operation_canceled));
    if (const std::error_code error = temporary.Finish(m_options.sync))
        return Failed(error);
    m_report.version = VersionOfText(text);
    // What is done behind this asks for no memory: the file is written, and that has to be said.
    const fs::path entry = PathFromUtf8(m_path), spelling = PathFromUtf8(m_options.renameTo),
                   entryFolder = FolderOf(entry);
    if (const Result<void> put = m_report.inPlace ? WriteInPlace(temporary, text) : PutInPlace(temporary); !put)
        return put.error();
    // The new content is in place and whole. Should a folder not reach the medium before the power fails, the old
    // content is found whole instead: no failure, but not what a user takes "saved" for either.
    const bool renamed = Rename(entry, spelling);
    if (m_options.sync && !m_report.inPlace)
        m_report.unconfirmed = m_platform.SyncFolder(m_folder);
    if (m_options.sync && renamed && !m_report.unconfirmed && (m_report.inPlace || entryFolder != m_folder))
        m_report.unconfirmed = m_platform.SyncFolder(entryFolder);
    TellLeftBehind(before);
    return std::move(m_report);
}

/// When it is certain that the user hears of it.
void SafeWriter::TellLeftBehind(const std::vector<fs::path>& names)
{
    try {
        if (m_options.isLocked)
            m_report.leftBehind = Utf8(TakeProtected(m_platform, m_target, names));
    } catch (const std::bad_alloc&) { // it is written, and what is left is found the next time
    }
}

} // namespace

Result<WriteReport> WriteFileSafely(const std::string& path, std::string_view text, const SafeFileOptions& options)
{
    return SafeWriter(path, options).Write(text);
}

std::vector<std::string> NameLeftBehind(const std::string& path, PlatformFile* platformOrNull)
{
    PlatformFile& platform = OrNative(platformOrNull);
    fs::path target = PathFromUtf8(path);
    FileStatus status;
    std::vector<fs::path> names;
    if (FollowLinks(platform, target, status) || platform.List(FolderOf(target), names))
        return {};
    return Utf8(TakeProtected(platform, target, names));
}

std::vector<std::string> UnfinishedSaves(const std::string& path, PlatformFile* platformOrNull)
{
    PlatformFile& platform = OrNative(platformOrNull);
    fs::path target = PathFromUtf8(path);
    FileStatus status, copy;
    std::vector<std::string> found;
    if (FollowLinks(platform, target, status))
        return found;
    constexpr int most = 9; // whoever has so many knows of them
    for (int number = 1; number <= most; ++number) {
        const fs::path name = NumberedName(target, UnfinishedSuffix, number);
        if (!platform.Status(name, copy) && copy.kind == Kind::File)
            found.push_back(Utf8FromPath(name));
    }
    return found;
}

std::string FreeCopyName(const std::string& path, std::string_view why)
{
    std::error_code ignored;
    for (int number = 1;; ++number) {
        const fs::path copy = NumberedName(PathFromUtf8(path), why, number);
        if (!fs::exists(fs::symlink_status(copy, ignored)))
            return Utf8FromPath(copy);
    }
}

Result<KeptCopy> KeepOriginal(const std::string& path, std::string_view why, PlatformFile* platformOrNull)
{
    PlatformFile& platform = OrNative(platformOrNull);
    const Result<std::string> content = ReadWholeFile(path, &platform);
    if (!content)
        return content.error();
    const fs::path original = PathFromUtf8(path);
    TemporaryFile temporary(platform);
    LostMetadata lost;
    fs::path kept;
    std::error_code error = temporary.Create(FolderOf(original));
    if (!error)
        error = temporary.Write(content.value());
    if (!error)
        error = platform.TakePermissions(temporary.Handle(), original, lost);
    if (!error)
        error = temporary.Finish(true);
    if (!error)
        error = temporary.KeepAs(original, why, kept);
    if (error)
        return NotWritten(Utf8FromPath(NumberedName(original, why, 1)), error);
    platform.SyncFolder(FolderOf(original)); // a copy that the disk does not confirm is better than none
    return KeptCopy{Utf8FromPath(kept), VersionOfText(content.value())};
}

std::string LostText(const LostMetadata& lost)
{
    std::string text;
    for (const LostPart& part : LostParts)
        if (lost.*part.member) {
            text += text.empty() ? "" : ", ";
            text += part.name;
        }
    return text;
}
