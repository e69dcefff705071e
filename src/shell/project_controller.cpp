#include "shell/project_controller.h"

#include "ks/fc/after_paint.h"
#include "ks/fc/dialog_turn.h"
#include "ks/fc/file_name.h"
#include "ks/fc/findings_dialog.h"
#include "ks/fc/frames.h"
#include "ks/fc/message_box.h"
#include "ks/fc/system_reason.h"
#include "shell/plugin_loader.h"
#include "shell/recent_files.h"
#include "shell/window_manager.h"

#include <QDir>
#include <QFileInfo>
#include <QLayout>
#include <utility>

namespace {
constexpr int ProjectTreeWidth = 190; // pixels, until the user pulls it
} // namespace

CProjectController::CProjectController(CKsMDIFrameWnd& frame, CWindowManager& windows, const CPlugins& plugins)
    : m_frame(frame), m_windows(windows), m_plugins(plugins), m_tree(new CProjectTree(&frame))
{
    frame.addDockWidget(Qt::LeftDockWidgetArea, m_tree);
    m_tree->hide(); // until there is a project
    // Queued: what is chosen fills the tree anew, whose items are busy until then.
    connect(m_tree, &CProjectTree::MemberChosen, this, &CProjectController::ShowMember, Qt::QueuedConnection);
    connect(m_tree, &CProjectTree::CloseProjectChosen, this, &CProjectController::Close, Qt::QueuedConnection);
}

bool CProjectController::Open(const QString& path, bool othersLater)
{
    QString error;
    const CProject* opened = m_projects.Open(path, error);
    if (!opened) {
        KsMessageBox(tr("The project could not be opened.\n%1").arg(error));
        return false;
    }
    const CProject project = *opened; // its views change while the members open
    RecentFiles::Add(project.path);
    Announce(KsRequest::ProjectOpened, project);
    m_tree->show();
    KsAfterPaint(m_tree, this, [this, handle = project.handle] { Watch(handle); });
    if (!project.findings.empty())
        KsShowInTurn(new CKsFindingsDialog(project.path, project.findings, &m_frame));
    m_frame.resizeDocks({m_tree}, {ProjectTreeWidth}, Qt::Horizontal);
    m_frame.layout()->activate(); // the tree takes its room first
    const bool waits = othersLater && project.members.size() > 1;
    if (waits && !CWindowManager::ChoseTabs()) {
        m_windows.ShowTabs(false);
        m_windows.PlaceNewWindowsFirst(true);
    }
    const QStringList missing = OpenMembers(project, project.members.mid(0, 1));
    m_windows.PlaceNewWindowsFirst(false);
    QWidget* first = m_frame.MdiArea().currentSubWindow();
    if (waits && first)
        KsAfterPaint(first, this, [this, project, missing] { OpenOtherMembers(project.handle, missing); });
    else
        OpenOtherMembers(project.handle, missing);
    return true;
}

void CProjectController::Watch(CProjectHandle handle)
{
    const CProject* project = m_projects.Find(handle);
    if (!project || m_watches.contains(handle))
        return;
    auto watch = std::make_unique<CKsFileWatch>(nullptr);
    connect(watch.get(), &CKsFileWatch::Changed, this, [this, handle] { FileChanged(handle); });
    watch->Expect(project->path, project->version, project->seen);
    m_watches[handle].watch = std::move(watch);
}

/// Nothing of a project is edited here, so its file is simply read again. Files that are open stay open.
void CProjectController::FileChanged(CProjectHandle handle)
{
    const CProject* project = m_projects.Find(handle);
    Watched& watched = m_watches.at(handle);
    CKsFileWatch& watch = *watched.watch;
    const KsFileSight& sight = watch.Sight();
    const bool wasAmiss = std::exchange(watched.isAmiss, false);
    if (!project || (sight.kind == KsFileSight::Known && !wasAmiss))
        return;
    const QString name = KsShownFileName(project->path);
    if (sight.kind == KsFileSight::Gone) {
        watched.isAmiss = true;
        m_frame.TellStatus(tr("%1 was removed or renamed by another program. Its files stay open.").arg(name));
        return;
    }
    const bool isOurs = sight.kind == KsFileSight::Other && sight.version == project->version;
    QString error = sight.why ? KsSystemSentence(sight.why) : QString();
    if (!isOurs && (sight.why || !m_projects.ReadAgain(handle, error))) {
        watched.isAmiss = true;
        m_frame.TellStatus(tr("%1 was changed by another program and cannot be read: %2").arg(name, error));
        return;
    }
    watch.Expect(project->path, project->version, project->seen);
    if (isOurs)
        return;
    UpdateTree();
    if (wasAmiss)
        return m_frame.TellStatus(tr("%1 can be read again. The list of its files is that of the file.").arg(name));
    m_frame.TellStatus(tr("%1 was changed by another program. The list of its files has been read again.").arg(name));
}

/// `missing`: what could not be opened before.
void CProjectController::OpenOtherMembers(CProjectHandle handle, QStringList missing)
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
    if (m_windows.All().size() > 1 && !project.members.isEmpty() && !CWindowManager::ChoseTabs()) {
        if (CKsMDIChildWnd* main = WindowOf(KsExistingSpelling(project.members.front())))
            m_frame.MdiArea().setActiveSubWindow(main);
        m_windows.PlaceSideBySide();
    }
    emit Changed();
}

/// A file hears one project. Those of this one that are open in another stay there, and the user is told.
void CProjectController::TellOfSharedMembers(const CProject& project) const
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
const CProject* CProjectController::OwnerOf(const QString& member) const
{
    const CKsDoc* open = m_plugins.FindDocument(member);
    return open && !open->Views().empty() ? m_projects.FindByView(open->Views().front()) : nullptr;
}

/// The path from the project's folder to a file outside it, whatever links lead there; empty for one inside.
static QString WayOut(const CProject& project, const QString& member)
{
    const QDir folder = QFileInfo(project.path).absoluteDir();
    const QString way = QFileInfo::exists(member) ? QDir(KsFileKey(folder.path())).relativeFilePath(KsFileKey(member))
                                                  : folder.relativeFilePath(member);
    const bool leaves = way.startsWith(QLatin1String("../")) || QDir::isAbsolutePath(way);
    return leaves ? QDir::toNativeSeparators(way) : QString();
}

CMemberState CProjectController::StateOf(const CProject& project, const QString& stored) const
{
    const QString member = KsExistingSpelling(stored);
    CMemberState state;
    state.wayOut = WayOut(project, member);
    if (const CProject* owner = OwnerOf(member); owner && owner->handle != project.handle)
        state.elsewhere = owner->name;
    const CPlugin* plugin = m_plugins.Of(m_plugins.TemplateFor(member));
    const CKsDoc* open = m_plugins.FindDocument(member);
    if (plugin)
        state.icon = plugin->Icon();
    state.modified = open && open->IsModified();
    state.kind = open                         ? CMemberState::Open
                 : !QFileInfo::exists(member) ? CMemberState::Missing
                 : plugin                     ? CMemberState::Closed
                                              : CMemberState::Unknown;
    return state;
}

void CProjectController::UpdateTree()
{
    m_tree->Show(m_projects,
                 [this](const CProject& project, const QString& member) { return StateOf(project, member); });
    if (m_projects.All().empty())
        m_tree->hide();
}

/// Opens some members; what could not be opened, and why, a line each.
QStringList CProjectController::OpenMembers(const CProject& project, const QStringList& members)
{
    QStringList missing;
    for (const QString& stored : members) {
        const QString member = KsExistingSpelling(stored);
        const QString name = QDir::toNativeSeparators(member);
        if (!QFileInfo::exists(member))
            missing << tr("%1: the file does not exist").arg(name);
        else if (!m_plugins.TemplateFor(member))
            missing << tr("%1: no editor reads files of this kind").arg(name);
        else
            missing += OpenMemberWithReasons(project, member);
    }
    return missing;
}

/// What an editor says of a file, with the file's name: some say no more than what they expect.
static QString Named(const QString& member, const QString& text)
{
    const QString name = QFileInfo(member).fileName();
    return text.contains(name) ? text : QStringLiteral("%1: %2").arg(QDir::toNativeSeparators(member), text);
}

/// Why a member could not be opened; nothing when it was.
QStringList CProjectController::OpenMemberWithReasons(const CProject& project, const QString& member)
{
    bool opened = false;
    QStringList said;
    {
        const CKsKeptMessages kept;
        opened = OpenMember(project, member, false);
        for (const QString& text : kept.Texts())
            said << Named(member, text);
    }
    if (!opened)
        return said.isEmpty() ? QStringList(QDir::toNativeSeparators(member)) : said;
    for (const QString& text : said)
        KsMessageBox(text);
    return {};
}

void CProjectController::ShowMember(CProjectHandle handle, const QString& stored)
{
    const CProject* project = m_projects.Find(handle);
    const QString member = KsExistingSpelling(stored);
    if (project && m_plugins.TemplateFor(member) && QFileInfo::exists(member))
        OpenMember(CProject(*project), member, true);
}

/// That of a file that is open; null for none.
CKsMDIChildWnd* CProjectController::WindowOf(const QString& member) const
{
    const CKsDoc* open = m_plugins.FindDocument(member);
    return open && !open->Views().empty() ? m_windows.Of(open->Views().front()) : nullptr;
}

/// Opens a member, or, when it is open, brings it to the front if `show`.
bool CProjectController::OpenMember(const CProject& project, const QString& member, bool show)
{
    if (m_plugins.FindDocument(member)) {
        // A view joins when it first appears. One that is open already outside any project is opened anew.
        auto* window = WindowOf(member);
        if (show && window)
            m_frame.MdiArea().setActiveSubWindow(window);
        if (!window || m_projects.FindByView(window->GetActiveView()))
            return true;
        if (!window->close())
            return false; // kept by the user: not in this project
    }
    m_projects.Prefer(project.handle);
    const bool opened = m_plugins.TemplateFor(member)->OpenDocumentFile(&m_frame, member) != nullptr;
    m_projects.Prefer(0);
    return opened;
}

bool CProjectController::Close(CProjectHandle handle)
{
    const CProject* found = m_projects.Find(handle);
    if (!found)
        return false;
    const CProject project = *found;
    QList<QMdiSubWindow*> windows;
    for (const QPointer<CView>& view : project.views) {
        if (auto* window = m_windows.Of(view))
            windows << window;
    }
    if (!m_frame.CloseWindows(windows))
        return false;
    Announce(KsRequest::ProjectClosing, project);
    m_watches.erase(handle);
    m_projects.Close(handle);
    emit Changed();
    return true;
}

/// Tells every view that a project opens or closes.
void CProjectController::Announce(WPARAM what, const CProject& project) const
{
    CKSComm_Package package;
    package.text = project.path;
    package.project = project.handle;
    const auto windows = m_windows.All();
    for (const CKsMDIChildWnd* window : windows)
        KsSendMessage(window->GetActiveView(), KsMessage::ProjectManagement(), what,
                      reinterpret_cast<LPARAM>(&package));
}

void CProjectController::CloseActive()
{
    const auto& all = m_projects.All();
    const CProject* active = m_projects.FindByView(m_frame.GetActiveView());
    if (!active && !all.empty())
        active = all.back().get();
    if (active)
        Close(active->handle);
}
