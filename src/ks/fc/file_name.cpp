#include "ks/fc/file_name.h"

#include "base/utf8_path.h"
#include "files/file_content.h"
#include "ks/fc/shown_text.h"

#include <QDir>
#include <QFileInfo>
#include <algorithm>
#include <vector>

CString KsExistingSpelling(const CString& path)
{
    const QFileInfo file(path);
    if (path.isEmpty() || file.exists() || file.fileName().isEmpty())
        return path;
    const CString given = file.path(), folder = QFileInfo::exists(given) ? given : KsExistingSpelling(given);
    const Result<CString> entry = KsExistingEntry(QDir(folder).filePath(file.fileName()));
    return entry && QFileInfo::exists(entry.value()) ? entry.value() : path;
}

Result<CString> KsExistingEntry(const CString& path)
{
    PlatformFile& platform = PlatformFile::Native();
    const QFileInfo target(path);
    FileStatus status;
    std::vector<PlatformFile::Path> names;
    std::error_code error = platform.Status(target.filesystemFilePath(), status);
    if (error || status.kind != FileStatus::Kind::None)
        return error ? Result<CString>(NotWritten(path.toStdString(), error)) : path;
    error = platform.List(FolderOf(target.filesystemFilePath()), names);
    if (error == std::errc::no_such_file_or_directory || error == std::errc::permission_denied)
        return path; // as writing will say; a folder may be open to writing alone
    if (error)
        return NotWritten(path.toStdString(), error);
    std::ranges::sort(names);
    for (const auto& each : names) {
        const CString name = QString::fromStdString(Utf8FromPath(each));
        if (name.compare(target.fileName(), Qt::CaseInsensitive) == 0)
            return target.dir().filePath(name);
    }
    return path;
}

bool KsHasExtension(const CString& path, const CString& extension)
{
    return !extension.isEmpty() && path.endsWith(extension, Qt::CaseInsensitive);
}

CString KsFileFilter(const CString& name, const CString& extension)
{
    return QStringLiteral("%1 (*%2 *%3)").arg(name, extension.toLower(), extension.toUpper());
}

CString KsShownFileName(const CString& path)
{
    constexpr qsizetype Longest = 60, Side = (Longest - 1) / 2; // no place to break a line in them
    const CString name = KsVisibleText(QFileInfo(path).fileName());
    return name.size() <= Longest ? name : name.first(Side) + u'\u2026' + name.last(Side);
}

CString KsFreeFileName(const CString& path)
{
    const QFileInfo info(path);
    CString name = path;
    for (int number = 2; QFileInfo::exists(KsExistingSpelling(name)); ++number)
        name = info.dir().filePath(info.completeBaseName() + u'-' + CString::number(number) + u'.' + info.suffix());
    return name;
}

CString KsFileKey(const CString& path)
{
    if (path.isEmpty())
        return {};
    const QFileInfo file(KsExistingSpelling(path));
    const CString canonical = file.canonicalFilePath();
    return canonical.isEmpty() ? QDir::cleanPath(file.absoluteFilePath()) : canonical;
}

bool KsSameFile(const CString& a, const CString& b)
{
    return !a.isEmpty() && !b.isEmpty() && (a == b || KsFileKey(a) == KsFileKey(b));
}
