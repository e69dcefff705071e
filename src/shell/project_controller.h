// Opening and closing projects, and what their tree shows.
#pragma once

#include "ks/fc/file_watch.h"
#include "shell/project_tree.h"
#include "shell/projects.h"

#include <QObject>
#include <map>

class CKsMDIChildWnd;
class CKsMDIFrameWnd;
class CPlugins;
class CWindowManager;

/// Opens the files of projects in the frame's windows, closes them together, and keeps the tree of their files.
class CProjectController : public QObject
{
    Q_OBJECT
public:
    /// All of them outlive the controller; the tree is the frame's.
    CProjectController(CKsMDIFrameWnd& frame, CWindowManager& windows, const CPlugins& plugins);

    /// Which projects are open, and who belongs to them.
    CProjects& Registry() { return m_projects; }
    const CProjects& Registry() const { return m_projects; }
    CProjectTree& Tree() const { return *m_tree; }

    /// Opens a project file with all its members; false when the user has been told why not. `othersLater`: the first
    /// file is there at once, the others when it has been painted.
    bool Open(const QString& path, bool othersLater = false);
    /// Closes the project's windows, see CKsMDIFrameWnd::CloseWindows; false when it stays open.
    bool Close(CProjectHandle handle);
    /// The project of the active view, otherwise the one opened last.
    void CloseActive();
    /// Shows the files as they are now.
    void UpdateTree();

signals:
    /// A project has been opened, with its files, or closed.
    void Changed();

private:
    void ShowMember(CProjectHandle handle, const QString& stored);
    CMemberState StateOf(const CProject& project, const QString& stored) const;
    const CProject* OwnerOf(const QString& member) const;
    CKsMDIChildWnd* WindowOf(const QString& member) const;
    void TellOfSharedMembers(const CProject& project) const;
    void Watch(CProjectHandle handle);
    void FileChanged(CProjectHandle handle);
    void Announce(WPARAM what, const CProject& project) const;
    QStringList OpenMembers(const CProject& project, const QStringList& members);
    QStringList OpenMemberWithReasons(const CProject& project, const QString& member);
    void OpenOtherMembers(CProjectHandle handle, QStringList missing);
    bool OpenMember(const CProject& project, const QString& member, bool show);

    CKsMDIFrameWnd& m_frame;
    CWindowManager& m_windows;
    const CPlugins& m_plugins;
    CProjects m_projects;
    CProjectTree* m_tree; // the frame's
    struct Watched
    {
        std::unique_ptr<CKsFileWatch> watch;
        bool isAmiss = false; // the user has been told that the file is gone or cannot be read
    };
    std::map<CProjectHandle, Watched> m_watches; // of the files of projects
};
