// New, open, save and close of documents in the main frame.
#include "ks/fc/file_dialog.h"
#include "ks/fc/message_box.h"
#include "shell/main_frame.h"
#include "shell/project_respell.h"
#include "shell/settings_keys.h"

#include <QDir>
#include <QDropEvent>
#include <QFileInfo>
#include <QInputDialog>
#include <QMimeData>
#include <QSettings>
#include <QUndoStack>
#include <QUrl>

namespace {

constexpr char ProjectExtension[] = ".kvrp";

bool IsProject(const QString& path)
{
    return path.endsWith(QLatin1String(ProjectExtension), Qt::CaseInsensitive);
}

QString ProjectFilter()
{
    const QString extension = QString::fromLatin1(ProjectExtension);
    return CMainFrame::tr("Projects") + QStringLiteral(" (*%1 *%2)").arg(extension, extension.toUpper());
}

} // namespace

std::vector<CMultiDocTemplate*> CMainFrame::Templates() const
{
    std::vector<CMultiDocTemplate*> templates;
    for (const auto& plugin : m_plugins) {
        for (const auto& documents : plugin->templates)
            templates.push_back(documents.get());
    }
    return templates;
}

CMultiDocTemplate* CMainFrame::TemplateFor(const QString& path) const
{
    for (CMultiDocTemplate* documents : Templates()) {
        if (documents->MatchesExtension(path))
            return documents;
    }
    return nullptr;
}

void CMainFrame::AddTemplate(CMultiDocTemplate* documents)
{
    connect(documents, &CMultiDocTemplate::DocumentClosing, this, &CMainFrame::UpdateProjectTree, Qt::QueuedConnection);
    connect(documents, &CMultiDocTemplate::DocumentOpened, this, [this](CKsDoc* document) {
        m_undo.addStack(&document->UndoStack());
        connect(document, &CKsDoc::TitleChanged, this, &CMainFrame::UpdateTitle);
        connect(document, &CKsDoc::PathNameChanged, this, [this](const CString& oldPath, const CString& newPath) {
            m_recent.Rename(oldPath, newPath);
            for (const auto& project : m_projects.All())
                RespellMember(project->path, oldPath, newPath);
            if (!newPath.isEmpty())
                m_recent.Add(newPath);
        });
    });
    connect(documents, &CMultiDocTemplate::DocumentShown, this, &CMainFrame::DocumentShown);
}

/// Whoever opened it: the user, a project, or an editor for another one.
void CMainFrame::DocumentShown(const CKsDoc* document)
{
    if (!document->GetPathName().isEmpty())
        m_recent.Add(document->GetPathName());
    SetWindowIcons();
    UpdateTitle(); // by now it may have joined a project
    UpdateActions();
}

CKsDoc* CMainFrame::NewDocument(CMultiDocTemplate& documents)
{
    return documents.OpenDocumentFile(this, {});
}

bool CMainFrame::OpenFile(const QString& path, bool othersLater)
{
    if (IsProject(path))
        return OpenProject(path, othersLater);
    if (CMultiDocTemplate* documents = TemplateFor(path))
        return documents->OpenDocumentFile(this, path) != nullptr;
    QStringList known{QString::fromLatin1(ProjectExtension)};
    for (const CMultiDocTemplate* documents : Templates())
        known << documents->GetDocString(CMultiDocTemplate::filterExt);
    KsMessageBox(tr("%1 could not be opened: no editor reads files of this kind.\nThe editors read %2.")
                     .arg(QDir::toNativeSeparators(path), known.join(QStringLiteral(", "))));
    return false;
}

void CMainFrame::SetWindowIcons()
{
    const auto windows = MdiArea().subWindowList();
    for (QMdiSubWindow* window : windows) {
        const auto* child = qobject_cast<CKsMDIChildWnd*>(window);
        const CView* view = child ? child->GetActiveView() : nullptr;
        for (const auto& plugin : m_plugins) {
            for (const auto& documents : plugin->templates) {
                if (view && view->GetDocument() && view->GetDocument()->GetDocTemplate() == documents.get())
                    window->setWindowIcon(plugin->Icon());
            }
        }
    }
}

// ---- commands ----------------------------------------------------------------------------------

void CMainFrame::OnFileNew()
{
    const auto templates = Templates();
    if (templates.size() == 1) {
        NewDocument(*templates.front());
        return;
    }
    QStringList names;
    for (const CMultiDocTemplate* documents : templates)
        names << documents->GetDocString(CMultiDocTemplate::fileNewName);
    bool chosen = false;
    const QString name = QInputDialog::getItem(this, tr("New"), tr("Kind of document:"), names, 0, false, &chosen);
    if (const auto index = names.indexOf(name); chosen && index >= 0)
        NewDocument(*templates[std::size_t(index)]);
}

QString CMainFrame::AskOpen(const QString& title, const QString& filters)
{
    KsFileQuestion question;
    question.title = title;
    question.filters = filters;
    question.proposal = QSettings().value(Settings::LastFolder, QDir::homePath()).toString();
    const QString path = KsAskFileName(question, this);
    if (!path.isEmpty())
        QSettings().setValue(Settings::LastFolder, QFileInfo(path).absolutePath());
    return path;
}

void CMainFrame::OnFileOpen()
{
    QStringList filters;
    for (const CMultiDocTemplate* documents : Templates())
        filters << documents->FileDialogFilter();
    filters << ProjectFilter() << tr("All files") + QStringLiteral(" (*)");
    const QString path = AskOpen(tr("Open"), filters.join(QStringLiteral(";;")));
    if (!path.isEmpty())
        OpenFile(path);
}

void CMainFrame::OnFileOpenProject()
{
    const QString path = AskOpen(tr("Open Project"), ProjectFilter());
    if (!path.isEmpty())
        OpenProject(path);
}

void CMainFrame::OnFileSave()
{
    if (CKsDoc* document = ActiveDocument())
        document->DoSave(document->GetPathName());
}

void CMainFrame::OnFileSaveAs()
{
    if (CKsDoc* document = ActiveDocument())
        document->DoSave({});
}

void CMainFrame::OnFileClose()
{
    if (auto* window = MdiArea().currentSubWindow())
        window->close();
}

void CMainFrame::OnFileExit()
{
    close();
}

// ---- dropped files -----------------------------------------------------------------------------

void CMainFrame::dragEnterEvent(QDragEnterEvent* event)
{
    const auto urls = event->mimeData()->urls();
    for (const QUrl& url : urls) {
        if (IsProject(url.toLocalFile()) || TemplateFor(url.toLocalFile()))
            event->acceptProposedAction();
    }
}

void CMainFrame::dropEvent(QDropEvent* event)
{
    const auto urls = event->mimeData()->urls();
    event->acceptProposedAction();
    if (!MayLeave())
        return;
    for (const QUrl& url : urls) {
        if (url.isLocalFile())
            OpenFile(url.toLocalFile());
    }
}
