// The files that the program follows, together: one watch of the system's, and one thread that reads.
#pragma once

#include <QFileSystemWatcher>
#include <QHash>
#include <QSet>
#include <QThreadPool>
#include <QTimer>

class CKsFileWatch;

/// Goes with the application.
class CWatchedFiles : public QObject
{
public:
    static CWatchedFiles& Instance();
    explicit CWatchedFiles(QObject* parent);
    ~CWatchedFiles() override;

    void Add(CKsFileWatch& watch);
    void Remove(CKsFileWatch& watch);
    QThreadPool& Reader() { return m_reader; }

private:
    void Touched(const QString& path);
    void WatchAgain();
    void LookAtAll();
    void LookSoon();

    QFileSystemWatcher m_watcher;
    QTimer m_timer;
    QThreadPool m_reader;
    QSet<CKsFileWatch*> m_watches;
    QHash<QString, int> m_counts; // of the watches of a path
    QSet<QString> m_touched;      // in the present event
};
