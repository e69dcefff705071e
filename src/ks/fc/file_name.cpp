#include "ks/fc/file_name.h"

#include "ks/fc/shown_text.h"

#include <QDir>
#include <QFileInfo>

CString KsExistingSpelling(const CString& path)
{
    const QFileInfo file(path);
    if (path.isEmpty() || file.exists() || file.fileName().isEmpty())
        return path;
    const CString given = file.path(), folder = QFileInfo::exists(given) ? given : KsExistingSpelling(given);
    const CString same = QDir(folder).filePath(file.fileName());
    if (QFileInfo::exists(same))
        return same;
    const auto names = QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot, QDir::Name);
    for (const CString& name : names)
        if (name.compare(file.fileName(), Qt::CaseInsensitive) == 0)
            return QDir(folder).filePath(name);
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
