// The menus of the main frame and its standard tool bar.
#pragma once

#include <QObject>
#include <QPointer>
#include <functional>
#include <map>
#include <vector>

class CMainFrame;
class CViewMenu;
class QAction;
class QActionGroup;
class QMenu;
class QToolBar;

/// Makes the menus and keeps them true. Actions are children of the frame, reachable by object name ("actionSave");
/// their table is in frame_actions.cpp.
class CFrameMenus : public QObject
{
    Q_OBJECT
public:
    /// The frame's other parts are there already.
    explicit CFrameMenus(CMainFrame& frame);

    void Retranslate();
    /// What can be done, and what is checked, follows the frame.
    void Update();
    /// The third menu belongs to the editor of the active view.
    void ViewChanged();
    void FillToolBars(QMenu* menu) const;

private:
    QAction* Action(const char* name) const;
    void Connect(QAction* action, std::function<void()> run, bool whileTyping = false);
    void CreateActions();
    void CreateMenus();
    QMenu* AddSubMenu(const char* name);
    void AddChoice(QMenu* menu, const QString& name, const QString& text, std::function<void()> run);
    void CreateUnits();
    void CreateLanguages();
    void CreateAppearances();
    void FillRecent();
    void FillWindows();
    void UpdateEdit();
    void UpdateUndo();

    CMainFrame& m_frame;
    std::map<QString, QAction*> m_actions;
    std::vector<QMenu*> m_menus; // by position
    QToolBar* m_standardBar;
    CViewMenu *m_lines = nullptr, *m_clipboard = nullptr; // what these menus have from the view; children
};
