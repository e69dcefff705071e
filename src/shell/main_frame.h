// The main frame of the shell.
#pragma once

#include "ks/fc/frames.h"
#include "shell/edit_router.h"
#include "shell/editor_bars.h"
#include "shell/file_commands.h"
#include "shell/frame_menus.h"
#include "shell/plugin_loader.h"
#include "shell/project_controller.h"
#include "shell/recovery.h"
#include "shell/recovery_folder.h"
#include "shell/snapshots.h"
#include "shell/window_manager.h"

class QLabel;

/// The frame that holds the shell's parts together: it hands its events, and the messages of editors, to the part that
/// they are for, and shows what all of them come to in its title and status bar.
class CMainFrame : public CKsMDIFrameWnd
{
    Q_OBJECT
public:
    CMainFrame();
    ~CMainFrame() override;

    /// Loads the editors of a folder; one that cannot be used is named in the status bar and in Help > Plug-ins.
    void LoadPlugins(const QString& folder);
    /// See CFileCommands::Open.
    bool OpenFile(const QString& path, bool othersLater = false) { return m_files.Open(path, othersLater); }

    void OpenFiles(const QStringList& paths) { m_files.OpenAll(paths); }

    /// Those of another start of the program, which come to the front (CHandover). False while a question is open.
    bool TakeFiles(const QStringList& files, const QString& token);

    /// Offers the changes that earlier sessions left over, once at the start.
    void OfferRecovery() { m_recovery.Offer(); }

    const CPlugins& Plugins() const { return m_plugins; }
    CWindowManager& Windows() { return m_windows; }
    CProjectController& Projects() { return m_projects; }
    CFileCommands& Files() { return m_files; }
    CEditRouter& Edit() { return m_edit; }
    const CEditorBars& EditorBars() const { return m_bars; }
    CSnapshots& Snapshots() { return m_snapshots; }
    CRecovery& Recovery() { return m_recovery; }

    LRESULT WindowProc(unsigned message, WPARAM wParam, LPARAM lParam) override;
    QMenu* createPopupMenu() override;
    std::vector<KsHelpChapter> HelpChapters() const override;

protected:
    void ActiveViewChanged(CView* view) override;
    void changeEvent(QEvent* event) override;
    void closeEvent(QCloseEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dropEvent(QDropEvent* event) override;

private:
    void Follow(const CMultiDocTemplate& documents);
    void DocumentShown(const CKsDoc* document);
    void DocumentRenamed(const QString& oldPath, const QString& newPath);
    void UpdateRecoveryLabel();
    void Retranslate();
    void Update();
    void UpdateTitle();
    void ShowModified();
    void UpdatePluginLabel();
    void ReadSettings();
    void WriteSettings() const;

    // In the order in which they need each other.
    CPlugins m_plugins;
    CWindowManager m_windows;
    CProjectController m_projects;
    CFileCommands m_files;
    CEditRouter m_edit;
    CEditorBars m_bars;
    CFrameMenus m_menus;
    CRecoveryFolder m_recoveryFolder;
    CSnapshots m_snapshots;
    CRecovery m_recovery;
    QLabel *m_recoveryLabel, *m_pluginLabel, *m_projectLabel;
};
