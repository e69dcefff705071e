#include "shell/recovery_folder.h"

#include "files/platform_process.h"
#include "files/private_folder.h"

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QDir>
#include <QFileInfo>
#include <QStandardPaths>
#include <QThread>
#include <QUuid>
#include <algorithm>

namespace {

const QString Files = QStringLiteral("*.recovery");
const QString Temporaries = QStringLiteral(".kvr-*"); // of writers that were stopped

/// Beside the settings: the folder for what a program keeps from one run to the next.
QString StateFolder()
{
#ifdef Q_OS_WIN
    return QStandardPaths::writableLocation(QStandardPaths::AppLocalDataLocation);
#else
    QString states = qEnvironmentVariable("XDG_STATE_HOME");
    if (!QDir::isAbsolutePath(states))
        states = QDir::homePath() + QStringLiteral("/.local/state");
    return QDir::cleanPath(states) + u'/' + QCoreApplication::organizationName() + u'/' +
           QCoreApplication::applicationName();
#endif
}

QString NewName()
{
    return QUuid::createUuid().toString(QUuid::WithoutBraces);
}

QStringList Entries(const QString& folder, const QString& pattern)
{
    const QDir::Filters whatever = QDir::Files | QDir::Hidden | QDir::System; // links and devices, too
    QStringList paths;
    for (const QString& name : QDir(folder).entryList({pattern}, whatever, QDir::Name))
        paths << folder + u'/' + name;
    return paths;
}

void RemoveTemporaries(const QString& folder)
{
    for (const QString& file : Entries(folder, Temporaries))
        QFile::remove(file);
}

FileLock LockOf(const QString& folder)
{
    FileLock lock = FileLock::Try((folder + QStringLiteral("/session")).toStdString(),
                                  QCoreApplication::applicationName().toStdString());
    lock.ShareWithCopies(); // they write here when the program has ended already
    return lock;
}

/// Whether the process that took a lock has ended, so that a copy of it is all that still holds it.
bool IsOrphan(const FileLock& lock)
{
    return lock.HeldBy() && lock.HeldBy()->host == ThisProcess().host && HasEnded(lock.HeldBy()->process);
}

/// Something stands under its name that is no lock: no session that lives has made it.
bool IsDamaged(const FileLock& lock)
{
    const std::error_code why = lock.WhyNone();
    return why == std::errc::file_exists || why == std::errc::is_a_directory ||
           why == std::errc::too_many_symbolic_link_levels;
}

} // namespace

CRecoveryFolder::CRecoveryFolder() : m_root(StateFolder() + QStringLiteral("/recovery")) {}

CRecoveryFolder::~CRecoveryFolder()
{
    if (m_own)
        Tidy(*m_own);
    for (Session& session : m_others)
        Tidy(session);
}

/// The folder goes unless there is something to recover in it.
void CRecoveryFolder::Tidy(Session& session)
{
    RemoveTemporaries(session.folder);
    if (!Entries(session.folder, Files).isEmpty())
        return;
    session.lock.Release();
    QDir().rmdir(session.folder);
}

Result<QString> CRecoveryFolder::NewFile()
{
    if (!m_own) {
        Session session{.folder = m_root + u'/' + NewName()};
        if (const Result<void> secured = Secure(session); !secured)
            return secured.error();
        m_own = std::move(session);
    } else if (const Result<void> secured = Secure(*m_own); !secured) {
        return secured.error();
    }
    return m_own->folder + u'/' + NewName() + QStringLiteral(".recovery");
}

Result<void> CRecoveryFolder::Secure(const QString& file)
{
    const QString folder = QFileInfo(file).path();
    if (m_own && m_own->folder == folder)
        return Secure(*m_own);
    const auto other = std::ranges::find(m_others, folder, &Session::folder);
    return other == m_others.end() ? Result<void>() : Secure(*other);
}

/// A folder that could not be held does not stay behind.
Result<void> CRecoveryFolder::Secure(Session& session) const
{
    for (const QString& folder : {m_root, session.folder})
        if (Result<void> made = MakePrivateFolder(folder.toStdString()); !made)
            return made;
    FileLock lock = LockOf(session.folder);
    if (lock.HeldBy()) // by this session
        return {};
    if (!lock.IsHeld()) {
        QDir().rmdir(session.folder);
        return Error{.message = "The folder of the session cannot be held.", .code = lock.WhyNone()};
    }
    session.lock = std::move(lock);
    return {};
}

/// Nothing for the folder of a session that lives. `deadline`: for what sessions that have ended are still writing.
std::optional<CRecoveryFolder::Session> CRecoveryFolder::Hold(const QString& folder, const QDeadlineTimer& deadline)
{
    if (!MakePrivateFolder(folder.toStdString()))
        return {};
    constexpr int pause = 20; // milliseconds
    while (true) {
        FileLock lock = LockOf(folder);
        if (lock.IsHeld())
            return Session{folder, std::move(lock)};
        if (lock.WhyNone() && QDir().rmdir(folder))
            return {}; // of a session that could not begin
        if (IsDamaged(lock)) {
            QFile::remove(QString::fromStdString(lock.Path())); // nobody else's stands in a folder of the user's own
            return Session{folder, LockOf(folder)};
        }
        if (!IsOrphan(lock) || deadline.hasExpired())
            return {};
        QThread::msleep(pause);
    }
}

void CRecoveryFolder::WriterEnds(bool stopped)
{
    m_isUntidy = m_isUntidy || stopped;
    if (--m_writers > 0 || !m_isUntidy)
        return;
    m_isUntidy = false;
    if (m_own)
        RemoveTemporaries(m_own->folder);
    for (const Session& session : m_others)
        RemoveTemporaries(session.folder);
}

QStringList CRecoveryFolder::TakeOver()
{
    constexpr int patience = 3000; // milliseconds, for all of them: nobody sees a window meanwhile
    const QDeadlineTimer deadline(patience);
    QStringList files;
    if (!QDir(m_root).exists() || !MakePrivateFolder(m_root.toStdString()))
        return files;
    for (const QString& name : QDir(m_root).entryList(QDir::Dirs | QDir::NoDotAndDotDot | QDir::NoSymLinks)) {
        const QString folder = m_root + u'/' + name;
        if (m_own && m_own->folder == folder)
            continue;
        std::optional<Session> session = Hold(folder, deadline);
        if (!session)
            continue;
        Tidy(*session);
        const QStringList left = Entries(folder, Files);
        if (left.isEmpty())
            continue;
        files += left;
        m_others.push_back(std::move(*session));
    }
    return files;
}
