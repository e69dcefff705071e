#include "ks/fc/watched_files.h"

#include "ks/fc/file_watch.h"

#include <QGuiApplication>
#include <QPointer>
#include <QTimer>
#include <utility>

CWatchedFiles& CWatchedFiles::Instance()
{
    static QPointer<CWatchedFiles> files;
    if (!files)
        files = new CWatchedFiles(qApp);
    return *files;
}

CWatchedFiles::CWatchedFiles(QObject* parent) : QObject(parent)
{
    m_reader.setMaxThreadCount(1);
    connect(&m_watcher, &QFileSystemWatcher::fileChanged, this, &CWatchedFiles::Touched);
    connect(&m_watcher, &QFileSystemWatcher::directoryChanged, this, &CWatchedFiles::Touched);
    connect(qGuiApp, &QGuiApplication::applicationStateChanged, this, [this](Qt::ApplicationState state) {
        if (state != Qt::ApplicationActive || m_counts.isEmpty())
            return;
        m_watcher.addPaths(m_counts.keys()); // those that were not there, or that the system lost
        for (CKsFileWatch* watch : std::as_const(m_watches))
            watch->LookSoon();
    });
}

CWatchedFiles::~CWatchedFiles()
{
    m_reader.clear();
    m_reader.waitForDone(); // what it reads for is the program's
}

void CWatchedFiles::Add(CKsFileWatch& watch)
{
    m_watches.insert(&watch);
    for (const QString& path : std::as_const(watch.m_watched))
        if (++m_counts[path] == 1)
            m_watcher.addPath(path);
}

void CWatchedFiles::Remove(CKsFileWatch& watch)
{
    m_watches.remove(&watch);
    for (const QString& path : std::as_const(watch.m_watched))
        if (--m_counts[path] == 0) {
            m_counts.remove(path);
            m_watcher.removePath(path);
        }
}

/// When the system's watch has told all that it has to tell: it takes no other paths meanwhile.
void CWatchedFiles::Touched(const QString& path)
{
    if (m_touched.isEmpty())
        QTimer::singleShot(0, this, &CWatchedFiles::WatchAgain);
    m_touched.insert(path);
}

/// A path that has another file now is still watched for the old one. Whoever is meant looks after it is watched anew,
/// so that nothing is missed in between.
void CWatchedFiles::WatchAgain()
{
    const QSet<QString> touched = std::exchange(m_touched, {});
    QSet<CKsFileWatch*> meant;
    QSet<QString> again;
    for (CKsFileWatch* watch : std::as_const(m_watches))
        for (const QString& path : std::as_const(watch->m_watched))
            if (touched.contains(path)) {
                meant.insert(watch);
                again += QSet<QString>(watch->m_watched.begin(), watch->m_watched.end());
            }
    for (const QString& folder : m_watcher.directories())
        again.remove(folder);
    for (const QString& file : m_watcher.files())
        if (again.contains(file))
            m_watcher.removePath(file);
    if (!again.isEmpty())
        m_watcher.addPaths(again.values());
    for (CKsFileWatch* watch : meant)
        watch->LookSoon();
}
