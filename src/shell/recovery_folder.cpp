#include "shell/recovery_folder.h"

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QDir>
#include <QStandardPaths>
#include <QThread>
#include <QUuid>

namespace {

constexpr char Lock[] = "/lock";
const QString Files = QStringLiteral("*.recovery");
const QString Temporaries = QStringLiteral(".kvr-*.tmp"); // of writers that were stopped

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

/// The folder goes unless there is something to recover in it.
void Tidy(const QString& folder)
{
    RemoveTemporaries(folder);
    if (!Entries(folder, Files).isEmpty())
        return;
    QFile::remove(folder + QLatin1String(Lock));
    QDir().rmdir(folder);
}

} // namespace

CRecoveryFolder::CRecoveryFolder() : m_root(StateFolder() + QStringLiteral("/recovery")) {}

CRecoveryFolder::~CRecoveryFolder()
{
    if (m_own)
        Tidy(m_own->folder);
    for (const Session& session : m_others)
        Tidy(session.folder);
}

Result<QString> CRecoveryFolder::NewFile()
{
    if (!m_own) {
        const QString folder = m_root + u'/' + NewName();
        if (const Result<void> made = MakePrivateFolder(m_root.toStdString()); !made)
            return made.error();
        if (const Result<void> made = MakePrivateFolder(folder.toStdString()); !made)
            return made.error();
        Result<ProcessLock> lock = ProcessLock::Take((folder + QLatin1String(Lock)).toStdString());
        if (!lock)
            return lock.error();
        m_own = Session{folder, std::move(lock.value())};
    }
    return m_own->folder + u'/' + NewName() + QStringLiteral(".recovery");
}

/// Nothing for the folder of a session that lives.
std::optional<CRecoveryFolder::Session> CRecoveryFolder::Hold(const QString& folder)
{
    if (!MakePrivateFolder(folder.toStdString()))
        return {};
    const std::string path = (folder + QLatin1String(Lock)).toStdString();
    constexpr int patience = 5000, pause = 20; // milliseconds, for what a session that has ended is still writing
    const QDeadlineTimer deadline(patience);
    while (true) {
        if (Result<ProcessLock> lock = ProcessLock::Take(path))
            return Session{folder, std::move(lock.value())};
        else if (lock.error().code != std::errc::device_or_resource_busy || !ProcessLock::IsOrphan(path) ||
                 deadline.hasExpired())
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
    QStringList files;
    if (!QDir(m_root).exists() || !MakePrivateFolder(m_root.toStdString()))
        return files;
    for (const QString& name : QDir(m_root).entryList(QDir::Dirs | QDir::NoDotAndDotDot | QDir::NoSymLinks)) {
        const QString folder = m_root + u'/' + name;
        if (m_own && m_own->folder == folder)
            continue;
        std::optional<Session> session = Hold(folder);
        if (!session)
            continue;
        Tidy(folder);
        const QStringList left = Entries(folder, Files);
        if (left.isEmpty())
            continue;
        files += left;
        m_others.push_back(std::move(*session));
    }
    return files;
}
