// What the headers have other than their base for columns that stay at the left: where they are seen and pressed.
#include "grid/frozen_columns.h"
#include "grid/gen_grid.h"
#include "grid/grid_header.h"

#include <QMouseEvent>
#include <QPainter>
#include <QStyle>
#include <algorithm>
#include <memory>
#include <optional>
#include <utility>

namespace {

/// Where the mouse is; nothing for other events.
std::optional<QPoint> PlaceOf(const QEvent& event)
{
    switch (event.type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseMove:
    case QEvent::HoverEnter:
    case QEvent::HoverMove:
        return static_cast<const QSinglePointEvent&>(event).position().toPoint();
    case QEvent::ToolTip:
    case QEvent::WhatsThis:
        return static_cast<const QHelpEvent&>(event).pos();
    case QEvent::ContextMenu:
        return static_cast<const QContextMenuEvent&>(event).pos();
    default:
        return std::nullopt;
    }
}

/// The same event elsewhere, of those that have a place.
std::unique_ptr<QEvent> At(const QPoint& place, const QEvent& event)
{
    switch (event.type()) {
    case QEvent::HoverEnter:
    case QEvent::HoverMove: {
        const auto& hover = static_cast<const QHoverEvent&>(event);
        return std::make_unique<QHoverEvent>(hover.type(), place, hover.globalPosition(), place, hover.modifiers());
    }
    case QEvent::ToolTip:
    case QEvent::WhatsThis:
        return std::make_unique<QHelpEvent>(event.type(), place, static_cast<const QHelpEvent&>(event).globalPos());
    case QEvent::ContextMenu: {
        const auto& menu = static_cast<const QContextMenuEvent&>(event);
        return std::make_unique<QContextMenuEvent>(menu.reason(), place, menu.globalPos(), menu.modifiers());
    }
    default: {
        const auto& mouse = static_cast<const QMouseEvent&>(event);
        return std::make_unique<QMouseEvent>(mouse.type(), place, mouse.scenePosition(), mouse.globalPosition(),
                                             mouse.button(), mouse.buttons(), mouse.modifiers(),
                                             mouse.pointingDevice());
    }
    }
}

} // namespace

int CGridHeader::BorderAt(int x) const
{
    const CFrozenColumns& frozen = m_grid.Frozen();
    const int grip = style()->pixelMetric(QStyle::PM_HeaderGripMargin, nullptr, this);
    if (frozen.Width() > 0 && x >= frozen.Width() && x < frozen.Width() + grip)
        return frozen.Count() - 1; // whatever goes below it there
    const int column = logicalIndexAt(frozen.LaidOut(x)), within = x - frozen.Left(column);
    if (column >= 0 && within > sectionSize(column) - grip)
        return column;
    return column > 0 && within < grip ? column - 1 : -1;
}

/// The base drags nothing left of its place 0, where it has the frozen columns.
bool CGridHeader::ResizeFrozen(const QEvent& event, int x)
{
    const int column = BorderAt(x);
    const bool isFrozen = column >= 0 && column < m_grid.Frozen().Count();
    switch (event.type()) {
    case QEvent::MouseButtonPress:
        if (!isFrozen || static_cast<const QMouseEvent&>(event).button() != Qt::LeftButton)
            return false;
        m_resized = column;
        m_widthAtZero = sectionSize(column) - x;
        return true;
    case QEvent::MouseMove:
        if (m_resized >= 0) {
            resizeSection(m_resized, std::max(minimumSectionSize(), m_widthAtZero + x));
            return true;
        }
        if (static_cast<const QMouseEvent&>(event).buttons() != Qt::NoButton)
            return false;
        if (isFrozen)
            setCursor(Qt::SplitHCursor);
        else if (x < m_grid.Frozen().Width())
            unsetCursor();
        return isFrozen;
    case QEvent::MouseButtonRelease:
        return std::exchange(m_resized, -1) >= 0;
    default:
        return false;
    }
}

/// Where the base has what the mouse is at. Beside the edge that is still the frozen column, whose border it is.
QPoint CGridHeader::LaidOut(const QPoint& place) const
{
    const CFrozenColumns& frozen = m_grid.Frozen();
    const bool isEdge = place.x() >= frozen.Width() && BorderAt(place.x()) < frozen.Count() && BorderAt(place.x()) >= 0;
    return frozen.LaidOut(isEdge ? QPoint(frozen.Width() - 1, place.y()) : place);
}

bool CGridHeader::viewportEvent(QEvent* event)
{
    const auto place = PlaceOf(*event);
    const int frozen = m_grid.Frozen().Width();
    if (place && (frozen > 0 || m_resized >= 0) && ResizeFrozen(*event, place->x()))
        return true;
    if (!place || LaidOut(*place) == *place)
        return QHeaderView::viewportEvent(event);
    const auto laidOut = At(LaidOut(*place), *event);
    const bool isDone = QHeaderView::viewportEvent(laidOut.get());
    event->setAccepted(laidOut->isAccepted());
    viewport()->update(0, 0, frozen, height()); // another one may be pressed, or below the mouse
    return isDone;
}

void CGridHeader::paintEvent(QPaintEvent* event)
{
    QHeaderView::paintEvent(event);
    const CFrozenColumns& frozen = m_grid.Frozen();
    if (event->rect().left() >= frozen.Width())
        return;
    QPainter painter(viewport());
    for (int column = 0; column < frozen.Count(); ++column) {
        const QRect section(frozen.Left(column), 0, sectionSize(column), viewport()->height());
        painter.fillRect(section, palette().brush(viewport()->backgroundRole()));
        painter.save();
        paintSection(&painter, section, column);
        painter.restore();
    }
    frozen.PaintEdge(painter, height());
}
