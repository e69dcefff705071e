#include "shell/window_manager.h"

#include "ks/fc/frames.h"
#include "shell/settings_keys.h"

#include <QSettings>
#include <QTabBar>

CWindowManager::CWindowManager(CKsMDIFrameWnd& frame) : m_frame(frame)
{
    Area().setTabsClosable(true);
    Area().setTabsMovable(true);
    Area().setDocumentMode(true);
}

QMdiArea& CWindowManager::Area() const
{
    return m_frame.MdiArea();
}

QList<CKsMDIChildWnd*> CWindowManager::All() const
{
    QList<CKsMDIChildWnd*> all;
    const auto windows = Area().subWindowList();
    for (QMdiSubWindow* window : windows) {
        if (auto* child = qobject_cast<CKsMDIChildWnd*>(window))
            all << child;
    }
    return all;
}

CKsMDIChildWnd* CWindowManager::Of(const CView* view) const
{
    auto* window = CKsMDIChildWnd::Of(view);
    return window && !window->IsClosing() ? window : nullptr;
}

bool CWindowManager::HasTabs() const
{
    return Area().viewMode() == QMdiArea::TabbedView;
}

void CWindowManager::ShowTabs(bool tabs)
{
    Area().setViewMode(tabs ? QMdiArea::TabbedView : QMdiArea::SubWindowView);
    if (auto* bar = Area().findChild<QTabBar*>(QString(), Qt::FindDirectChildrenOnly))
        bar->setExpanding(false);
    m_frame.MdiArea().UpdateTabs();
}

void CWindowManager::ChooseTabs(bool tabs)
{
    QSettings().setValue(Settings::Tabs, tabs);
    ShowTabs(tabs);
}

bool CWindowManager::ChoseTabs()
{
    return QSettings().value(Settings::Tabs, false).toBool();
}

QRect CWindowManager::FirstPlace() const
{
    const QSize area = Area().viewport()->size();
    return {0, 0, area.width() * 3 / 5, area.height()};
}

void CWindowManager::PlaceNewWindowsFirst(bool first)
{
    m_frame.PlaceNewWindows(first ? FirstPlace() : QRect());
}

void CWindowManager::PlaceSideBySide()
{
    QMdiSubWindow* first = Area().currentSubWindow();
    if (!first)
        return;
    QList<QMdiSubWindow*> windows = Area().subWindowList(QMdiArea::CreationOrder);
    windows.removeOne(first);
    ShowTabs(false);
    first->showNormal();
    for (QMdiSubWindow* window : windows)
        window->showNormal();
    const QRect area(QPoint(), Area().viewport()->size());
    QRect place = windows.isEmpty() ? area : FirstPlace();
    first->setGeometry(place);
    place.setLeft(place.right() + 1);
    place.setRight(area.right());
    const auto count = int(windows.size());
    for (int i = 0; i < count; ++i) {
        place.setTop(area.height() * i / count);
        place.setBottom(area.height() * (i + 1) / count - 1);
        windows[i]->setGeometry(place);
    }
    Area().setActiveSubWindow(first);
}
