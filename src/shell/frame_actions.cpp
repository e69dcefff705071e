#include "shell/frame_actions.h"

#include "ks/units/edit_style.h"
#include "shell/help_commands.h"
#include "shell/main_frame.h"
#include "shell/settings_keys.h"

#include <QSettings>

static constexpr bool ShownOnly = true;

std::span<const CFrameAction> CFrameAction::Table()
{
    using F = CMainFrame;
    using K = QKeySequence;
    // clang-format off
    static const CFrameAction table[] = {
        {FileMenu, "actionNew", QT_TR_NOOP("&New"), QT_TR_NOOP("Starts a new document"), [](F& f) { f.Files().New(); }, K::New, "new"},
        {FileMenu, "actionOpen", QT_TR_NOOP("&Open..."), QT_TR_NOOP("Opens a document or a project"), [](F& f) { f.Files().AskToOpen(); }, K::Open, "open"},
        {FileMenu, "actionOpenProject", QT_TR_NOOP("Open &Project..."), QT_TR_NOOP("Opens a project with all its files"), [](F& f) { f.Files().AskToOpenProject(); }},
        {FileMenu, "actionOpenRecent", QT_TR_NOOP("Open &Recent"), QT_TR_NOOP("Opens one of the files used last")},
        {FileMenu, "actionOneProgram", QT_TR_NOOP("Open in the Runnin&g Program"), QT_TR_NOOP("A further start of the program hands its files to the one that runs"), [](F&) { QSettings().setValue(Settings::OneProgram, !QSettings().value(Settings::OneProgram, true).toBool()); }},
        {FileMenu},
        {FileMenu, "actionSave", QT_TR_NOOP("&Save"), QT_TR_NOOP("Saves the active document"), [](F& f) { f.Files().Save(); }, K::Save, "save"},
        {FileMenu, "actionSaveAs", QT_TR_NOOP("Save &As..."), QT_TR_NOOP("Saves the active document under a new name"), [](F& f) { f.Files().SaveAs(); }, K::SaveAs},
        {FileMenu, "actionClose", QT_TR_NOOP("&Close"), QT_TR_NOOP("Closes the active window"), [](F& f) { f.Files().CloseWindow(); }, K::Close},
        {FileMenu, "actionCloseProject", QT_TR_NOOP("Close Projec&t"), QT_TR_NOOP("Closes the project with all its files"), [](F& f) { f.Projects().CloseActive(); }},
        {FileMenu},
        {FileMenu, "actionExit", QT_TR_NOOP("E&xit"), QT_TR_NOOP("Closes all documents and ends the program"), [](F& f) { f.close(); }, K::Quit},
        {EditMenu, "actionUndo", QT_TR_NOOP("&Undo"), QT_TR_NOOP("Takes the last change back"), [](F& f) { f.Edit().History().undo(); }, K::Undo, "undo"},
        {EditMenu, "actionRedo", QT_TR_NOOP("&Redo"), QT_TR_NOOP("Makes the change again that was taken back"), [](F& f) { f.Edit().History().redo(); }, K::Redo, "redo"},
        {EditMenu},
        {EditMenu, "actionCut", QT_TR_NOOP("Cu&t"), QT_TR_NOOP("Moves the selection to the clipboard"), [](F& f) { f.Edit().Run(KsCommand::Cut); }, K::Cut, nullptr, ShownOnly},
        {EditMenu, "actionCopy", QT_TR_NOOP("&Copy"), QT_TR_NOOP("Copies the selection to the clipboard"), [](F& f) { f.Edit().Run(KsCommand::Copy); }, K::Copy, nullptr, ShownOnly},
        {EditMenu, "actionPaste", QT_TR_NOOP("&Paste"), QT_TR_NOOP("Puts in what is on the clipboard"), [](F& f) { f.Edit().Run(KsCommand::Paste); }, K::Paste, nullptr, ShownOnly},
        {EditMenu},
        {EditMenu, "actionFindField", QT_TR_NOOP("&Go to Field..."), QT_TR_NOOP("Leads to a field or a page by its name or its keyword"), [](F& f) { f.SendToNearest(KsCommand::FindField); }, K::UnknownKey, nullptr, false, "Ctrl+K"},
        {ViewMenu, "actionUnits", QT_TR_NOOP("&Units"), QT_TR_NOOP("Units in which values are shown; files are not affected")},
        {ViewMenu, "actionAllDigits", QT_TR_NOOP("All &Digits"), QT_TR_NOOP("Shows every digit of the numbers in tables and fields"), [](F&) { KsUnits::Instance().SetAllDigits(!KsUnits::Instance().AllDigits()); }},
        {ViewMenu, "actionLanguage", QT_TR_NOOP("&Language"), QT_TR_NOOP("Language of the program")},
        {ViewMenu, "actionAppearance", QT_TR_NOOP("&Appearance"), QT_TR_NOOP("Light or dark windows")},
        {ViewMenu, "actionToolBars", QT_TR_NOOP("&Tool Bars"), QT_TR_NOOP("Shows or hides tool bars")},
        {ViewMenu, "actionLongProfile", QT_TR_NOOP("Long Pro&file"), QT_TR_NOOP("Shows or hides levels and values along the branch"), [](F& f) { f.SendToNearest(KsCommand::LongProfile); }, K::UnknownKey, nullptr, false, "F9"},
        {ViewMenu, "actionProblems", QT_TR_NOOP("P&roblems"), QT_TR_NOOP("Shows or hides the list of what is wrong in the open documents"), [](F& f) { f.SendToNearest(KsCommand::Problems); }, K::UnknownKey, nullptr, false, "Shift+F8"},
        {ViewMenu, "actionNextProblem", QT_TR_NOOP("&Next Problem"), QT_TR_NOOP("Leads to the next problem of the list"), [](F& f) { f.SendToNearest(KsCommand::NextProblem); }, K::UnknownKey, nullptr, false, "F8"},
        {ViewMenu, "actionPreviousProblem", QT_TR_NOOP("Pre&vious Problem"), QT_TR_NOOP("Leads to the previous problem of the list"), [](F& f) { f.SendToNearest(KsCommand::PreviousProblem); }, K::UnknownKey, nullptr, false, "Ctrl+F8"},
        {ViewMenu, "actionProjectTree", QT_TR_NOOP("&Project"), QT_TR_NOOP("Shows or hides the files of the project"), [](F& f) { f.Projects().Tree().setVisible(!f.Projects().Tree().isVisible()); }},
        {WindowMenu, "actionCascade", QT_TR_NOOP("&Cascade"), QT_TR_NOOP("Arranges the windows one behind the other"), [](F& f) { f.MdiArea().cascadeSubWindows(); }},
        {WindowMenu, "actionTile", QT_TR_NOOP("&Tile"), QT_TR_NOOP("Arranges the windows side by side"), [](F& f) { f.MdiArea().tileSubWindows(); }},
        {WindowMenu, "actionSideBySide", QT_TR_NOOP("&Side by Side"), QT_TR_NOOP("Puts the other windows beside the active one"), [](F& f) { f.Windows().ChooseTabs(false); f.Windows().PlaceSideBySide(); }},
        {WindowMenu, "actionNextWindow", QT_TR_NOOP("Ne&xt"), QT_TR_NOOP("Goes to the next window"), [](F& f) { f.MdiArea().activateNextSubWindow(); }, K::NextChild},
        {WindowMenu, "actionPreviousWindow", QT_TR_NOOP("Pre&vious"), QT_TR_NOOP("Goes to the previous window"), [](F& f) { f.MdiArea().activatePreviousSubWindow(); }, K::PreviousChild},
        {WindowMenu, "actionTabs", QT_TR_NOOP("Ta&bs"), QT_TR_NOOP("Shows the windows as tabs"), [](F& f) { f.Windows().ChooseTabs(!f.Windows().HasTabs()); }},
        {WindowMenu},
        {WindowMenu, "actionCloseAll", QT_TR_NOOP("Close &All"), QT_TR_NOOP("Closes all windows"), [](F& f) { f.CloseAllWindows(); }},
        {HelpMenu, "actionContents", QT_TR_NOOP("&Contents"), QT_TR_NOOP("Shows the help of the editor"), [](F& f) { ShowHelp(f); }, K::HelpContents},
        {HelpMenu, "actionPlugins", QT_TR_NOOP("&Plug-ins..."), QT_TR_NOOP("Lists the editors that were loaded"), [](F& f) { ShowPlugins(f); }},
        {HelpMenu, "actionAbout", QT_TR_NOOP("&About"), QT_TR_NOOP("Name and version of the program"), [](F& f) { ShowAbout(&f); }},
    };
    // clang-format on
    return table;
}

/// Redo has both of its usual keys, whichever of them the desktop knows: the grids and the documentation name Ctrl+Y.
QList<QKeySequence> CFrameAction::Shortcuts() const
{
    if (ownKey)
        return {QKeySequence(QString::fromLatin1(ownKey))};
    if (key == QKeySequence::UnknownKey || shownOnly)
        return {};
    if (key == QKeySequence::Close)
        return {QKeySequence(Qt::CTRL | Qt::Key_W), QKeySequence(Qt::CTRL | Qt::Key_F4)};
    auto keys = QKeySequence::keyBindings(key);
    if (key == QKeySequence::PreviousChild)
        keys.prepend(QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_Tab));
    if (key == QKeySequence::Redo) {
        const QList<QKeySequence> both{Qt::CTRL | Qt::Key_Y, Qt::CTRL | Qt::SHIFT | Qt::Key_Z};
        keys.removeIf([&both](const QKeySequence& each) { return both.contains(each); });
        keys = both + keys;
    }
    return keys;
}
