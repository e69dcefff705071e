// Projects in the main frame.
#include "ks/fc/after_paint.h"
#include "ks/fc/file_name.h"
#include "ks/fc/message_box.h"
#include "shell/main_frame.h"
#include "shell/settings_keys.h"

#include <QDir>
#include <QFileInfo>
#include <QLayout>
#include <QSettings>

namespace {

constexpr int ProjectTreeWidth = 190; // pixels, until the user pulls it

CKsMDIChildWnd* WindowOf(const QMdiArea& area, const CView* view)
{
    const auto windows = area.subWindowList();
    for (QMdiSubWindow* window : windows) {
        auto* child = qobject_cast<CKsMDIChildWnd*>(window);
        if (child && view && child->GetActiveView() == view)
            return child;
    }
    return nullptr;
}

/// Keeps what is told while it lives, so that it is told with the rest. Questions are asked at once.
class CKeptMessages
{
public:
    CKeptMessages()
        : m_before(KsSetMessageBoxHandler([this](const CString& text, auto buttons) { return Take(text, buttons); }))
    {
    }
    ~CKeptMessages() { KsSetMessageBoxHandler(m_before); }
    CKeptMessages(const CKeptMessages&) = delete;
    CKeptMessages& operator=(const CKeptMessages&) = delete;
    const QStringList& Texts() const { return m_texts; }

private:
    QMessageBox::StandardButton Take(const CString& text, QMessageBox::StandardButtons buttons)
    {
        if (buttons == QMessageBox::Ok) {
            m_texts << text;
            return QMessageBox::Ok;
        }
        const auto keeping = KsSetMessageBoxHandler(m_before);
        const auto answer = KsMessageBox(text, buttons);
        KsSetMessageBoxHandler(keeping);
        return answer;
    }

    QStringList m_texts;
    KsMessageBoxHandler m_before;
};

/// Whether the user chose tabs, which single documents have also when nobody chose.
bool UsesTabs()
{
    return QSettings().value(Settings::Tabs, false).toBool();
}

} // namespace

bool CMainFrame::OpenProject(const QString& path, bool othersLater)
{
    QString error;
    const CProject* opened = m_projects.Open(path, error);
    if (!opened) {
        KsMessageBox(tr("The project could not be opened.\n%1").arg(error));
        return false;
    }
    const CProject project = *opened; // its views change while the members open
    m_recent.Add(project.path);
    Announce(KsRequest::ProjectOpened, project);
    m_projectTree->show();
    resizeDocks({m_projectTree}, {ProjectTreeWidth}, Qt::Horizontal);
    layout()->activate(); // the tree takes its room first
    const bool waits = othersLater && project.members.size() > 1;
    if (waits && !UsesTabs()) {
        ShowTabs(false);
        PlaceNewWindows(FirstPlace());
    }
    const QStringList missing = OpenMembers(project, project.members.mid(0, 1));
    PlaceNewWindows({});
    QWidget* first = MdiArea().currentSubWindow();
    if (waits && first)
        KsAfterPaint(first, this, [this, project, missing] { OpenOtherMembers(project.handle, missing); });
    else
        OpenOtherMembers(project.handle, missing);
    return true;
}

/// `missing`: what could not be opened before.
void CMainFrame::OpenOtherMembers(CProjectHandle handle, QStringList missing)
{
    const CProject* found = m_projects.Find(handle);
    if (!found) // closed in the meantime
        return;
    const CProject project = *found;
    missing += OpenMembers(project, project.members.mid(1));
    if (!missing.isEmpty())
        KsMessageBox(
            tr("These files of the project %1 could not be opened:\n%2").arg(project.name, missing.join(u'\n')));
    TellOfSharedMembers(project);
    if (MdiArea().subWindowList().size() > 1 && !project.members.isEmpty() && !UsesTabs()) {
        ShowMember(project.handle, project.members.front()); // the first file is the main one
        PlaceSideBySide();
    }
    UpdateTitle();
    UpdateActions();
}

/// A file hears one project. Those of this one that are open in another stay there, and the user is told.
void CMainFrame::TellOfSharedMembers(const CProject& project) const
{
    QStringList shared;
    for (const QString& member : project.members) {
        if (const CProject* owner = OwnerOf(member); owner && owner->handle != project.handle)
            shared << tr("%1: open in the project %2").arg(QDir::toNativeSeparators(member), owner->name);
    }
    if (!shared.isEmpty())
        KsMessageBox(tr("These files of the project %1 are open in another project and stay there:\n%2\n"
                        "To have one of them in %1, close its window and open it from the list of %1.")
                         .arg(project.name, shared.join(u'\n')));
}

/// The project that an open file has joined; null for none.
const CProject* CMainFrame::OwnerOf(const QString& member) const
{
    const CMultiDocTemplate* documents = TemplateFor(member);
    const CKsDoc* open = documents ? documents->FindDocument(member) : nullptr;
    return open && !open->Views().empty() ? m_projects.FindByView(open->Views().front()) : nullptr;
}

CMemberState CMainFrame::StateOf(const CProject& project, const QString& stored) const
{
    const QString member = KsExistingSpelling(stored);
    CMemberState state;
    if (const CProject* owner = OwnerOf(member); owner && owner->handle != project.handle)
        state.elsewhere = owner->name;
    for (const auto& plugin : m_plugins) {
        for (const auto& documents : plugin->templates) {
            if (!documents->MatchesExtension(member))
                continue;
            const CKsDoc* open = documents->FindDocument(member);
            state.icon = plugin->Icon();
            state.kind = open ? CMemberState::Open : CMemberState::Closed;
            state.modified = open && open->IsModified();
            if (!open && !QFileInfo::exists(member))
                state.kind = CMemberState::Missing;
            return state;
        }
    }
    state.kind = QFileInfo::exists(member) ? CMemberState::Unknown : CMemberState::Missing;
    return state;
}

void CMainFrame::UpdateProjectTree()
{
    m_projectTree->Show(m_projects,
                        [this](const CProject& project, const QString& member) { return StateOf(project, member); });
    if (m_projects.All().empty())
        m_projectTree->hide();
}

/// Opens some members; what could not be opened, and why, a line each.
QStringList CMainFrame::OpenMembers(const CProject& project, const QStringList& members)
{
    QStringList missing;
    for (const QString& stored : members) {
        const QString member = KsExistingSpelling(stored);
        const QString name = QDir::toNativeSeparators(member);
        if (!QFileInfo::exists(member))
            missing << tr("%1: the file does not exist").arg(name);
        else if (!TemplateFor(member))
            missing << tr("%1: no editor reads files of this kind").arg(name);
        else
            missing += OpenMemberWithReasons(project, member);
    }
    return missing;
}

/// Why a member could not be opened; nothing when it was.
QStringList CMainFrame::OpenMemberWithReasons(const CProject& project, const QString& member)
{
    bool opened = false;
    QStringList said;
    {
        const CKeptMessages kept;
        opened = OpenMember(project, member, false);
        said = kept.Texts();
    }
    if (!opened)
        return said.isEmpty() ? QStringList(QDir::toNativeSeparators(member)) : said;
    for (const QString& text : said)
        KsMessageBox(text);
    return {};
}

void CMainFrame::ShowMember(CProjectHandle handle, const QString& stored)
{
    const CProject* project = m_projects.Find(handle);
    const QString member = KsExistingSpelling(stored);
    if (project && TemplateFor(member) && QFileInfo::exists(member))
        OpenMember(CProject(*project), member, true);
}

/// Opens a member, or, when it is open, brings it to the front if `show`.
bool CMainFrame::OpenMember(const CProject& project, const QString& member, bool show)
{
    CMultiDocTemplate& documents = *TemplateFor(member);
    if (const CKsDoc* open = documents.FindDocument(member)) {
        // A view joins when it first appears. One that is open already outside any project is opened anew.
        const CView* view = open->Views().empty() ? nullptr : open->Views().front();
        auto* window = WindowOf(MdiArea(), view);
        if (show && window)
            MdiArea().setActiveSubWindow(window);
        if (m_projects.FindByView(view) || !window)
            return true;
        if (!window->close())
            return m_projects.FindByView(view) == &project; // kept by the user: not in this project
    }
    m_projects.Prefer(project.handle);
    const bool opened = documents.OpenDocumentFile(this, member) != nullptr;
    m_projects.Prefer(0);
    return opened;
}

bool CMainFrame::CloseProject(CProjectHandle handle)
{
    const CProject* found = m_projects.Find(handle);
    if (!found)
        return false;
    const CProject project = *found;
    QList<QMdiSubWindow*> windows;
    for (const QPointer<CView>& view : project.views) {
        if (auto* window = WindowOf(MdiArea(), view); window && !window->IsClosing())
            windows << window;
    }
    if (!CloseWindows(windows))
        return false;
    Announce(KsRequest::ProjectClosing, project);
    m_projects.Close(handle);
    UpdateTitle();
    UpdateActions();
    return true;
}

/// Tells every view that a project opens or closes.
void CMainFrame::Announce(WPARAM what, const CProject& project)
{
    CKSComm_Package package;
    package.text = project.path;
    package.project = project.handle;
    const auto windows = MdiArea().subWindowList();
    for (QMdiSubWindow* window : windows) {
        if (const auto* child = qobject_cast<CKsMDIChildWnd*>(window))
            KsSendMessage(child->GetActiveView(), KsMessage::ProjectManagement(), what,
                          reinterpret_cast<LPARAM>(&package));
    }
}

void CMainFrame::OnFileCloseProject()
{
    const auto& all = m_projects.All();
    const CProject* active = m_projects.FindByView(GetActiveView());
    if (!active && !all.empty())
        active = all.back().get();
    if (active)
        CloseProject(active->handle);
}
