// The menus of the main frame: one table of actions, and the parts that are filled as they open.
#include "ks/language/language.h"
#include "ks/units/edit_style.h"
#include "shell/main_frame.h"

#include <QActionGroup>
#include <QCoreApplication>
#include <QDir>
#include <QMenu>
#include <QMenuBar>
#include <QStatusBar>
#include <QToolBar>
#include <QUndoStack>
#include <array>
#include <span>

namespace {

enum MenuPosition
{
    FileMenu,
    EditMenu,
    LinesMenu,
    ViewMenu,
    WindowMenu,
    HelpMenu,
    MenuCount
};

constexpr std::array<const char*, MenuCount> MenuTitles{
    QT_TRANSLATE_NOOP("CMainFrame", "&File"),   QT_TRANSLATE_NOOP("CMainFrame", "&Edit"),
    QT_TRANSLATE_NOOP("CMainFrame", "&Lines"),  QT_TRANSLATE_NOOP("CMainFrame", "&View"),
    QT_TRANSLATE_NOOP("CMainFrame", "&Window"), QT_TRANSLATE_NOOP("CMainFrame", "&Help"),
};

/// The key belongs to whatever has the focus; the menu only shows it. Such a command is part of the typing.
constexpr bool ShownOnly = true;

} // namespace

/// One entry of a menu. A row without a name is a separator.
struct CFrameAction
{
    Q_DECLARE_TR_FUNCTIONS(CFrameAction)
public:
    MenuPosition menu;
    const char* name = nullptr; // object name
    const char* text = nullptr;
    const char* tip = nullptr; // shown in the status bar
    void (CMainFrame::*run)() = nullptr;
    QKeySequence::StandardKey key = QKeySequence::UnknownKey;
    const char* icon = nullptr; // also puts it onto the standard tool bar
    bool shownOnly = false;

    static std::span<const CFrameAction> Table();
};

std::span<const CFrameAction> CFrameAction::Table()
{
    using F = CMainFrame;
    using K = QKeySequence;
    // clang-format off
    static const CFrameAction table[] = {
        {FileMenu, "actionNew", QT_TR_NOOP("&New"), QT_TR_NOOP("Starts a new document"), &F::OnFileNew, K::New, "new"},
        {FileMenu, "actionOpen", QT_TR_NOOP("&Open..."), QT_TR_NOOP("Opens a document or a project"), &F::OnFileOpen, K::Open, "open"},
        {FileMenu, "actionOpenProject", QT_TR_NOOP("Open &Project..."), QT_TR_NOOP("Opens a project with all its files"), &F::OnFileOpenProject},
        {FileMenu, "actionOpenRecent", QT_TR_NOOP("Open &Recent"), QT_TR_NOOP("Opens one of the files used last")},
        {FileMenu},
        {FileMenu, "actionSave", QT_TR_NOOP("&Save"), QT_TR_NOOP("Saves the active document"), &F::OnFileSave, K::Save, "save"},
        {FileMenu, "actionSaveAs", QT_TR_NOOP("Save &As..."), QT_TR_NOOP("Saves the active document under a new name"), &F::OnFileSaveAs, K::SaveAs},
        {FileMenu, "actionClose", QT_TR_NOOP("&Close"), QT_TR_NOOP("Closes the active window"), &F::OnFileClose, K::Close},
        {FileMenu, "actionCloseProject", QT_TR_NOOP("Close Projec&t"), QT_TR_NOOP("Closes the project with all its files"), &F::OnFileCloseProject},
        {FileMenu},
        {FileMenu, "actionExit", QT_TR_NOOP("E&xit"), QT_TR_NOOP("Closes all documents and ends the program"), &F::OnFileExit, K::Quit},
        {EditMenu, "actionUndo", QT_TR_NOOP("&Undo"), QT_TR_NOOP("Takes the last change back"), &F::OnUndo, K::Undo, "undo"},
        {EditMenu, "actionRedo", QT_TR_NOOP("&Redo"), QT_TR_NOOP("Makes the change again that was taken back"), &F::OnRedo, K::Redo, "redo"},
        {EditMenu},
        {EditMenu, "actionCut", QT_TR_NOOP("Cu&t"), QT_TR_NOOP("Moves the selection to the clipboard"), &F::OnCut, K::Cut, nullptr, ShownOnly},
        {EditMenu, "actionCopy", QT_TR_NOOP("&Copy"), QT_TR_NOOP("Copies the selection to the clipboard"), &F::OnCopy, K::Copy, nullptr, ShownOnly},
        {EditMenu, "actionPaste", QT_TR_NOOP("&Paste"), QT_TR_NOOP("Puts in what is on the clipboard"), &F::OnPaste, K::Paste, nullptr, ShownOnly},
        {ViewMenu, "actionUnits", QT_TR_NOOP("&Units"), QT_TR_NOOP("Units in which values are shown; files are not affected")},
        {ViewMenu, "actionAllDigits", QT_TR_NOOP("All &Digits"), QT_TR_NOOP("Shows every digit of the numbers in tables and fields"), &F::OnAllDigits},
        {ViewMenu, "actionLanguage", QT_TR_NOOP("&Language"), QT_TR_NOOP("Language of the program")},
        {ViewMenu, "actionToolBars", QT_TR_NOOP("&Tool Bars"), QT_TR_NOOP("Shows or hides tool bars")},
        {ViewMenu, "actionProjectTree", QT_TR_NOOP("&Project"), QT_TR_NOOP("Shows or hides the files of the project"), &F::OnProjectTree},
        {WindowMenu, "actionCascade", QT_TR_NOOP("&Cascade"), QT_TR_NOOP("Arranges the windows one behind the other"), &F::OnCascade},
        {WindowMenu, "actionTile", QT_TR_NOOP("&Tile"), QT_TR_NOOP("Arranges the windows side by side"), &F::OnTile},
        {WindowMenu, "actionSideBySide", QT_TR_NOOP("&Side by Side"), QT_TR_NOOP("Puts the other windows beside the active one"), &F::OnSideBySide},
        {WindowMenu, "actionNextWindow", QT_TR_NOOP("Ne&xt"), QT_TR_NOOP("Goes to the next window"), &F::OnNextWindow, K::NextChild},
        {WindowMenu, "actionPreviousWindow", QT_TR_NOOP("Pre&vious"), QT_TR_NOOP("Goes to the previous window"), &F::OnPreviousWindow, K::PreviousChild},
        {WindowMenu, "actionTabs", QT_TR_NOOP("Ta&bs"), QT_TR_NOOP("Shows the windows as tabs"), &F::OnTabs},
        {WindowMenu},
        {WindowMenu, "actionCloseAll", QT_TR_NOOP("Close &All"), QT_TR_NOOP("Closes all windows"), &F::OnCloseAll},
        {HelpMenu, "actionContents", QT_TR_NOOP("&Contents"), QT_TR_NOOP("Shows the help of the editor"), &F::OnContents, K::HelpContents},
        {HelpMenu, "actionPlugins", QT_TR_NOOP("&Plug-ins..."), QT_TR_NOOP("Lists the editors that were loaded"), &F::OnPlugins},
        {HelpMenu, "actionAbout", QT_TR_NOOP("&About"), QT_TR_NOOP("Name and version of the program"), &F::OnAbout},
    };
    // clang-format on
    return table;
}

/// The desktop's keys for a standard command, Tab spelled as on the keyboard. Redo has both of its usual keys,
/// whichever of them the desktop knows: the grids and the documentation name Ctrl+Y.
static QList<QKeySequence> KeysFor(QKeySequence::StandardKey key)
{
    auto keys = QKeySequence::keyBindings(key);
    if (key == QKeySequence::Close)
        return {QKeySequence(Qt::CTRL | Qt::Key_W), QKeySequence(Qt::CTRL | Qt::Key_F4)};
    if (key == QKeySequence::PreviousChild)
        keys.prepend(QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_Tab));
    if (key == QKeySequence::Redo) {
        const QList<QKeySequence> both{Qt::CTRL | Qt::Key_Y, Qt::CTRL | Qt::SHIFT | Qt::Key_Z};
        keys.removeIf([&both](const QKeySequence& each) { return both.contains(each); });
        keys = both + keys;
    }
    return keys;
}

QAction* CMainFrame::Action(const char* name) const
{
    return m_actions.at(QString::fromLatin1(name));
}

/// Every command first asks the active view, so that what is being typed is part of what the command finds.
void CMainFrame::Connect(QAction* action, std::function<void()> run, bool whileTyping)
{
    connect(action, &QAction::triggered, this, [this, run = std::move(run), whileTyping] {
        if (whileTyping || MayLeave())
            run();
        else
            UpdateActions(); // a check mark may have changed already
    });
}

void CMainFrame::CreateActions()
{
    for (const CFrameAction& row : CFrameAction::Table()) {
        if (!row.name)
            continue;
        auto* action = new QAction(this);
        action->setObjectName(QString::fromLatin1(row.name));
        if (row.icon)
            action->setIcon(QIcon(QStringLiteral(":/shell/%1.svg").arg(QLatin1String(row.icon))));
        if (row.key != QKeySequence::UnknownKey && !row.shownOnly)
            action->setShortcuts(KeysFor(row.key));
        if (row.run)
            Connect(
                action, [this, run = row.run] { (this->*run)(); }, row.shownOnly);
        m_actions.emplace(action->objectName(), action);
    }
    Action("actionTabs")->setCheckable(true);
    Action("actionProjectTree")->setCheckable(true);
    Action("actionAllDigits")->setCheckable(true);
    Action("actionExit")->setMenuRole(QAction::QuitRole);
    Action("actionAbout")->setMenuRole(QAction::AboutRole);
}

void CMainFrame::CreateMenus()
{
    m_standardBar = addToolBar(QString());
    m_standardBar->setObjectName(QStringLiteral("standardBar"));
    m_standardBar->setIconSize(QSize(16, 16));
    for (int position = 0; position < MenuCount; ++position)
        m_menus.push_back(menuBar()->addMenu(QString()));
    for (const CFrameAction& row : CFrameAction::Table()) {
        if (!row.name) {
            m_menus[row.menu]->addSeparator();
            continue;
        }
        m_menus[row.menu]->addAction(Action(row.name));
        if (row.icon)
            m_standardBar->addAction(Action(row.name));
    }
    m_standardBar->insertSeparator(Action("actionUndo"));

    const auto addSubMenu = [this](const char* name) {
        auto* menu = new QMenu(this);
        Action(name)->setMenu(menu);
        return menu;
    };
    m_recentMenu = addSubMenu("actionOpenRecent");
    m_unitsMenu = addSubMenu("actionUnits");
    m_languageMenu = addSubMenu("actionLanguage");
    m_toolBarMenu = addSubMenu("actionToolBars");

    auto* units = new QActionGroup(this);
    for (const auto& [name, run] : {std::pair("actionMetric", &CMainFrame::OnMetric),
                                    std::pair("actionUsCustomary", &CMainFrame::OnUsCustomary)}) {
        auto* action = m_unitsMenu->addAction(QString());
        action->setObjectName(QString::fromLatin1(name));
        action->setCheckable(true);
        units->addAction(action);
        Connect(action, [this, command = run] { (this->*command)(); });
        m_actions.emplace(action->objectName(), action);
    }
    CreateLanguageMenu(m_languageMenu);

    connect(m_menus[FileMenu], &QMenu::aboutToShow, this, &CMainFrame::UpdateActions);
    connect(m_recentMenu, &QMenu::aboutToShow, this, &CMainFrame::FillRecentMenu);
    connect(m_menus[EditMenu], &QMenu::aboutToShow, this, &CMainFrame::UpdateEditMenu);
    connect(m_menus[LinesMenu], &QMenu::aboutToShow, this, [this] { UpdateLinesMenu(true); });
    connect(m_menus[LinesMenu], &QMenu::aboutToHide, this, [this] { UpdateLinesMenu(false); });
    connect(m_menus[ViewMenu], &QMenu::aboutToShow, this, &CMainFrame::UpdateActions);
    connect(m_toolBarMenu, &QMenu::aboutToShow, this, [this] { FillToolBarMenu(m_toolBarMenu); });
    connect(m_menus[WindowMenu], &QMenu::aboutToShow, this, &CMainFrame::FillWindowMenu);
    EnableMenuItem(LinesMenu, false);
}

void CMainFrame::CreateLanguageMenu(QMenu* menu)
{
    // Every language by its own name, so that it is found whatever the present one is.
    const std::map<QString, QString> names{{QStringLiteral("en_US"), QStringLiteral("English (United States)")},
                                           {QStringLiteral("en_GB"), QStringLiteral("English (United Kingdom)")},
                                           {QStringLiteral("ja"), QStringLiteral("日本語")}};
    auto* group = new QActionGroup(this);
    for (const QString& code : KsLanguage::Available()) {
        QAction* action = menu->addAction(names.at(code));
        action->setObjectName(QStringLiteral("actionLanguage_") + code);
        action->setCheckable(true);
        group->addAction(action);
        Connect(action, [code] { KsLanguage::Instance().SetCurrent(code); });
        m_actions.emplace(action->objectName(), action);
    }
}

void CMainFrame::Retranslate()
{
    for (int position = 0; position < MenuCount; ++position)
        m_menus[std::size_t(position)]->setTitle(tr(MenuTitles[std::size_t(position)]));
    for (const CFrameAction& row : CFrameAction::Table()) {
        if (!row.name)
            continue;
        QString text = CFrameAction::tr(row.text);
        if (row.shownOnly)
            text += u'\t' + QKeySequence(row.key).toString(QKeySequence::NativeText);
        Action(row.name)->setText(text);
        Action(row.name)->setStatusTip(CFrameAction::tr(row.tip));
    }
    Action("actionMetric")->setText(tr("&Metric"));
    Action("actionUsCustomary")->setText(tr("&US Customary"));
    m_standardBar->setWindowTitle(tr("Standard"));
    MdiArea().SetHint(Templates().empty() ? tr("No editor was found. See Help, Plug-ins.")
                                          : tr("Open a file with File, Open, or drop it here."));
    UpdateUndoTexts();
    UpdatePluginLabel();
    UpdateTitle();
    FillLinesMenu();
}

void CMainFrame::UpdateActions()
{
    const bool document = ActiveDocument() != nullptr;
    for (const char* name : {"actionSave", "actionSaveAs", "actionClose"})
        Action(name)->setEnabled(document);
    Action("actionNew")->setEnabled(!Templates().empty());
    Action("actionCloseProject")->setEnabled(!m_projects.All().empty());
    Action("actionProjectTree")->setEnabled(!m_projects.All().empty());
    Action("actionProjectTree")->setChecked(m_projectTree->isVisible());
    Action("actionOpenRecent")->setEnabled(!m_recent.Files().isEmpty());
    Action("actionAllDigits")->setChecked(KsUnits::Instance().AllDigits());
    const bool usCustomary = KsUnits::Instance().System() == KsUnitSystem::UsCustomary;
    Action(usCustomary ? "actionUsCustomary" : "actionMetric")->setChecked(true);
    m_actions.at(QStringLiteral("actionLanguage_") + KsLanguage::Instance().Current())->setChecked(true);
    const auto* target = dynamic_cast<CCommandTarget*>(GetActiveView());
    Action("actionContents")
        ->setVisible(!HelpFile().isEmpty() || (target && target->IsCommandEnabled(KsCommand::Help)));
}

// ---- menus filled as they open -----------------------------------------------------------------

void CMainFrame::FillRecentMenu()
{
    m_recentMenu->clear();
    int number = 0;
    for (const QString& file : m_recent.Files()) {
        QString text = QDir::toNativeSeparators(file).replace(u'&', QStringLiteral("&&"));
        if (++number < 10)
            text.prepend(QStringLiteral("&%1  ").arg(number));
        Connect(m_recentMenu->addAction(text), [this, file] { OpenFile(file); });
    }
    m_recentMenu->addSeparator();
    connect(m_recentMenu->addAction(tr("&Clear List")), &QAction::triggered, this, [this] {
        m_recent.Clear();
        UpdateActions();
    });
}

/// The third menu belongs to the editor of the active view.
void CMainFrame::ActiveViewChanged(CView* view)
{
    CKsDoc* document = view ? view->GetDocument() : nullptr;
    m_undo.setActiveStack(document ? &document->UndoStack() : nullptr);
    FillLinesMenu();
    EnableMenuItem(LinesMenu, !m_menus[LinesMenu]->isEmpty()); // the view may grey it again
    UpdateActions();
    UpdateTitle();
    statusBar()->clearMessage(); // it was about the view before
}

void CMainFrame::FillLinesMenu()
{
    QMenu* menu = m_menus[LinesMenu];
    auto* target = dynamic_cast<CCommandTarget*>(GetActiveView());
    menu->clear();
    for (const CKsMenuCommand& command : target ? target->LinesMenu() : std::vector<CKsMenuCommand>()) {
        if (command.text.isEmpty()) {
            menu->addSeparator();
            continue;
        }
        QAction* action = menu->addAction(command.text);
        action->setObjectName(QStringLiteral("command%1").arg(command.id));
        action->setShortcut(command.shortcut);
        action->setStatusTip(command.statusTip);
        connect(action, &QAction::triggered, this, [this, id = command.id] { SendCommand(id); });
        action->setData(command.id);
    }
}

/// Commands are greyed only while the menu is open: a shortcut must not depend on when it was last looked at.
void CMainFrame::UpdateLinesMenu(bool open)
{
    const auto* target = dynamic_cast<CCommandTarget*>(GetActiveView());
    const auto actions = m_menus[LinesMenu]->actions();
    for (QAction* action : actions) {
        if (!action->isSeparator())
            action->setEnabled(!open || (target && target->IsCommandEnabled(action->data().toInt())));
    }
}

void CMainFrame::FillToolBarMenu(QMenu* menu)
{
    menu->clear();
    menu->addAction(m_standardBar->toggleViewAction());
    for (QAction* toggle : m_bars.Toggles())
        menu->addAction(toggle);
}

QMenu* CMainFrame::createPopupMenu()
{
    auto* menu = new QMenu(this);
    FillToolBarMenu(menu);
    return menu;
}

void CMainFrame::FillWindowMenu()
{
    QMenu* menu = m_menus[WindowMenu];
    const auto actions = menu->actions();
    for (QAction* action : actions.mid(actions.indexOf(Action("actionCloseAll")) + 1))
        delete action;
    const auto windows = MdiArea().subWindowList();
    const bool tabs = MdiArea().viewMode() == QMdiArea::TabbedView;
    Action("actionTabs")->setChecked(tabs);
    for (const char* name : {"actionCascade", "actionTile"})
        Action(name)->setEnabled(!tabs && !windows.isEmpty());
    for (const char* name : {"actionSideBySide", "actionNextWindow", "actionPreviousWindow", "actionCloseAll"})
        Action(name)->setEnabled(!windows.isEmpty());
    if (!windows.isEmpty())
        menu->addSeparator();
    for (QMdiSubWindow* window : windows) {
        QString title = window->windowTitle().replace(u'&', QStringLiteral("&&"));
        QAction* action = menu->addAction(title.replace(QStringLiteral("[*]"), window->isWindowModified() ? "*" : ""));
        action->setCheckable(true);
        action->setChecked(window == MdiArea().currentSubWindow());
        Connect(action, [this, window = QPointer(window)] { MdiArea().setActiveSubWindow(window); });
    }
}
