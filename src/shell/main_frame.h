// The main frame of the shell.
#pragma once

#include "ks/fc/frames.h"
#include "shell/editor_bars.h"
#include "shell/plugin_loader.h"
#include "shell/project_tree.h"
#include "shell/projects.h"
#include "shell/recent_files.h"

#include <QUndoGroup>
#include <functional>
#include <map>
#include <memory>
#include <vector>

class QActionGroup;
class QLabel;
struct CFrameAction;

/// Document windows, menus, tool bars, projects. Actions are children of the frame, reachable by object name
/// ("actionSave"); their table is in main_frame_menus.cpp.
class CMainFrame : public CKsMDIFrameWnd
{
    Q_OBJECT
public:
    CMainFrame();
    ~CMainFrame() override;

    /// Loads the editors of a folder; one that cannot be used is named in the status bar and in Help > Plug-ins.
    void LoadPlugins(const QString& folder);
    const std::vector<std::unique_ptr<CPlugin>>& Plugins() const { return m_plugins; }
    const CProjects& Projects() const { return m_projects; }
    CRecentFiles& RecentFiles() { return m_recent; }

    /// Opens a document or a project; false when the user has been told why not. `othersLater`: the first file of a
    /// project is there at once, the others when it has been painted.
    bool OpenFile(const QString& path, bool othersLater = false);
    /// A new document of a template. Null when its editor could not make one.
    CKsDoc* NewDocument(CMultiDocTemplate& documents);
    /// Opens a project file with all its members; false when the user has been told why not.
    bool OpenProject(const QString& path, bool othersLater = false);
    /// Closes the project's windows; all questions come first. False, and everything as it was, when one was kept.
    bool CloseProject(CProjectHandle handle);

    CKsDoc* ActiveDocument() const;
    LRESULT WindowProc(unsigned message, WPARAM wParam, LPARAM lParam) override;
    QMenu* createPopupMenu() override;

protected:
    void ActiveViewChanged(CView* view) override;
    void changeEvent(QEvent* event) override;
    void closeEvent(QCloseEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dropEvent(QDropEvent* event) override;

private:
    friend struct CFrameAction;

    // Commands of the menus.
    void OnFileNew();
    void OnFileOpen();
    void OnFileOpenProject();
    void OnFileCloseProject();
    void OnFileSave();
    void OnFileSaveAs();
    void OnFileClose();
    void OnFileExit();
    void OnUndo();
    void OnRedo();
    void OnCut();
    void OnCopy();
    void OnPaste();
    void OnMetric();
    void OnUsCustomary();
    void OnAllDigits();
    void OnCascade();
    void OnTile();
    void OnSideBySide();
    void OnNextWindow();
    void OnPreviousWindow();
    void OnProjectTree();
    void OnTabs();
    void OnCloseAll();
    void OnContents();
    void OnPlugins();
    void OnAbout();

    // Menus and texts.
    void CreateActions();
    void Connect(QAction* action, std::function<void()> run, bool whileTyping = false);
    void CreateMenus();
    void CreateLanguageMenu(QMenu* menu);
    void Retranslate();
    void FillRecentMenu();
    void FillLinesMenu();
    void UpdateLinesMenu(bool open);
    void FillToolBarMenu(QMenu* menu);
    void FillWindowMenu();
    void UpdateActions();
    void UpdateUndoTexts();
    void UpdateTitle();
    void UpdatePluginLabel();
    QAction* Action(const char* name) const;
    void ShowTabs(bool tabs);
    void ChooseTabs(bool tabs);
    QRect FirstPlace() const;
    void PlaceSideBySide();
    void ReadSettings();
    void WriteSettings() const;
    QString HelpFile() const;

    // Documents and projects.
    std::vector<CMultiDocTemplate*> Templates() const;
    CMultiDocTemplate* TemplateFor(const QString& path) const;
    void AddTemplate(CMultiDocTemplate* documents);
    QString AskOpen(const QString& title, const QString& filters);
    void DocumentShown(const CKsDoc* document);
    void SetWindowIcons();
    void UpdateProjectTree();
    void ShowMember(CProjectHandle handle, const QString& stored);
    CMemberState StateOf(const CProject& project, const QString& stored) const;
    const CProject* OwnerOf(const QString& member) const;
    void TellOfSharedMembers(const CProject& project) const;
    void Announce(WPARAM what, const CProject& project);
    QStringList OpenMembers(const CProject& project, const QStringList& members);
    QStringList OpenMemberWithReasons(const CProject& project, const QString& member);
    void OpenOtherMembers(CProjectHandle handle, QStringList missing);
    bool OpenMember(const CProject& project, const QString& member, bool show);

    // Edit commands go to what has the focus.
    void RouteEdit(int command, QKeySequence::StandardKey key);
    bool CanEdit(int command) const;
    void UpdateEditMenu();

    std::vector<std::unique_ptr<CPlugin>> m_plugins;
    CProjects m_projects;
    CRecentFiles m_recent;
    CEditorBars m_bars;
    QUndoGroup m_undo;

    std::map<QString, QAction*> m_actions;
    std::vector<QMenu*> m_menus; // by position
    QMenu* m_recentMenu = nullptr;
    QMenu* m_unitsMenu = nullptr;
    QMenu* m_languageMenu = nullptr;
    QMenu* m_toolBarMenu = nullptr;
    QToolBar* m_standardBar = nullptr;
    CProjectTree* m_projectTree = nullptr;
    QLabel* m_pluginLabel = nullptr;
    QLabel* m_projectLabel = nullptr;
};
