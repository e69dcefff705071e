// The commands of the File menu.
#pragma once

#include <QCoreApplication>
#include <QString>

class CKsMDIFrameWnd;
class CPlugins;
class CProjectController;

/// Makes, opens, saves and closes documents; asks for what a command needs to know.
class CFileCommands
{
    Q_DECLARE_TR_FUNCTIONS(CFileCommands)
public:
    CFileCommands(CKsMDIFrameWnd& frame, const CPlugins& plugins, CProjectController& projects);

    /// Opens a document or a project; false when the user has been told why not. `othersLater`: see
    /// CProjectController::Open.
    bool Open(const QString& path, bool othersLater = false);
    /// Opens several; what could not be opened is told together.
    void OpenAll(const QStringList& paths);
    /// Whether a file may be one that can be opened, by its name.
    bool Knows(const QString& path) const;

    void New();
    void AskToOpen();
    void AskToOpenProject();
    void Save();
    void SaveAs();
    void CloseWindow();

private:
    QString AskName(const QString& title, const QString& filters) const;

    CKsMDIFrameWnd& m_frame;
    const CPlugins& m_plugins;
    CProjectController& m_projects;
};
