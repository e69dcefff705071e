#include "ks/fc/file_watch.h"

#include "base/utf8_path.h"
#include "files/temporary_file.h"
#include "ks/fc/watched_files.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QFileInfo>
#include <QPointer>
#include <chrono>
#include <utility>

namespace {

using namespace std::chrono_literals;

constexpr auto Rest = 200ms;       // that a file is given when it has been written to
constexpr auto LongestWait = 1500; // milliseconds, of a file that is written to all the time
constexpr auto CoarsestClock = 2s; // of a file system

std::int64_t Now()
{
    return QDateTime::currentMSecsSinceEpoch() * 1'000'000;
}

/// Nobody has had anything to do with the file in between.
bool IsUntouched(const FileStatus& a, const FileStatus& b)
{
    return a.IsUnchanged(b) && a.touched == b.touched;
}

/// The file that a path leads to, its folder, and that of a link: who changes a link changes its folder.
QStringList WatchedPaths(const CString& path)
{
    auto target = QFileInfo(path).filesystemFilePath();
    FileStatus status;
    FollowLinks(PlatformFile::Native(), target, status);
    const CString file = QString::fromStdString(Utf8FromPath(target));
    QStringList paths{file, QFileInfo(file).path(), QFileInfo(path).path()};
    paths.removeDuplicates();
    return paths;
}

} // namespace

/// What the reader has found.
struct CKsFileWatch::Look
{
    FileStatus status;
    FileVersion version{};
    std::error_code why{};
    bool isTrusted = false; // see m_isTrusted
    bool isMoving = false;  // somebody is writing
};

/// In the reader's thread.
CKsFileWatch::Look CKsFileWatch::LookAt(const std::string& path, const FileStatus& seen, const FileVersion& version,
                                        bool isTrusted, const std::optional<FileVersion>& known)
{
    PlatformFile& platform = PlatformFile::Native();
    Look look;
    auto target = PathFromUtf8(path);
    look.why = FollowLinks(platform, target, look.status);
    if (look.why || look.status.kind == FileStatus::Kind::None)
        return look;
    if (look.status.kind != FileStatus::Kind::File) {
        look.why =
            std::make_error_code(look.status.kind == FileStatus::Kind::Folder ? std::errc::is_a_directory
                                                                              : std::errc::operation_not_supported);
        return look;
    }
    look.isTrusted = TimeSince(look.status.touched) > CoarsestClock;
    if (isTrusted && IsUntouched(look.status, seen)) {
        look.version = version;
        return look;
    }
    look.why = VersionOfFile(platform, target, look.version, known);
    if (look.version.hash == 0) // it was not read, and may be another one of this size next time
        look.version.hash = IsUntouched(look.status, seen) ? version.hash : std::uint64_t(look.status.touched);
    FileStatus after;
    const bool isThere = !FollowLinks(platform, target, after);
    look.isMoving = !isThere || !IsUntouched(look.status, after);
    return look;
}

CKsFileWatch::CKsFileWatch(QObject* parent) : QObject(parent)
{
    m_soon.setSingleShot(true);
    connect(&m_soon, &QTimer::timeout, this, &CKsFileWatch::Start);
}

CKsFileWatch::~CKsFileWatch()
{
    if (qApp)
        CWatchedFiles::Instance().Remove(*this);
}

void CKsFileWatch::Expect(const CString& path, const std::optional<FileVersion>& known, const FileStatus& seen)
{
    ++m_generation;
    CWatchedFiles& files = CWatchedFiles::Instance();
    files.Remove(*this);
    m_path = path;
    m_watched = WatchedPaths(path);
    files.Add(*this);
    m_known = known;
    m_version = known.value_or(FileVersion());
    m_seen = seen;
    m_isTrusted = known && TimeSince(seen.touched) > CoarsestClock;
    m_wasMissed = false;
    Take({});
    LookSoon(); // it may have been written to before it was watched
}

void CKsFileWatch::LookSoon()
{
    if (!m_soon.isActive())
        m_waits.start();
    if (!m_soon.isActive() || m_waits.elapsed() < LongestWait)
        m_soon.start(Rest);
}

void CKsFileWatch::Start()
{
    if (std::exchange(m_isLooking, true)) {
        m_looksAgain = true;
        return;
    }
    // A copy of the process that is made meanwhile (a snapshot) holds nothing that the reader does: it only reads
    // files.
    CWatchedFiles& files = CWatchedFiles::Instance();
    const auto look = [&files, watch = QPointer(this), path = m_path.toStdString(), seen = m_seen, version = m_version,
                       isTrusted = m_isTrusted, known = m_known, generation = m_generation] {
        const Look found = LookAt(path, seen, version, isTrusted, known);
        QMetaObject::invokeMethod(
            &files,
            [watch, found, generation] {
                if (watch)
                    watch->Looked(found, generation);
            },
            Qt::QueuedConnection);
    };
    files.Reader().start(look);
}

void CKsFileWatch::Looked(const Look& look, int generation)
{
    m_isLooking = false;
    const bool isGone = !look.why && look.status.kind == FileStatus::Kind::None;
    const bool isMissed = isGone || look.why, isOutOfDate = generation != m_generation || look.isMoving;
    if (std::exchange(m_looksAgain, false) || isOutOfDate || (isMissed && !m_wasMissed)) {
        m_wasMissed = isMissed && !isOutOfDate;
        LookSoon();
        return;
    }
    m_wasMissed = isMissed;
    m_isTrusted = look.isTrusted && !isMissed;
    const bool hasMoreNames = look.status.links > m_seen.links && look.status.links > 1;
    m_seen = look.status;
    m_version = look.version;
    if (hasMoreNames)
        emit HasMoreNames();
    if (isGone)
        Take({.kind = KsFileSight::Gone, .time = Now()});
    else if (look.why && m_known)
        Take({.kind = KsFileSight::Unreadable, .why = look.why, .time = Now()});
    else if (look.why || m_known == look.version)
        Take({});
    else
        Take({.kind = KsFileSight::Other, .version = look.version, .time = look.status.modified});
}

void CKsFileWatch::Take(KsFileSight sight)
{
    const bool isNews = sight.kind != m_sight.kind || !(sight.version == m_sight.version) || sight.why != m_sight.why;
    if (!isNews)
        return;
    m_sight = std::move(sight);
    emit Changed();
}
