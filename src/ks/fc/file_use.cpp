#include "ks/fc/file_use.h"

#include "ks/fc/file_name.h"
#include "ks/fc/shown_text.h"
#include "ks/language/date_time.h"

#include <QDateTime>
#include <QDeadlineTimer>
#include <QFileInfo>
#include <utility>

namespace {

using namespace std::chrono_literals;

constexpr char Program[] = "kvrshell";
constexpr auto ShortUse = 1000ms; // what a command needs that changes a file
constexpr auto Rest = 10s;
constexpr auto Interval = 2000ms; // between two looks at a file that somebody has

CString HolderName(const FileLock& lock)
{
    const LockHolder holder = lock.HeldBy().value_or(LockHolder());
    const auto text = [](const std::string& each) { return KsVisibleText(QString::fromStdString(each)); };
    if (holder.user.empty() || !holder.process)
        return CKsFileUse::tr("another program");
    const CString number = QString::number(holder.process);
    if (!holder.since)
        return CKsFileUse::tr("%1 on %2 (%3, process %4)")
            .arg(text(holder.user), text(holder.host), text(holder.program), number);
    return CKsFileUse::tr("%1 on %2 (%3, process %4) since %5")
        .arg(text(holder.user), text(holder.host), text(holder.program), number,
             KsDateTimeText(QDateTime::fromSecsSinceEpoch(holder.since)));
}

} // namespace

CKsFileUse::CKsFileUse(QObject* parent) : QObject(parent)
{
    m_timer.setInterval(Interval);
    connect(&m_timer, &QTimer::timeout, this, &CKsFileUse::Look);
}

/// Of the programs that hold a file for long, this is the one.
FileLock CKsFileUse::Lock(const CString& path)
{
    static QDeadlineTimer rest; // after a wait in vain: who opens many files waits once
    FileLock lock = FileLock::Try(path.toStdString(), Program);
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
    m_isFree = false;
    if (IsElsewhere())
        m_timer.start();
    else
        m_timer.stop();
    emit Changed();
}

/// It is let go at once: whoever wants to edit the file asks for it, and until then others may.
void CKsFileUse::Look()
{
    FileLock look = FileLock::Try(m_path.toStdString(), Program);
    const bool isFree = !look.HeldBy(), isOther = !isFree && HolderName(look) != Holder();
    if (isOther)
        m_lock = std::move(look);
    if (std::exchange(m_isFree, isFree) != isFree || isOther)
        emit Changed();
}

CString CKsFileUse::Holder() const
{
    return HolderName(m_lock);
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
    // The own entry is about to be respelt: a lock beside the new name of a link would not be that of its file.
    const bool isRespelt = KsFileKey(target) == KsFileKey(m_path) && !QFileInfo::exists(target);
    if (m_lock.IsFor(target.toStdString()) || (isRespelt && m_lock.IsHeld()))
        return true;
    m_target = Lock(target);
    return !m_target.HeldBy();
}

CString CKsFileUse::TargetHolder() const
{
    return HolderName(m_target);
}

CString CKsFileUse::HolderOf(const CString& path) const
{
    if (m_lock.IsFor(path.toStdString()))
        return {};
    const FileLock lock = Lock(path);
    return lock.HeldBy() ? HolderName(lock) : CString();
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
    // The lock of the file itself stays, whatever was known of the target before it was written.
    if ((!target.IsHeld() && !target.WhyNone()) || m_lock.IsFor(path.toStdString()))
        return Follow(path);
    m_lock = std::move(target);
    Follow(path);
    m_isFree = false;
    m_timer.stop();
    emit Changed();
}
