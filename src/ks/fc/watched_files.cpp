#include "ks/fc/watched_files.h"

#include "ks/fc/file_watch.h"

#include <QFileInfo>
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
    // A folder that is moved away and made anew, links on the way, other machines: of these the system tells nothing. A
    // look costs next to nothing where the file is as it was.
    m_timer.setInterval(2000);
    connect(&m_timer, &QTimer::timeout, this, &CWatchedFiles::LookSoon);
    m_timer.start();
    connect(&m_watcher, &QFileSystemWatcher::fileChanged, this, &CWatchedFiles::Touched);
    connect(&m_watcher, &QFileSystemWatcher::directoryChanged, this, &CWatchedFiles::Touched);
    connect(qGuiApp, &QGuiApplication::applicationStateChanged, this, [this](Qt::ApplicationState state) {
        if (state == Qt::ApplicationActive)
            LookAtAll();
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

/// A path that has another file now is still watched for the old one, and of several paths of one file the system names
/// but one. So all files near by are watched anew, and looked at when that is done, so that nothing is missed in
/// between. A look that finds a file as it was does not read it.
void CWatchedFiles::WatchAgain()
{
    const QSet<QString> touched = std::exchange(m_touched, {});
    const QStringList files = m_watcher.files();
    for (const QString& file : files)
        if (touched.contains(file) || touched.contains(QFileInfo(file).path()))
            m_watcher.removePath(file);
    LookAtAll();
}

void CWatchedFiles::LookAtAll()
{
    if (m_counts.isEmpty())
        return;
    m_watcher.addPaths(m_counts.keys()); // those that are not watched
    LookSoon();
}

void CWatchedFiles::LookSoon()
{
    for (CKsFileWatch* watch : std::as_const(m_watches))
        watch->LookSoon();
}
