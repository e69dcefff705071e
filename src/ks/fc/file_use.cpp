#include "ks/fc/file_use.h"

#include "ks/fc/file_name.h"
#include "ks/fc/shown_text.h"
#include "ks/fc/watched_files.h"
#include "ks/language/date_time.h"

#include <QDateTime>
#include <QDeadlineTimer>
#include <QFileInfo>
#include <QPointer>
#include <utility>
#include <vector>

namespace {

using namespace std::chrono_literals;

constexpr char Program[] = "kvrshell";
constexpr auto ShortUse = 1000ms; // what a command needs that changes a file
constexpr auto Rest = 10s;
constexpr auto Interval = 2000ms; // between two looks at a file that somebody has

/// Of all documents.
std::vector<CKsFileUse*>& AllUses()
{
    static std::vector<CKsFileUse*> uses;
    return uses;
}

} // namespace

CString CKsFileUse::NameOf(const FileLock& lock)
{
    const LockHolder holder = lock.HeldBy().value_or(LockHolder());
    const auto text = [](const std::string& each) { return KsVisibleText(QString::fromStdString(each)); };
    if (holder.user.empty() || !holder.process)
        return tr("another program");
    const CString number = QString::number(holder.process);
    if (!holder.since)
        return tr("%1 on %2 (%3, process %4)").arg(text(holder.user), text(holder.host), text(holder.program), number);
    return tr("%1 on %2 (%3, process %4) since %5")
        .arg(text(holder.user), text(holder.host), text(holder.program), number,
             KsDateTimeText(QDateTime::fromSecsSinceEpoch(holder.since)));
}

CKsFileUse::CKsFileUse(QObject* parent) : QObject(parent)
{
    m_timer.setInterval(Interval);
    connect(&m_timer, &QTimer::timeout, this, &CKsFileUse::Look);
    AllUses().push_back(this);
}

CKsFileUse::~CKsFileUse()
{
    std::erase(AllUses(), this);
}

/// The lock of a document whose folder has got another name, when that is where the path leads by now.
FileLock* CKsFileUse::OwnAt(const CString& path)
{
    for (CKsFileUse* use : AllUses())
        if (use->m_lock.IsFor(path.toStdString()) && !use->m_lock.IsFor(use->m_path.toStdString()))
            return &use->m_lock;
    return nullptr;
}

FileLock CKsFileUse::Try(const CString& path)
{
    FileLock lock = FileLock::Try(path.toStdString(), Program);
    if (FileLock* const own = lock.HeldBy() ? OwnAt(path) : nullptr) {
        lock = std::move(*own);
        lock.Follow(path.toStdString());
    }
    return lock;
}

/// Of the programs that hold a file for long, this is the one.
FileLock CKsFileUse::Lock(const CString& path)
{
    static QDeadlineTimer rest; // after a wait in vain: who opens many files waits once
    FileLock lock = Try(path);
    if (!lock.HeldBy() || lock.HeldBy()->program == Program || !rest.hasExpired())
        return lock;
    lock = FileLock::WaitFor(path.toStdString(), Program, ShortUse);
    if (lock.HeldBy())
        rest.setRemainingTime(Rest);
    return lock;
}

void CKsFileUse::Take(const CString& path)
{
    m_path = path;
    m_lock = Lock(path);
    m_rival = {};
    m_isFree = false;
    m_timer.start();
    emit Changed();
}

/// The disk is waited for in the thread that reads, as of a file that is followed.
void CKsFileUse::Look()
{
    if (IsElsewhere())
        return LookAtHolder();
    // None is held: somebody else was faster, or the lock is another document's, whose file stands there no more.
    if (!m_lock.IsHeld() && (!m_lock.WhyNone() || m_lock.WhyNone() == std::errc::no_such_file_or_directory))
        return TakeAgain();
    if (!m_lock.IsHeld() || std::exchange(m_isLooking, true))
        return;
    CWatchedFiles& files = CWatchedFiles::Instance();
    files.Reader().start([&files, use = QPointer(this), wasRemoved = m_lock.WasRemoved()] {
        const auto looked = [use, isRemoved = wasRemoved()] {
            if (!use)
                return;
            use->m_isLooking = false;
            if (isRemoved && use->m_lock.WasRemoved()()) // it may have been another one meanwhile
                use->TakeAgain();
        };
        QMetaObject::invokeMethod(&files, looked, Qt::QueuedConnection);
    });
}

/// Whoever edits goes on even when somebody else was faster, for his changes are not saved: he is told, and each save
/// looks at the content.
void CKsFileUse::TakeAgain()
{
    const CString rival = Rival();
    const std::error_code whyNone = WhyNone();
    m_lock = {}; // first: a file of several names is locked itself
    m_lock = Try(m_path);
    m_rival = m_lock.HeldBy() ? std::exchange(m_lock, FileLock()) : FileLock();
    if (Rival() != rival || WhyNone() != whyNone)
        emit LockLost();
}

/// It is let go at once: whoever wants to edit the file asks for it, and until then others may.
void CKsFileUse::LookAtHolder()
{
    FileLock look = FileLock::Try(m_path.toStdString(), Program);
    const bool isFree = !look.HeldBy(), isOther = !isFree && NameOf(look) != Holder();
    if (isOther)
        m_lock = std::move(look);
    if (std::exchange(m_isFree, isFree) != isFree || isOther)
        emit Changed();
}

CString CKsFileUse::Holder() const
{
    return NameOf(m_lock);
}

std::error_code CKsFileUse::WhyNone() const
{
    const std::error_code why = m_lock.WhyNone();
    // Where the user may make no file he writes none either.
    const bool cannotWrite = why == std::errc::permission_denied || why == std::errc::operation_not_permitted ||
                             why == std::errc::read_only_file_system || why == std::errc::no_such_file_or_directory;
    return cannotWrite ? std::error_code() : why;
}

bool CKsFileUse::TakeTarget(const CString& target)
{
    m_target = FileLock();
    if (m_lock.WasRemoved()())
        TakeAgain();
    // The own entry is about to be respelt: a lock beside the new name of a link would not be that of its file.
    const bool isRespelt = KsFileKey(target) == KsFileKey(m_path) && !QFileInfo::exists(target);
    if (m_lock.IsFor(target.toStdString()) || (isRespelt && m_lock.IsHeld()))
        return true;
    m_target = Lock(target);
    return !m_target.HeldBy();
}

CString CKsFileUse::TargetHolder() const
{
    return NameOf(m_target);
}

CString CKsFileUse::HolderOf(const CString& path) const
{
    if (m_lock.IsFor(path.toStdString()) || OwnAt(path))
        return {};
    const FileLock lock = Lock(path);
    return lock.HeldBy() ? NameOf(lock) : CString();
}

void CKsFileUse::Follow(const CString& path)
{
    m_lock.Follow(path.toStdString());
}

void CKsFileUse::TargetWritten(bool written, const CString& path)
{
    FileLock target = std::exchange(m_target, FileLock());
    if (!written)
        return;
    m_path = path;
    m_timer.start();
    // The lock of the file itself stays, whatever was known of the target before it was written.
    if ((!target.IsHeld() && !target.WhyNone()) || m_lock.IsFor(path.toStdString()))
        return Follow(path);
    m_lock = std::move(target);
    m_rival = {};
    Follow(path);
    m_isFree = false;
    emit Changed();
}
