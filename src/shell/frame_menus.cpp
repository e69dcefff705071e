#include "shell/frame_menus.h"

#include "ks/fc/shown_text.h"
#include "ks/language/language.h"
#include "ks/units/edit_style.h"
#include "shell/appearance.h"
#include "shell/frame_actions.h"
#include "shell/main_frame.h"
#include "shell/recent_files.h"
#include "shell/settings_keys.h"
#include "shell/view_menu.h"

#include <QActionGroup>
#include <QDir>
#include <QMenu>
#include <QMenuBar>
#include <QSettings>
#include <QToolBar>

static void InitResources()
{
    Q_INIT_RESOURCE(shell); // stands in a static library
}

CFrameMenus::CFrameMenus(CMainFrame& frame) : m_frame(frame), m_standardBar(frame.addToolBar(QString()))
{
    InitResources();
    m_standardBar->setObjectName(QStringLiteral("standardBar"));
    m_standardBar->setIconSize(QSize(16, 16));
    CreateActions();
    CreateMenus();
    CreateUnits();
    CreateLanguages();
    CreateAppearances();
    m_lines =
        new CViewMenu(m_frame, *m_menus[LinesMenu], &CCommandTarget::LinesMenu, CViewMenu::Keys::OfMenu, nullptr, this);
    const auto edit = m_menus[EditMenu]->actions();
    m_clipboard = new CViewMenu(m_frame, *m_menus[EditMenu], &CCommandTarget::EditMenu, CViewMenu::Keys::OfFocus,
                                edit.value(edit.indexOf(Action("actionPaste")) + 1), this);
    m_frame.EnableMenuItem(LinesMenu, false);
    const QUndoGroup& history = m_frame.Edit().History();
    connect(&history, &QUndoGroup::canUndoChanged, this, &CFrameMenus::UpdateUndo);
    connect(&history, &QUndoGroup::canRedoChanged, this, &CFrameMenus::UpdateUndo);
    connect(&history, &QUndoGroup::undoTextChanged, this, &CFrameMenus::UpdateUndo);
    connect(&history, &QUndoGroup::redoTextChanged, this, &CFrameMenus::UpdateUndo);
}

QAction* CFrameMenus::Action(const char* name) const
{
    return m_actions.at(QString::fromLatin1(name));
}

/// Every command first asks the active view, so that what is being typed is part of what the command finds.
void CFrameMenus::Connect(QAction* action, std::function<void()> run, bool whileTyping)
{
    connect(action, &QAction::triggered, this, [this, run = std::move(run), whileTyping] {
        if (whileTyping || m_frame.MayLeave())
            run();
        else
            Update(); // a check mark may have changed already
    });
}

void CFrameMenus::CreateActions()
{
    for (const CFrameAction& row : CFrameAction::Table()) {
        if (!row.name)
            continue;
        auto* action = new QAction(&m_frame);
        action->setObjectName(QString::fromLatin1(row.name));
        if (row.icon)
            action->setIcon(QIcon(QStringLiteral(":/shell/%1.svg").arg(QLatin1String(row.icon))));
        action->setShortcuts(row.Shortcuts());
        if (row.run)
            Connect(
                action, [this, run = row.run] { run(m_frame); }, row.shownOnly);
        m_actions.emplace(action->objectName(), action);
    }
    for (const char* name : {"actionTabs", "actionProjectTree", "actionAllDigits", "actionOneProgram"})
        Action(name)->setCheckable(true);
    Action("actionExit")->setMenuRole(QAction::QuitRole);
    Action("actionAbout")->setMenuRole(QAction::AboutRole);
}

void CFrameMenus::CreateMenus()
{
    for (int position = 0; position < MenuCount; ++position)
        m_menus.push_back(m_frame.menuBar()->addMenu(QString()));
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
    for (const MenuPosition position : {FileMenu, ViewMenu})
        connect(m_menus[position], &QMenu::aboutToShow, this, &CFrameMenus::Update);
    connect(m_menus[EditMenu], &QMenu::aboutToShow, this, &CFrameMenus::UpdateEdit);
    connect(m_menus[WindowMenu], &QMenu::aboutToShow, this, &CFrameMenus::FillWindows);
    connect(AddSubMenu("actionOpenRecent"), &QMenu::aboutToShow, this, &CFrameMenus::FillRecent);
    QMenu* bars = AddSubMenu("actionToolBars");
    connect(bars, &QMenu::aboutToShow, this, [this, bars] { FillToolBars(bars); });
}

QMenu* CFrameMenus::AddSubMenu(const char* name)
{
    auto* menu = new QMenu(&m_frame);
    Action(name)->setMenu(menu);
    return menu;
}

/// One entry of a menu of which one is checked.
void CFrameMenus::AddChoice(QMenu* menu, const QString& name, const QString& text, std::function<void()> run)
{
    auto* group = menu->findChild<QActionGroup*>();
    QAction* action = (group ? group : new QActionGroup(menu))->addAction(text);
    action->setObjectName(name);
    action->setCheckable(true);
    menu->addAction(action);
    Connect(action, std::move(run));
    m_actions.emplace(name, action);
}

void CFrameMenus::CreateUnits()
{
    QMenu* menu = AddSubMenu("actionUnits");
    for (const auto& [name, system] :
         {std::pair("actionMetric", KsUnitSystem::Metric), std::pair("actionUsCustomary", KsUnitSystem::UsCustomary)})
        AddChoice(menu, QString::fromLatin1(name), {}, [system = system] { KsUnits::Instance().SetSystem(system); });
}

void CFrameMenus::CreateLanguages()
{
    // Every language by its own name, so that it is found whatever the present one is.
    const std::map<QString, QString> names{{QStringLiteral("en_US"), QStringLiteral("English (United States)")},
                                           {QStringLiteral("en_GB"), QStringLiteral("English (United Kingdom)")},
                                           {QStringLiteral("ja"), QStringLiteral("日本語")}};
    QMenu* menu = AddSubMenu("actionLanguage");
    for (const QString& code : KsLanguage::Available())
        AddChoice(menu, QStringLiteral("actionLanguage_") + code, names.at(code),
                  [code] { KsLanguage::Instance().SetCurrent(code); });
}

void CFrameMenus::CreateAppearances()
{
    QMenu* menu = AddSubMenu("actionAppearance");
    for (const auto& [name, appearance] :
         {std::pair("actionAppearanceSystem", Appearance::System), std::pair("actionAppearanceLight", Appearance::Light),
          std::pair("actionAppearanceDark", Appearance::Dark)})
        AddChoice(menu, QString::fromLatin1(name), {}, [appearance = appearance] { ChooseAppearance(appearance); });
}

void CFrameMenus::Retranslate()
{
    for (std::size_t position = 0; position < MenuCount; ++position)
        m_menus[position]->setTitle(tr(MenuTitles[position]));
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
    Action("actionAppearanceSystem")->setText(tr("As the &Desktop"));
    Action("actionAppearanceLight")->setText(tr("&Light"));
    Action("actionAppearanceDark")->setText(tr("Dar&k"));
    m_standardBar->setWindowTitle(tr("Standard"));
    UpdateUndo();
    m_lines->Fill();
    m_clipboard->Fill();
}

void CFrameMenus::ViewChanged()
{
    m_lines->Fill();
    m_clipboard->Fill();
    m_frame.EnableMenuItem(LinesMenu, !m_menus[LinesMenu]->isEmpty()); // the view may grey it again
}

void CFrameMenus::Update()
{
    const bool document = m_frame.ActiveDocument() != nullptr, projects = !m_frame.Projects().Registry().All().empty();
    for (const char* name : {"actionSave", "actionSaveAs", "actionClose"})
        Action(name)->setEnabled(document);
    Action("actionNew")->setEnabled(!CMultiDocTemplate::All().empty());
    Action("actionCloseProject")->setEnabled(projects);
    Action("actionProjectTree")->setEnabled(projects);
    Action("actionProjectTree")->setChecked(m_frame.Projects().Tree().isVisible());
    Action("actionOpenRecent")->setEnabled(!RecentFiles::All().isEmpty());
    Action("actionOneProgram")->setChecked(QSettings().value(Settings::OneProgram, true).toBool());
    Action("actionAllDigits")->setChecked(KsUnits::Instance().AllDigits());
    const bool usCustomary = KsUnits::Instance().System() == KsUnitSystem::UsCustomary;
    Action(usCustomary ? "actionUsCustomary" : "actionMetric")->setChecked(true);
    constexpr const char* appearances[] = {"actionAppearanceSystem", "actionAppearanceLight", "actionAppearanceDark"};
    Action(appearances[std::size_t(ChosenAppearance())])->setChecked(true);
    m_actions.at(QStringLiteral("actionLanguage_") + KsLanguage::Instance().Current())->setChecked(true);
    Action("actionFindField")->setEnabled(m_frame.HasCommand(KsCommand::FindField));
    Action("actionLongProfile")->setEnabled(m_frame.HasCommand(KsCommand::LongProfile));
    Action("actionProblems")->setEnabled(m_frame.HasCommand(KsCommand::Problems));
    Action("actionNextProblem")->setEnabled(m_frame.HasCommand(KsCommand::NextProblem));
    Action("actionPreviousProblem")->setEnabled(m_frame.HasCommand(KsCommand::PreviousProblem));
}

void CFrameMenus::UpdateEdit()
{
    for (const auto& [name, command] :
         {std::pair("actionCut", KsCommand::Cut), std::pair("actionCopy", KsCommand::Copy),
          std::pair("actionPaste", KsCommand::Paste)})
        Action(name)->setEnabled(m_frame.Edit().Can(command));
}

void CFrameMenus::UpdateUndo()
{
    const QUndoGroup& history = m_frame.Edit().History();
    Action("actionUndo")->setEnabled(history.canUndo());
    Action("actionRedo")->setEnabled(history.canRedo());
    Action("actionUndo")->setText(tr("&Undo %1").arg(KsWithoutMnemonics(history.undoText())).trimmed());
    Action("actionRedo")->setText(tr("&Redo %1").arg(KsWithoutMnemonics(history.redoText())).trimmed());
}

// ---- menus filled as they open -----------------------------------------------------------------

void CFrameMenus::FillRecent()
{
    QMenu* menu = Action("actionOpenRecent")->menu();
    menu->clear();
    int number = 0;
    for (const QString& file : RecentFiles::All()) {
        QString text = KsWithoutMnemonics(KsVisibleText(QDir::toNativeSeparators(file)));
        if (++number < 10)
            text.prepend(QStringLiteral("&%1  ").arg(number));
        Connect(menu->addAction(text), [this, file] { m_frame.OpenFile(file); });
    }
    menu->addSeparator();
    connect(menu->addAction(tr("&Clear List")), &QAction::triggered, this, [this] {
        RecentFiles::Clear();
        Update();
    });
}

void CFrameMenus::FillToolBars(QMenu* menu) const
{
    menu->clear();
    menu->addAction(m_standardBar->toggleViewAction());
    for (QAction* toggle : m_frame.EditorBars().Toggles())
        menu->addAction(toggle);
}

void CFrameMenus::FillWindows()
{
    QMenu* menu = m_menus[WindowMenu];
    const auto actions = menu->actions();
    for (QAction* action : actions.mid(actions.indexOf(Action("actionCloseAll")) + 1))
        delete action;
    const auto windows = m_frame.Windows().All();
    const bool tabs = m_frame.Windows().HasTabs();
    Action("actionTabs")->setChecked(tabs);
    for (const char* name : {"actionCascade", "actionTile"})
        Action(name)->setEnabled(!tabs && !windows.isEmpty());
    for (const char* name : {"actionSideBySide", "actionNextWindow", "actionPreviousWindow", "actionCloseAll"})
        Action(name)->setEnabled(!windows.isEmpty());
    if (!windows.isEmpty())
        menu->addSeparator();
    for (CKsMDIChildWnd* window : windows) {
        QAction* action = menu->addAction(window->ListedTitle());
        action->setCheckable(true);
        action->setChecked(window == m_frame.MdiArea().currentSubWindow());
        Connect(action, [this, window = QPointer(window)] { m_frame.MdiArea().setActiveSubWindow(window); });
    }
}
