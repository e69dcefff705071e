#include "shell/project_respell.h"

#include "tql/tql.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

namespace {

/// Byte of a place in the text of a file.
qsizetype OffsetOf(const QByteArray& text, const TqlPosition& place)
{
    qsizetype offset = 0;
    for (std::size_t line = 1; line < place.line; ++line)
        offset = text.indexOf('\n', offset) + 1;
    return offset + QString::fromUtf8(text.mid(offset)).left(qsizetype(place.column) - 1).toUtf8().size();
}

/// Where the extension of a file name in a parameter stands, for the entries that name `path`.
QList<qsizetype> ExtensionsOf(const QString& projectPath, const QByteArray& text, const QString& path)
{
    QList<qsizetype> offsets;
    tqlHandle structure = tqlLoadText(text.toStdString(), projectPath.toStdString());
    tqlGetErrorGlb(); // one that cannot be read has no entries
    const tqlHandle section = tqlSectionByNameNum(tqlTargetByNameNum(structure, "KVR_PROJECT", 1), "Members", 1);
    const QDir folder = QFileInfo(projectPath).absoluteDir();
    for (int number = 1, count = tqlGetNoKeywords(section, "File"); number <= count; ++number) {
        const tqlHandle param = tqlParamByNum(tqlKeywordByNameNum(section, "File", number), 1);
        std::string name;
        if (!tqlGetString(param, &name))
            continue;
        const QString member = folder.absoluteFilePath(QString::fromStdString(name).replace(u'\\', u'/'));
        const auto length = qsizetype(tqlGetRawParam(param).size()) - 1 - QFileInfo(path).suffix().size();
        if (QDir::cleanPath(member) == QDir::cleanPath(path))
            offsets << OffsetOf(text, tqlGetPosition(structure, param)) + length;
    }
    tqlClose(&structure);
    return offsets;
}

} // namespace

void RespellMember(const QString& projectPath, const QString& oldPath, const QString& newPath)
{
    const QFileInfo before(oldPath), after(newPath);
    const QByteArray extension = after.suffix().toUtf8(), old = before.suffix().toUtf8();
    const bool isRespelt = oldPath != newPath && old != extension && before.path() == after.path() &&
                           before.completeBaseName() == after.completeBaseName() &&
                           before.suffix().compare(after.suffix(), Qt::CaseInsensitive) == 0;
    QFile file(projectPath);
    if (!isRespelt || !file.open(QIODevice::ReadWrite | QIODevice::ExistingOnly))
        return;
    const QByteArray text = file.readAll();
    for (const qsizetype offset : ExtensionsOf(projectPath, text, oldPath)) {
        if (text.mid(offset, old.size()) == old && file.seek(offset))
            file.write(extension);
    }
}
