// Commands of the View, Window and Help menus.
#include "ks/units/edit_style.h"
#include "shell/main_frame.h"
#include "shell/plugins_dialog.h"
#include "shell/settings_keys.h"

#include <QAction>
#include <QCoreApplication>
#include <QDesktopServices>
#include <QFileInfo>
#include <QMessageBox>
#include <QSettings>
#include <QUrl>
#include <algorithm>

void CMainFrame::OnMetric()
{
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
}

void CMainFrame::OnUsCustomary()
{
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
}

void CMainFrame::OnAllDigits()
{
    KsUnits::Instance().SetAllDigits(Action("actionAllDigits")->isChecked());
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

/// Of the first of several windows that stand side by side.
QRect CMainFrame::FirstPlace() const
{
    const QSize area = MdiArea().viewport()->size();
    return {0, 0, area.width() * 3 / 5, area.height()};
}

void CMainFrame::OnSideBySide()
{
    ChooseTabs(false);
    PlaceSideBySide();
}

/// The active window stands at the left, the others stand one below the other beside it.
void CMainFrame::PlaceSideBySide()
{
    QMdiSubWindow* first = MdiArea().currentSubWindow();
    if (!first)
        return;
    QList<QMdiSubWindow*> windows = MdiArea().subWindowList(QMdiArea::CreationOrder);
    windows.removeOne(first);
    ShowTabs(false);
    first->showNormal();
    for (QMdiSubWindow* window : windows)
        window->showNormal();
    const QRect area(QPoint(), MdiArea().viewport()->size());
    const QRect place = windows.isEmpty() ? area : FirstPlace();
    const int width = place.width();
    first->setGeometry(place);
    for (qsizetype i = 0; i < windows.size(); ++i) {
        const int top = int(area.height() * i / windows.size()), bottom = int(area.height() * (i + 1) / windows.size());
        windows[i]->setGeometry(width, top, area.width() - width, bottom - top);
    }
    MdiArea().setActiveSubWindow(first);
}

void CMainFrame::OnProjectTree()
{
    m_projectTree->setVisible(!m_projectTree->isVisible());
}

/// What the user chose is kept; a project that stands side by side by itself is no choice of tabs or windows.
void CMainFrame::ChooseTabs(bool tabs)
{
    QSettings().setValue(Settings::Tabs, tabs);
    ShowTabs(tabs);
}

void CMainFrame::OnTabs()
{
    ChooseTabs(Action("actionTabs")->isChecked());
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
    const QString file = HelpFile();
    if (file.isEmpty())
        SendCommand(KsCommand::Help); // an editor without a help file may have something to say
    else
        QDesktopServices::openUrl(QUrl::fromLocalFile(file));
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
