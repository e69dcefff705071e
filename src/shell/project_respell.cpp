#include "shell/project_respell.h"

#include "files/structure.h"
#include "shell/project_file.h"

#include <QDir>
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
    const auto structure = ParseText(text.toStdString(), projectPath.toStdString());
    if (!structure)
        return {};
    ProjectFile project;
    LoadReport unused(structure.value().Get());
    ReadDeclared(structure.value().Get(), DeclaredProjectFile(), &project, unused);
    const QDir folder = QFileInfo(projectPath).absoluteDir();
    for (std::size_t i = 0; i < project.members.size(); ++i) {
        if (project.members[i].PathIn(folder) != QDir::cleanPath(path))
            continue;
        const tqlHandle param = tqlParamByNum(MemberKeyword(structure.value().Get(), int(i) + 1), 1);
        const auto length = qsizetype(tqlGetRawParam(param).size()) - 1 - QFileInfo(path).suffix().size();
        offsets << OffsetOf(text, tqlGetPosition(structure.value().Get(), param)) + length;
    }
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
    const Result<std::string> content = isRespelt ? ReadWholeFile(projectPath.toStdString()) : Error{};
    if (!content)
        return;
    QByteArray text = QByteArray::fromStdString(content.value());
    bool isChanged = false;
    for (const qsizetype offset : ExtensionsOf(projectPath, text, oldPath)) {
        if (text.mid(offset, old.size()) != old)
            continue;
        text.replace(offset, old.size(), extension);
        isChanged = true;
    }
    if (isChanged && !WriteFileSafely(projectPath.toStdString(), text.toStdString()))
        return; // read-only: its members are found all the same
}
