#include "shell/main_frame.h"

#include "ks/fc/help_window.h"
#include "shell/help_commands.h"

#include "ks/fc/exports.h"
#include "ks/fc/file_name.h"
#include "ks/fc/shown_text.h"
#include "ks/fc/system_reason.h"
#include "ks/language/language.h"
#include "ks/units/edit_style.h"
#include "shell/project_respell.h"
#include "shell/recent_files.h"
#include "shell/settings_keys.h"

#include <QApplication>
#include <QCloseEvent>
#include <QDir>
#include <QDropEvent>
#include <QIcon>
#include <QLabel>
#include <QMenu>
#include <QMimeData>
#include <QScreen>
#include <QSettings>
#include <QStatusBar>
#include <QTimer>
#include <QUndoStack>
#include <QUrl>

CMainFrame::CMainFrame()
    : m_windows(*this),
      m_projects(*this, m_windows, m_plugins),
      m_files(*this, m_plugins, m_projects),
      m_bars(*this, m_plugins),
      m_menus(*this),
      m_snapshots(m_recoveryFolder),
      m_recovery(*this, m_plugins, m_recoveryFolder, m_snapshots),
      m_recoveryLabel(new QLabel(this)),
      m_pluginLabel(new QLabel(this)),
      m_projectLabel(new QLabel(this))
{
    setObjectName(QStringLiteral("mainFrame"));
    setAcceptDrops(true);
    setWindowIcon(QIcon(QStringLiteral(":/shell/shell.svg")));
    m_pluginLabel->setObjectName(QStringLiteral("pluginLabel"));
    m_recoveryLabel->setObjectName(QStringLiteral("recoveryLabel"));
    m_recoveryLabel->hide();
    QFont strong = m_recoveryLabel->font();
    strong.setBold(true);
    m_recoveryLabel->setFont(strong);
    statusBar()->addPermanentWidget(m_recoveryLabel);
    statusBar()->addPermanentWidget(m_pluginLabel);
    statusBar()->addPermanentWidget(m_projectLabel);
    connect(&m_projects, &CProjectController::Changed, this, &CMainFrame::Update);
    connect(&m_snapshots, &CSnapshots::FailuresChanged, this, &CMainFrame::UpdateRecoveryLabel);

    Retranslate();
    ReadSettings();
    Update();
    KsSetMainWindow(this);
}

CMainFrame::~CMainFrame()
{
    DestroyWindows(); // while this still answers the editors' messages
    KsClearExports();
    m_plugins.Clear();
}

void CMainFrame::LoadPlugins(const QString& folder)
{
    for (const CMultiDocTemplate* documents : m_plugins.Load(folder))
        Follow(*documents);
    m_bars.Create();
    Retranslate();
    Update();
}

LRESULT CMainFrame::WindowProc(unsigned message, WPARAM wParam, LPARAM lParam)
{
    auto* package = reinterpret_cast<CKSComm_Package*>(lParam);
    if (message == KsMessage::ShowToolbar() || message == KsMessage::HideToolbar()) {
        m_bars.Show(package ? package->view : GetActiveView(), message == KsMessage::ShowToolbar());
        return 0;
    }
    if (package && message == KsMessage::SwitchBoard())
        return m_projects.Registry().SwitchBoard(wParam, *package);
    if (package && message == KsMessage::BetweenEditors())
        m_projects.Registry().Forward(wParam, *package);
    return CKsMDIFrameWnd::WindowProc(message, wParam, lParam);
}

std::vector<KsHelpChapter> CMainFrame::HelpChapters() const
{
    return ShellChapters();
}

QMenu* CMainFrame::createPopupMenu()
{
    auto* menu = new QMenu(this);
    m_menus.FillToolBars(menu);
    return menu;
}

// ---- documents ---------------------------------------------------------------------------------

void CMainFrame::Follow(const CMultiDocTemplate& documents)
{
    connect(&documents, &CMultiDocTemplate::DocumentClosing, &m_projects, &CProjectController::UpdateTree,
            Qt::QueuedConnection);
    connect(&documents, &CMultiDocTemplate::DocumentOpened, this, [this](CKsDoc* document) {
        m_edit.History().addStack(&document->UndoStack());
        connect(document, &CKsDoc::TitleChanged, this, &CMainFrame::UpdateTitle);
        connect(document, &CKsDoc::PathNameChanged, this, &CMainFrame::DocumentRenamed);
    });
    connect(&documents, &CMultiDocTemplate::DocumentShown, this, &CMainFrame::DocumentShown);
    m_snapshots.Follow(documents);
}

/// Whoever opened it: the user, a project, or an editor for another one.
void CMainFrame::DocumentShown(const CKsDoc* document)
{
    if (!document->GetPathName().isEmpty())
        RecentFiles::Add(document->GetPathName());
    const CPlugin* editor = m_plugins.Of(document->GetDocTemplate());
    for (const CView* view : document->Views()) {
        if (auto* window = m_windows.Of(view); window && editor)
            window->setWindowIcon(editor->Icon());
    }
    Update(); // by now it may have joined a project
}

void CMainFrame::DocumentRenamed(const QString& oldPath, const QString& newPath)
{
    RecentFiles::Rename(oldPath, newPath);
    RespellMember(m_projects.Registry(), oldPath, newPath);
    if (!newPath.isEmpty())
        RecentFiles::Add(newPath);
}

/// Work goes on: only a crash would show the difference. It is said as long as it is so.
void CMainFrame::UpdateRecoveryLabel()
{
    QStringList reasons;
    for (const auto& [document, why] : m_snapshots.Failures())
        reasons << tr("The changes to %1 cannot be kept for the case of a crash: %2.")
                       .arg(KsShownFileName(document->GetTitle()), KsSystemReason(why));
    if (!reasons.isEmpty() && m_recoveryLabel->isHidden())
        TellStatus(reasons.back());
    reasons << tr("Save often. It is tried again and again; when it works, this notice goes.");
    m_recoveryLabel->setText(tr("Recovery after a crash does not work"));
    m_recoveryLabel->setToolTip(KsVisibleText(reasons.join(u'\n'), true));
    m_recoveryLabel->setAccessibleDescription(m_recoveryLabel->toolTip());
    m_recoveryLabel->setVisible(reasons.size() > 1);
}

void CMainFrame::ActiveViewChanged(CView* view)
{
    CKsDoc* document = view ? view->GetDocument() : nullptr;
    m_edit.History().setActiveStack(document ? &document->UndoStack() : nullptr);
    m_menus.ViewChanged();
    Update();
    TellStatus({}); // it was about the view before
}

bool CMainFrame::TakeFiles(const QStringList& files, const QString& token)
{
    if (QApplication::activeModalWidget())
        return false;
    // When the other one has its answer: what is opened may ask.
    QTimer::singleShot(0, this, [this, files, token] {
        qputenv("XDG_ACTIVATION_TOKEN", token.toUtf8());
        setWindowState(windowState() & ~Qt::WindowMinimized);
        raise();
        activateWindow();
        qunsetenv("XDG_ACTIVATION_TOKEN");
        if (!MayLeave())
            return TellStatus(
                tr("Not opened, as what is being typed here is no value: %1").arg(KsShownFileName(files.front())));
        OpenFiles(files);
    });
    return true;
}

// ---- texts -------------------------------------------------------------------------------------

void CMainFrame::Retranslate()
{
    m_menus.Retranslate();
    MdiArea().SetHint(CMultiDocTemplate::All().empty() ? tr("No editor was found. See Help, Plug-ins.")
                                                       : tr("Open a file with File, Open, or drop it here."));
    UpdateRecoveryLabel();
    UpdatePluginLabel();
    UpdateTitle();
}

/// What can be done, and where one is.
void CMainFrame::Update()
{
    UpdateTitle();
    m_menus.Update();
}

void CMainFrame::ShowModified()
{
    const CKsDoc* document = ActiveDocument();
    if (const bool isModified = document && document->IsModified(); isWindowModified() != isModified)
        setWindowModified(isModified);
}

void CMainFrame::UpdateTitle()
{
    const CKsDoc* document = ActiveDocument();
    const QString program = QCoreApplication::applicationName();
    // This form is also the one that a maximised document window would make of it.
    setWindowTitle(document ? QStringLiteral("%1 - [%2[*]]").arg(program, KsTitleText(document->GetTitle())) : program);
    ShowModified();
    const CProject* project = m_projects.Registry().FindByView(GetActiveView());
    m_projectLabel->setText(project ? tr("Project: %1").arg(KsVisibleText(project->name)) : QString());
    m_projectLabel->setToolTip(project ? KsVisibleText(QDir::toNativeSeparators(project->path)) : QString());
    m_projects.UpdateTree();
}

/// Names the plug-ins that are not used, without stopping anybody.
void CMainFrame::UpdatePluginLabel()
{
    QStringList names, reasons;
    for (const auto& plugin : m_plugins.All()) {
        if (plugin->IsUsable())
            continue;
        names << KsVisibleText(plugin->name);
        reasons << KsVisibleText(plugin->name + QStringLiteral(": ") + plugin->error);
    }
    m_pluginLabel->setVisible(!names.isEmpty());
    m_pluginLabel->setText(tr("Not loaded: %1 (see Help, Plug-ins)").arg(names.join(QStringLiteral(", "))));
    m_pluginLabel->setToolTip(reasons.join(u'\n'));
}

// ---- events ------------------------------------------------------------------------------------

void CMainFrame::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        for (const auto& plugin : m_plugins.All())
            plugin->UpdateName();
        m_bars.Create();
        Retranslate();
    }
    if (event->type() == QEvent::ModifiedChange)
        ShowModified(); // a document window that is no longer maximised takes the mark away
    CKsMDIFrameWnd::changeEvent(event);
}

void CMainFrame::closeEvent(QCloseEvent* event)
{
    if (!CloseAllWindows()) {
        event->ignore();
        return;
    }
    WriteSettings();
    event->accept();
}

void CMainFrame::dragEnterEvent(QDragEnterEvent* event)
{
    const auto urls = event->mimeData()->urls();
    if (std::any_of(urls.begin(), urls.end(), [this](const QUrl& url) { return m_files.Knows(url.toLocalFile()); }))
        event->acceptProposedAction();
}

void CMainFrame::dropEvent(QDropEvent* event)
{
    const auto urls = event->mimeData()->urls();
    event->acceptProposedAction();
    if (!MayLeave())
        return;
    QStringList files;
    for (const QUrl& url : urls) {
        if (url.isLocalFile())
            files << url.toLocalFile();
    }
    OpenFiles(files);
}

// ---- settings ----------------------------------------------------------------------------------

void CMainFrame::ReadSettings()
{
    const QSettings settings;
    if (!restoreGeometry(settings.value(Settings::Geometry).toByteArray())) {
        // The frame that the desktop puts around it is not known before it is there.
        const int frame = 2 * style()->pixelMetric(QStyle::PM_TitleBarHeight);
        resize(QSize(1500, 940).boundedTo(screen()->availableSize() - QSize(frame, frame)));
    }
    restoreState(settings.value(Settings::State).toByteArray());
    m_projects.Tree().hide(); // until a project is opened
    m_windows.ShowTabs(settings.value(Settings::Tabs, true).toBool());
    const bool usCustomary = settings.value(Settings::UsCustomary, false).toBool();
    KsUnits::Instance().SetSystem(usCustomary ? KsUnitSystem::UsCustomary : KsUnitSystem::Metric);
    KsUnits::Instance().SetAllDigits(settings.value(Settings::AllDigits, false).toBool());
}

void CMainFrame::WriteSettings() const
{
    QSettings settings;
    settings.setValue(Settings::Geometry, saveGeometry());
    settings.setValue(Settings::State, saveState());
    settings.setValue(Settings::UsCustomary, KsUnits::Instance().System() == KsUnitSystem::UsCustomary);
    settings.setValue(Settings::AllDigits, KsUnits::Instance().AllDigits());
    settings.setValue(Settings::Language, KsLanguage::Instance().Current());
}
