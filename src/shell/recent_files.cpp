#include "shell/recent_files.h"

#include "shell/settings_keys.h"

#include <QDir>
#include <QFileInfo>
#include <QSettings>

namespace {

/// One object for the whole run: it writes when the program is idle, a short-lived one would write to disk at once.
QSettings& UserSettings()
{
    static QSettings settings;
    return settings;
}

QStringList Read()
{
    return UserSettings().value(Settings::RecentFiles).toStringList();
}

void Write(const QStringList& files)
{
    if (files != Read())
        UserSettings().setValue(Settings::RecentFiles, files);
}

} // namespace

QStringList RecentFiles::All()
{
    QStringList files = Read();
    if (files.removeIf([](const QString& file) { return !QFileInfo::exists(file); }))
        Write(files);
    return files;
}

void RecentFiles::Add(const QString& path)
{
    QStringList files = Read();
    const QString clean = QDir::cleanPath(path);
    files.removeAll(clean);
    files.prepend(clean);
    Write(files.mid(0, Longest));
}

void RecentFiles::Rename(const QString& oldPath, const QString& newPath)
{
    QStringList files = Read();
    const auto index = files.indexOf(QDir::cleanPath(oldPath));
    if (index < 0)
        return;
    files[index] = QDir::cleanPath(newPath);
    files.removeDuplicates();
    Write(files);
}

void RecentFiles::Clear()
{
    Write({});
}
