#include "editors/network/map_input.h"

#include "editors/network/map_overlay.h"
#include "editors/network/network_map.h"
#include "ks/fc/shown_text.h"

#include <QApplication>
#include <QContextMenuEvent>
#include <QHelpEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QToolTip>
#include <QWheelEvent>
#include <cmath>

namespace {

constexpr int PanStep = 60, PanPage = 400; // pixels of the user

/// What a key does, whatever the modifiers.
struct MapKey
{
    int key;
    void (*run)(CNetworkMap& map);
};

// clang-format off
constexpr MapKey Keys[] = {
    {Qt::Key_Left, [](CNetworkMap& map) { map.Pan({PanStep, 0}); }},
    {Qt::Key_Right, [](CNetworkMap& map) { map.Pan({-PanStep, 0}); }},
    {Qt::Key_Up, [](CNetworkMap& map) { map.Pan({0, PanStep}); }},
    {Qt::Key_Down, [](CNetworkMap& map) { map.Pan({0, -PanStep}); }},
    {Qt::Key_PageUp, [](CNetworkMap& map) { map.Pan({0, PanPage}); }},
    {Qt::Key_PageDown, [](CNetworkMap& map) { map.Pan({0, -PanPage}); }},
    {Qt::Key_Plus, [](CNetworkMap& map) { map.Zoom(CNetworkMap::ZoomStep); }},
    {Qt::Key_Equal, [](CNetworkMap& map) { map.Zoom(CNetworkMap::ZoomStep); }}, // plus without Shift
    {Qt::Key_Minus, [](CNetworkMap& map) { map.Zoom(1 / CNetworkMap::ZoomStep); }},
    {Qt::Key_Home, [](CNetworkMap& map) { map.FitAll(); }},
    {Qt::Key_Space, [](CNetworkMap& map) { map.PickMiddle(); }},
    {Qt::Key_N, [](CNetworkMap& map) { map.StepLocation(1); }},
    {Qt::Key_P, [](CNetworkMap& map) { map.StepLocation(-1); }},
    {Qt::Key_Escape, [](CNetworkMap& map) { map.Unmark(); }},
    {Qt::Key_Delete, [](CNetworkMap& map) { emit map.DeleteRequested(); }},
};
// clang-format on

QString TipOf(const CMapLocation& location)
{
    return LocationKindName(location.kind) + u'\n' + PlaceText(location) + u'\n' +
           KsVisibleText(location.file.section(u'/', -1));
}

} // namespace

CMapInput::CMapInput(CNetworkMap& map) : QObject(&map), m_map(map)
{
    map.installEventFilter(this);
}

bool CMapInput::eventFilter(QObject*, QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
        return Key(*static_cast<QKeyEvent*>(event));
    case QEvent::MouseButtonPress:
    case QEvent::MouseMove:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
        Mouse(*static_cast<QMouseEvent*>(event));
        return true;
    case QEvent::Wheel: {
        constexpr double notch = 120; // as QWheelEvent counts
        const auto* wheel = static_cast<QWheelEvent*>(event);
        if (wheel->angleDelta().y() != 0)
            m_map.ZoomAt(wheel->position(), std::pow(CNetworkMap::ZoomStep, wheel->angleDelta().y() / notch));
        event->accept();
        return true;
    }
    case QEvent::ContextMenu: {
        const auto* menu = static_cast<QContextMenuEvent*>(event);
        OpenMenu(menu->reason() == QContextMenuEvent::Mouse ? std::optional(menu->pos()) : std::nullopt);
        return true;
    }
    case QEvent::ToolTip: {
        const auto* help = static_cast<QHelpEvent*>(event);
        const auto location = m_map.LocationAt(help->pos());
        QToolTip::showText(help->globalPos(), location ? TipOf(m_map.Marks().Locations()[*location]) : QString(),
                           &m_map);
        return true;
    }
    default:
        return false;
    }
}

bool CMapInput::Key(const QKeyEvent& event)
{
    constexpr auto commands = Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier;
    for (const MapKey& key : Keys) {
        if (key.key == event.key() && !(event.modifiers() & commands)) {
            key.run(m_map);
            return true;
        }
    }
    return false;
}

/// For what is at a position of the window, or, without one, for what is marked.
void CMapInput::OpenMenu(const std::optional<QPoint>& at)
{
    if (at)
        m_map.PickAt(*at);
    const auto picked = m_map.Marks().Picked();
    const auto marked = picked ? m_map.WindowPoint(*picked) : std::nullopt;
    emit m_map.MenuRequested(m_map.mapToGlobal(at ? *at : marked ? marked->toPoint() : m_map.rect().center()));
}

void CMapInput::Mouse(const QMouseEvent& event)
{
    const QPoint at = event.position().toPoint();
    const bool left = event.button() == Qt::LeftButton;
    if (event.type() == QEvent::MouseButtonDblClick && left) {
        m_map.ZoomAt(event.position(), CNetworkMap::ZoomStep * CNetworkMap::ZoomStep);
    } else if (event.type() == QEvent::MouseButtonPress && (left || event.button() == Qt::MiddleButton)) {
        m_pressed = at;
        m_dragged.reset();
    } else if (event.type() == QEvent::MouseMove && m_pressed) {
        if (!m_dragged && (at - *m_pressed).manhattanLength() >= QApplication::startDragDistance()) {
            m_dragged = m_pressed;
            m_map.setCursor(Qt::ClosedHandCursor);
        }
        if (m_dragged)
            m_map.Pan(at - *std::exchange(m_dragged, at));
    } else if (event.type() == QEvent::MouseButtonRelease && std::exchange(m_pressed, std::nullopt)) {
        m_map.unsetCursor();
        if (!std::exchange(m_dragged, std::nullopt) && left)
            m_map.PickAt(event.position());
    }
}
