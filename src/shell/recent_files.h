// The files opened last, newest first, kept in the user's settings.
#pragma once

#include <QStringList>

namespace RecentFiles {
inline constexpr int Longest = 10;

/// Those that still exist; the others are forgotten.
QStringList All();
/// Puts a file first. Paths are absolute.
void Add(const QString& path);
/// A file goes by another name now. Does nothing when the old one is not in the list.
void Rename(const QString& oldPath, const QString& newPath);
void Clear();
} // namespace RecentFiles
