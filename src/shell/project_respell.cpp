#include "shell/project_respell.h"

#include "files/structure.h"
#include "ks/fc/document_file.h"
#include "ks/fc/file_name.h"
#include "ks/fc/file_use.h"
#include "ks/fc/message_box.h"
#include "ks/fc/system_reason.h"
#include "shell/project_file.h"
#include "shell/projects.h"

#include <QApplication>
#include <QDir>
#include <QFileInfo>
#include <QTimer>
#include <algorithm>

namespace {

struct ProjectRespell
{
    Q_DECLARE_TR_FUNCTIONS(ProjectRespell)
};

/// Byte of a place in the text of a file.
qsizetype OffsetOf(const QByteArray& text, const TqlPosition& place)
{
    qsizetype offset = 0;
    for (std::size_t line = 1; line < place.line; ++line)
        offset = text.indexOf('\n', offset) + 1;
    return offset + QString::fromUtf8(text.mid(offset)).left(qsizetype(place.column) - 1).toUtf8().size();
}

/// Whether a member is the file of this path, which may be spelt in another case. It is not one that is beside it under
/// the member's own spelling.
bool Names(const QString& member, const QString& path)
{
    return QDir::cleanPath(KsExistingSpelling(member)) == QDir::cleanPath(path);
}

/// Where the extension of a file name in a parameter stands, for the entries that name `path`.
QList<qsizetype> ExtensionsOf(const QString& projectPath, const QByteArray& text, const QString& path)
{
    QList<qsizetype> offsets;
    const auto structure = ParseText(text.toStdString(), projectPath.toStdString());
    if (!structure)
        return {};
    ProjectFile project;
    LoadReport report(structure.value().Get());
    ReadDeclaredFile(structure.value().Get(), DeclaredProjectFile(), &project, report);
    const QDir folder = QFileInfo(projectPath).absoluteDir();
    int number = 0; // of the keyword: an entry that is none is no member
    for (const ProjectMember& member : project.members) {
        while (report.IsLeftOut(MemberKeyword(structure.value().Get(), ++number))) {
        }
        if (!Names(member.PathIn(folder), path))
            continue;
        const tqlHandle param = tqlParamByNum(MemberKeyword(structure.value().Get(), number), 1);
        const auto length = qsizetype(tqlGetRawParam(param).size()) - 1 - QFileInfo(path).suffix().size();
        offsets << OffsetOf(text, tqlGetPosition(structure.value().Get(), param)) + length;
    }
    return offsets;
}

/// Asks as for any file what is the user's to decide. Why it was not written: operation_canceled when he does not want
/// it.
std::error_code Respell(CKsDocumentFile& file, const QString& projectPath, const QString& path,
                        const QByteArray& extension)
{
    const FileLock lock = CKsFileUse::Lock(projectPath);
    if (lock.HeldBy())
        return std::make_error_code(std::errc::device_or_resource_busy);
    const Result<std::string> content = ReadWholeFile(projectPath.toStdString());
    if (!content)
        return content.error().code;
    QByteArray text = QByteArray::fromStdString(content.value());
    for (const qsizetype offset : ExtensionsOf(projectPath, text, path))
        if (text.mid(offset, extension.size()).compare(extension, Qt::CaseInsensitive) == 0)
            text.replace(offset, extension.size(), extension);
    std::error_code why = std::make_error_code(std::errc::io_error); // unless the writer says another
    file.Know(projectPath, VersionOfText(content.value()));
    const bool written = file.Write(projectPath, [&](const std::string& target, SafeFileOptions options) {
        options.isLocked = lock.IsHeld();
        Result<WriteReport> report = WriteFileSafely(target, text.toStdString(), options);
        if (!report)
            why = report.error().code;
        return report;
    });
    return written ? std::error_code() : why;
}

} // namespace

void RespellMember(const CProjects& projects, const QString& oldPath, const QString& newPath)
{
    const QFileInfo before(oldPath), after(newPath);
    if (before.suffix() == after.suffix() || before.path() != after.path() ||
        before.completeBaseName() != after.completeBaseName() ||
        before.suffix().compare(after.suffix(), Qt::CaseInsensitive) != 0)
        return;
    for (const auto& project : projects.All()) {
        const auto isIt = [&, path = QDir::cleanPath(newPath)](const QString& member) {
            return member != path && Names(member, path);
        };
        if (std::ranges::none_of(project->members, isIt))
            continue;
        CKsDocumentFile file;
        const std::error_code why = Respell(file, project->path, newPath, after.suffix().toUtf8());
        if (!why) {
            project->version = file.Version().value();
            std::ranges::replace_if(project->members, isIt, QDir::cleanPath(newPath));
        }
        const QString text =
            why == std::errc::operation_canceled ? QString()
            : why                                ? ProjectRespell::tr(
                                                       "The project %1 still names %2 and could not be changed: %3.\nThe file is found all the same.")
                        .arg(project->name, before.fileName(), KsSystemReason(why))
                  : file.SaveNotes();
        if (text.isEmpty())
            continue;
        QTimer::singleShot(0, qApp, [text] { KsMessageBox(text); }); // when the save is over
    }
}
