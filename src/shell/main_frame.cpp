#include "shell/main_frame.h"

#include "ks/fc/exports.h"
#include "ks/language/language.h"
#include "ks/units/edit_style.h"
#include "shell/settings_keys.h"

#include <QApplication>
#include <QCloseEvent>
#include <QIcon>
#include <QLabel>
#include <QMenu>
#include <QScreen>
#include <QSettings>
#include <QStatusBar>
#include <QTabBar>

static void InitResources()
{
    Q_INIT_RESOURCE(shell); // stands in a static library
}

CMainFrame::CMainFrame() : m_bars(this)
{
    InitResources();
    setObjectName(QStringLiteral("mainFrame"));
    setAcceptDrops(true);
    setWindowIcon(QIcon(QStringLiteral(":/shell/shell.svg")));
    MdiArea().setTabsClosable(true);
    MdiArea().setTabsMovable(true);
    MdiArea().setDocumentMode(true);
    m_pluginLabel = new QLabel(this);
    m_pluginLabel->setObjectName(QStringLiteral("pluginLabel"));
    statusBar()->addPermanentWidget(m_pluginLabel);
    m_projectLabel = new QLabel(this);
    statusBar()->addPermanentWidget(m_projectLabel);

    m_projectTree = new CProjectTree(this);
    addDockWidget(Qt::LeftDockWidgetArea, m_projectTree);
    m_projectTree->hide(); // until there is a project
    // Queued: what is chosen fills the tree anew, whose items are busy until then.
    connect(m_projectTree, &CProjectTree::MemberChosen, this, &CMainFrame::ShowMember, Qt::QueuedConnection);
    connect(m_projectTree, &CProjectTree::CloseProjectChosen, this, &CMainFrame::CloseProject, Qt::QueuedConnection);

    CreateActions();
    CreateMenus();
    connect(&m_undo, &QUndoGroup::canUndoChanged, this, &CMainFrame::UpdateUndoTexts);
    connect(&m_undo, &QUndoGroup::canRedoChanged, this, &CMainFrame::UpdateUndoTexts);
    connect(&m_undo, &QUndoGroup::undoTextChanged, this, &CMainFrame::UpdateUndoTexts);
    connect(&m_undo, &QUndoGroup::redoTextChanged, this, &CMainFrame::UpdateUndoTexts);

    Retranslate();
    ReadSettings();
    UpdateActions();
    KsSetMainWindow(this);
}

CMainFrame::~CMainFrame()
{
    DestroyWindows(); // while this still answers the editors' messages
    KsClearExports();
    for (const auto& plugin : m_plugins)
        plugin->templates.clear();
}

void CMainFrame::LoadPlugins(const QString& folder)
{
    auto loaded = ::LoadPlugins(folder);
    for (auto& plugin : loaded) {
        for (const auto& documents : plugin->templates)
            AddTemplate(documents.get());
        m_plugins.push_back(std::move(plugin));
    }
    m_bars.Create(m_plugins);
    Retranslate();
    UpdateActions();
}

/// Names the plug-ins that are not used, without stopping anybody.
void CMainFrame::UpdatePluginLabel()
{
    QStringList names, reasons;
    for (const auto& plugin : m_plugins) {
        if (plugin->IsUsable())
            continue;
        names << plugin->name;
        reasons << plugin->name + QStringLiteral(": ") + plugin->error;
    }
    m_pluginLabel->setVisible(!names.isEmpty());
    m_pluginLabel->setText(tr("Not loaded: %1 (see Help, Plug-ins)").arg(names.join(QStringLiteral(", "))));
    m_pluginLabel->setToolTip(reasons.join(u'\n'));
}

LRESULT CMainFrame::WindowProc(unsigned message, WPARAM wParam, LPARAM lParam)
{
    auto* package = reinterpret_cast<CKSComm_Package*>(lParam);
    if (message == KsMessage::ShowToolbar() || message == KsMessage::HideToolbar()) {
        m_bars.Show(package ? package->view : GetActiveView(), message == KsMessage::ShowToolbar());
        return 0;
    }
    if (package && message == KsMessage::SwitchBoard())
        return m_projects.SwitchBoard(wParam, *package);
    if (package && message == KsMessage::BetweenEditors())
        m_projects.Forward(wParam, *package);
    return CKsMDIFrameWnd::WindowProc(message, wParam, lParam);
}

CKsDoc* CMainFrame::ActiveDocument() const
{
    return GetActiveView() ? GetActiveView()->GetDocument() : nullptr;
}

void CMainFrame::UpdateTitle()
{
    const CKsDoc* document = ActiveDocument();
    const QString program = QCoreApplication::applicationName();
    // This form is also the one that a maximised document window would make of it.
    setWindowTitle(document ? QStringLiteral("%1 - [%2[*]]").arg(program, document->GetTitle()) : program);
    setWindowModified(document && document->IsModified());
    const CProject* project = m_projects.FindByView(GetActiveView());
    m_projectLabel->setText(project ? tr("Project: %1").arg(project->name) : QString());
    m_projectLabel->setToolTip(project ? project->path : QString());
    UpdateProjectTree();
}

void CMainFrame::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        for (const auto& plugin : m_plugins)
            plugin->UpdateName();
        m_bars.Create(m_plugins);
        Retranslate();
    }
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

// ---- settings ----------------------------------------------------------------------------------

void CMainFrame::ReadSettings()
{
    const QSettings settings;
    if (!restoreGeometry(settings.value(Settings::Geometry).toByteArray()))
        resize(QSize(1500, 940).boundedTo(screen()->availableSize()));
    restoreState(settings.value(Settings::State).toByteArray());
    m_projectTree->hide(); // until a project is opened
    ShowTabs(settings.value(Settings::Tabs, true).toBool());
    const bool usCustomary = settings.value(Settings::UsCustomary, false).toBool();
    KsUnits::Instance().SetSystem(usCustomary ? KsUnitSystem::UsCustomary : KsUnitSystem::Metric);
    KsUnits::Instance().SetAllDigits(settings.value(Settings::AllDigits, false).toBool());
}

/// Document windows as tabs, or as windows inside the frame.
void CMainFrame::ShowTabs(bool tabs)
{
    MdiArea().setViewMode(tabs ? QMdiArea::TabbedView : QMdiArea::SubWindowView);
    if (auto* bar = MdiArea().findChild<QTabBar*>(QString(), Qt::FindDirectChildrenOnly))
        bar->setExpanding(false);
    Action("actionTabs")->setChecked(tabs);
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
