#include "shell/window_manager.h"

#include "ks/fc/frames.h"
#include "shell/settings_keys.h"

#include <QEvent>
#include <QMdiSubWindow>
#include <QSettings>
#include <QTabBar>
#include <algorithm>

static constexpr int NeededDigits = 105;  // the tabs of the pages, and the widest page
static constexpr int WantedLetters = 155; // beside each other: the tabs of the pages, a table, and a table beside it

CWindowManager::CWindowManager(CKsMDIFrameWnd& frame) : m_frame(frame)
{
    Area().setTabsClosable(true);
    Area().setTabsMovable(true);
    Area().setDocumentMode(true);
    Area().viewport()->installEventFilter(this);
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

/// Three fifths of the width, or as much more as pages with two tables beside each other need. In a small area the
/// other windows get what is left when a page need not scroll sideways.
QRect CWindowManager::FirstPlace() const
{
    const QSize area = Area().viewport()->size();
    const int wanted = std::min(WantedLetters * m_frame.fontMetrics().averageCharWidth(), area.width() * 2 / 3);
    const int needed = std::min(NeededDigits * m_frame.fontMetrics().horizontalAdvance(u'0'), area.width() * 3 / 4);
    return {0, 0, std::max({area.width() * 3 / 5, wanted, needed}), area.height()};
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
    windows.prepend(first);
    ShowTabs(false);
    for (QMdiSubWindow* window : windows)
        window->showNormal();
    Place(windows);
    Area().setActiveSubWindow(first);
}

void CWindowManager::Place(const QList<QMdiSubWindow*>& windows)
{
    const QRect area(QPoint(), Area().viewport()->size());
    const auto others = int(windows.size()) - 1;
    QRect place = others == 0 ? area : FirstPlace();
    m_placed = {{windows.front(), place}};
    for (int i = 0; i < others; ++i) {
        QRect beside(QPoint(place.right() + 1, area.height() * i / others), area.bottomRight());
        beside.setBottom(area.height() * (i + 1) / others - 1);
        m_placed.append({windows[i + 1], beside});
    }
    for (const Placed& each : m_placed)
        each.window->setGeometry(each.place);
}

/// Windows that stand side by side as they were put follow the size of the area; once the user has moved, closed or
/// added one they stay where they are.
bool CWindowManager::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() != QEvent::Resize || m_placed.isEmpty())
        return QObject::eventFilter(object, event);
    QList<QMdiSubWindow*> windows;
    for (const Placed& each : m_placed)
        if (each.window && !each.window->isMaximized() && !each.window->isMinimized() &&
            each.window->geometry() == each.place)
            windows << each.window;
    if (HasTabs() || windows.size() != m_placed.size() || windows.size() != Area().subWindowList().size())
        m_placed.clear();
    else
        Place(windows);
    return QObject::eventFilter(object, event);
}
