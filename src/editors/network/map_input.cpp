// The map's keys and mouse.
#include "editors/network/network_map.h"

#include <QApplication>
#include <QContextMenuEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QWheelEvent>
#include <cmath>

namespace {
constexpr int PanStep = 60, PanPage = 400; // pixels of the user
constexpr double ZoomStep = 1.4;
} // namespace

/// What a key does, whatever the modifiers.
struct CNetworkMap::Key
{
    int key;
    void (*run)(CNetworkMap& map);
};

const std::vector<CNetworkMap::Key>& CNetworkMap::Keys()
{
    static const std::vector<Key> keys{
        {Qt::Key_Left,
         [](CNetworkMap& map) {
             map.Pan({PanStep, 0});
         }},
        {Qt::Key_Right,
         [](CNetworkMap& map) {
             map.Pan({-PanStep, 0});
         }},
        {Qt::Key_Up,
         [](CNetworkMap& map) {
             map.Pan({0, PanStep});
         }},
        {Qt::Key_Down,
         [](CNetworkMap& map) {
             map.Pan({0, -PanStep});
         }},
        {Qt::Key_PageUp,
         [](CNetworkMap& map) {
             map.Pan({0, PanPage});
         }},
        {Qt::Key_PageDown,
         [](CNetworkMap& map) {
             map.Pan({0, -PanPage});
         }},
        {Qt::Key_Plus, [](CNetworkMap& map) { map.Zoom(ZoomStep); }},
        {Qt::Key_Equal, [](CNetworkMap& map) { map.Zoom(ZoomStep); }}, // plus without Shift
        {Qt::Key_Minus, [](CNetworkMap& map) { map.Zoom(1 / ZoomStep); }},
        {Qt::Key_Home, [](CNetworkMap& map) { map.FitAll(); }},
        {Qt::Key_Space, [](CNetworkMap& map) { map.PickMiddle(); }},
        {Qt::Key_N, [](CNetworkMap& map) { map.StepLocation(1); }},
        {Qt::Key_P, [](CNetworkMap& map) { map.StepLocation(-1); }},
        {Qt::Key_Escape, [](CNetworkMap& map) { map.Unmark(); }},
        {Qt::Key_Delete, [](CNetworkMap& map) { emit map.DeleteRequested(); }},
    };
    return keys;
}

void CNetworkMap::keyPressEvent(QKeyEvent* event)
{
    constexpr auto commands = Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier;
    for (const Key& key : Keys()) {
        if (key.key == event->key() && !(event->modifiers() & commands)) {
            key.run(*this);
            return;
        }
    }
    QWidget::keyPressEvent(event);
}

void CNetworkMap::mousePressEvent(QMouseEvent* event)
{
    if (event->button() != Qt::LeftButton && event->button() != Qt::MiddleButton)
        return;
    m_pressed = m_dragged = event->position().toPoint();
    m_pressing = true;
    m_dragging = false;
}

void CNetworkMap::mouseMoveEvent(QMouseEvent* event)
{
    const QPoint at = event->position().toPoint();
    if (m_pressing && !m_dragging && (at - m_pressed).manhattanLength() >= QApplication::startDragDistance()) {
        m_dragging = true;
        setCursor(Qt::ClosedHandCursor);
    }
    if (m_dragging)
        Pan(at - std::exchange(m_dragged, at));
}

void CNetworkMap::mouseReleaseEvent(QMouseEvent* event)
{
    if (!std::exchange(m_pressing, false))
        return;
    unsetCursor();
    if (!std::exchange(m_dragging, false) && event->button() == Qt::LeftButton)
        PickAt(event->position());
}

void CNetworkMap::mouseDoubleClickEvent(QMouseEvent* event)
{
    if (event->button() == Qt::LeftButton)
        ZoomAt(event->position(), ZoomStep * ZoomStep);
}

void CNetworkMap::wheelEvent(QWheelEvent* event)
{
    constexpr double notch = 120; // as QWheelEvent counts
    if (event->angleDelta().y() != 0)
        ZoomAt(event->position(), std::pow(ZoomStep, event->angleDelta().y() / notch));
    event->accept();
}

void CNetworkMap::contextMenuEvent(QContextMenuEvent* event)
{
    if (event->reason() == QContextMenuEvent::Mouse) {
        PickAt(event->pos());
        emit MenuRequested(event->globalPos());
        return;
    }
    const auto picked = Picked() ? WindowPoint(*Picked()) : std::nullopt;
    emit MenuRequested(mapToGlobal(picked ? picked->toPoint() : rect().center()));
}
