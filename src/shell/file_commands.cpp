#include "shell/file_commands.h"

#include "files/extensions.h"
#include "ks/fc/file_dialog.h"
#include "ks/fc/file_name.h"
#include "ks/fc/frames.h"
#include "ks/fc/message_box.h"
#include "shell/plugin_loader.h"
#include "shell/project_controller.h"
#include "shell/settings_keys.h"

#include <QDir>
#include <QFileInfo>
#include <QInputDialog>
#include <QSettings>

namespace {

bool IsProject(const QString& path)
{
    return KsHasExtension(path, QString::fromLatin1(ProjectExtension));
}

QString ProjectFilter()
{
    return KsFileFilter(CFileCommands::tr("Projects"), QString::fromLatin1(ProjectExtension));
}

} // namespace

CFileCommands::CFileCommands(CKsMDIFrameWnd& frame, const CPlugins& plugins, CProjectController& projects)
    : m_frame(frame), m_plugins(plugins), m_projects(projects)
{
}

bool CFileCommands::Knows(const QString& path) const
{
    return IsProject(path) || m_plugins.TemplateFor(path);
}

bool CFileCommands::Open(const QString& path, bool othersLater)
{
    if (IsProject(path))
        return m_projects.Open(path, othersLater);
    if (CMultiDocTemplate* documents = m_plugins.TemplateFor(path))
        return documents->OpenDocumentFile(&m_frame, path) != nullptr;
    QStringList known{QString::fromLatin1(ProjectExtension)};
    for (const CMultiDocTemplate* documents : CMultiDocTemplate::All())
        known << documents->GetDocString(CMultiDocTemplate::filterExt);
    KsMessageBox(tr("%1 could not be opened: no editor reads files of this kind.\nThe editors read %2.")
                     .arg(QDir::toNativeSeparators(path), known.join(QStringLiteral(", "))));
    return false;
}

void CFileCommands::OpenAll(const QStringList& paths)
{
    constexpr qsizetype MostTold = 10;
    QStringList failed;
    for (const QString& path : paths) {
        bool opened = false;
        QStringList said;
        {
            const CKsKeptMessages kept;
            opened = Open(path, true);
            said = kept.Texts();
        }
        if (!opened && !said.isEmpty()) // it was a question that ended it otherwise
            failed << said.join(u'\n');
        for (qsizetype i = 0; opened && i < said.size(); ++i)
            KsMessageBox(said[i]);
    }
    const qsizetype more = failed.size() - MostTold;
    if (more > 0)
        failed = failed.first(MostTold) << tr("Files besides that could not be opened: %1").arg(more);
    if (!failed.isEmpty())
        KsMessageBox(failed.join(u'\n'));
}

void CFileCommands::New()
{
    const auto& templates = CMultiDocTemplate::All();
    qsizetype chosen = 0;
    if (templates.size() != 1) {
        QStringList names;
        for (const CMultiDocTemplate* documents : templates)
            names << documents->GetDocString(CMultiDocTemplate::fileNewName);
        bool accepted = false;
        const QString name =
            QInputDialog::getItem(&m_frame, tr("New"), tr("Kind of document:"), names, 0, false, &accepted);
        chosen = accepted ? names.indexOf(name) : -1;
    }
    if (chosen >= 0)
        templates[std::size_t(chosen)]->OpenDocumentFile(&m_frame, {});
}

QString CFileCommands::AskName(const QString& title, const QString& filters) const
{
    KsFileQuestion question;
    question.title = title;
    question.filters = filters;
    question.proposal = QSettings().value(Settings::LastFolder, QDir::homePath()).toString();
    const QString path = KsAskFileName(question, &m_frame);
    if (!path.isEmpty())
        QSettings().setValue(Settings::LastFolder, QFileInfo(path).absolutePath());
    return path;
}

void CFileCommands::AskToOpen()
{
    QStringList filters;
    for (const CMultiDocTemplate* documents : CMultiDocTemplate::All())
        filters << documents->FileDialogFilter();
    filters << ProjectFilter() << tr("All files") + QStringLiteral(" (*)");
    const QString path = AskName(tr("Open"), filters.join(QStringLiteral(";;")));
    if (!path.isEmpty())
        Open(path);
}

void CFileCommands::AskToOpenProject()
{
    const QString path = AskName(tr("Open Project"), ProjectFilter());
    if (!path.isEmpty())
        m_projects.Open(path);
}

void CFileCommands::Save()
{
    if (CKsDoc* document = m_frame.ActiveDocument())
        document->DoSave(document->GetPathName());
}

void CFileCommands::SaveAs()
{
    if (CKsDoc* document = m_frame.ActiveDocument())
        document->DoSave({});
}

void CFileCommands::CloseWindow()
{
    if (auto* window = m_frame.MdiArea().currentSubWindow())
        window->close();
}
