// Commands of the View, Window and Help menus.
#include "ks/units/edit_style.h"
#include "shell/main_frame.h"
#include "shell/plugins_dialog.h"

#include <QAction>
#include <QCoreApplication>
#include <QDesktopServices>
#include <QFileInfo>
#include <QMessageBox>
#include <QUrl>

void CMainFrame::OnMetric()
{
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
}

void CMainFrame::OnUsCustomary()
{
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
}

void CMainFrame::OnCascade()
{
    MdiArea().cascadeSubWindows();
}

void CMainFrame::OnTile()
{
    MdiArea().tileSubWindows();
}

void CMainFrame::OnNextWindow()
{
    MdiArea().activateNextSubWindow();
}

void CMainFrame::OnPreviousWindow()
{
    MdiArea().activatePreviousSubWindow();
}

void CMainFrame::OnProjectTree()
{
    m_projectTree->setVisible(!m_projectTree->isVisible());
}

void CMainFrame::OnTabs()
{
    ShowTabs(Action("actionTabs")->isChecked());
}

void CMainFrame::OnCloseAll()
{
    CloseAllWindows();
}

/// The help file of the active view's editor, or of the first one; empty when it is not installed.
QString CMainFrame::HelpFile() const
{
    const auto templates = Templates();
    const CMultiDocTemplate* documents = ActiveDocument()    ? ActiveDocument()->GetDocTemplate()
                                         : templates.empty() ? nullptr
                                                             : templates.front();
    const QString name = documents ? documents->GetDocString(CMultiDocTemplate::windowTitle) : QString();
    const QFileInfo file(QCoreApplication::applicationDirPath(), name);
    return !name.isEmpty() && file.isFile() ? file.absoluteFilePath() : QString();
}

void CMainFrame::OnContents()
{
    QDesktopServices::openUrl(QUrl::fromLocalFile(HelpFile()));
}

void CMainFrame::OnPlugins()
{
    CPluginsDialog(m_plugins, this).exec();
}

void CMainFrame::OnAbout()
{
    QMessageBox about(QMessageBox::NoIcon, tr("About %1").arg(QCoreApplication::applicationName()),
                      tr("%1, version %2\n\nShell of the river model editors.")
                          .arg(QCoreApplication::applicationName(), QCoreApplication::applicationVersion()),
                      QMessageBox::Ok, this);
    about.exec();
}
