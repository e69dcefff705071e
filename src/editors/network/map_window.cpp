// How the map's window is painted: what moved is kept, and only the rest is drawn.
#include "editors/network/map_overlay.h"
#include "editors/network/network_map.h"

#include <QHelpEvent>
#include <QPaintEvent>
#include <QToolTip>

QString CNetworkMap::LocationText(const CMapLocation& location) const
{
    return LocationKindName(location.kind) + u'\n' + PlaceText(location.branch, location.chainage) + u'\n' +
           location.file.section(u'/', -1);
}

CLegend CNetworkMap::Legend() const
{
    CLegend legend{.elsewhere = static_cast<int>(m_locations.size() - m_placed.size())};
    for (const CPlacedLocation& each : m_placed)
        ++legend.counts.at(static_cast<std::size_t>(each.kind));
    return legend;
}

/// Moves what is painted already, and paints the rest.
void CNetworkMap::UpdateBuffer()
{
    const QSize pixels = (QSizeF(size()) * devicePixelRatioF()).toSize();
    if (m_buffer.size() != pixels) {
        m_buffer = QPixmap(pixels);
        m_bufferValid = false;
    }
    m_buffer.setDevicePixelRatio(1);
    const QPoint moved = m_projection.offset - m_bufferOffset;
    QRegion missing(m_buffer.rect());
    if (m_bufferValid && m_buffer.rect().translated(moved).intersects(m_buffer.rect())) {
        missing = QRegion();
        if (!moved.isNull())
            m_buffer.scroll(moved.x(), moved.y(), m_buffer.rect(), &missing);
    }
    if (!missing.isEmpty()) {
        const CMapStyle style(palette());
        const CMapPainter map(Scene(), style, m_currentBranch, m_labelPictures);
        QPainter painter(&m_buffer);
        for (const QRect& part : missing)
            map.Paint(painter, part, m_projection.offset);
    }
    m_bufferOffset = m_projection.offset;
    m_bufferValid = true;
    m_buffer.setDevicePixelRatio(devicePixelRatioF());
}

void CNetworkMap::paintEvent(QPaintEvent*)
{
    if (m_scene && m_scene->Ratio() != devicePixelRatioF()) { // on another screen now
        m_projection.scale *= devicePixelRatioF() / m_scene->Ratio();
        m_projection.offset = (QPointF(m_projection.offset) * devicePixelRatioF() / m_scene->Ratio()).toPoint();
        SceneChanged();
        m_names.clear(); // of the other screen's pixels
    }
    UpdateBuffer();
    QPainter painter(this);
    painter.drawPixmap(0, 0, m_buffer);
    painter.setRenderHint(QPainter::Antialiasing);
    const CMapStyle style(palette());
    PaintMarks(painter, style);
    PaintScaleBar(painter, style, rect(), m_projection.scale / devicePixelRatioF());
    PaintLegend(painter, style, rect(), Legend());
    if (m_document.Network().branches.empty())
        PaintHint(painter, style, rect(), tr("This network has no branches yet."));
    if (hasFocus())
        PaintFocus(painter, style, rect());
}

void CNetworkMap::PaintMarks(QPainter& painter, const CMapStyle& style) const
{
    if (m_shown) {
        if (const auto at = WindowPoint(*m_shown))
            PaintShown(painter, style, *at);
    }
    const auto symbol = Selected() ? SymbolPoint(static_cast<std::size_t>(m_selected)) : std::nullopt;
    const auto picked = Picked();
    if (symbol)
        PaintSelected(painter, style, *symbol);
    if (picked && symbol)
        PaintPlaceLabel(painter, style, rect(), *symbol, PlaceText(picked->branch, picked->chainage));
    else if (picked)
        PaintPicked(painter, style, rect(), *WindowPoint(*picked), PlaceText(picked->branch, picked->chainage));
    else if (m_shown && WindowPoint(*m_shown))
        PaintPlaceLabel(painter, style, rect(), *WindowPoint(*m_shown), PlaceText(m_shown->branch, m_shown->chainage));
}

bool CNetworkMap::event(QEvent* event)
{
    if (event->type() == QEvent::ToolTip) {
        const auto* help = static_cast<QHelpEvent*>(event);
        const int location = LocationAt(help->pos());
        if (location >= 0)
            QToolTip::showText(help->globalPos(), LocationText(m_locations[std::size_t(location)]), this);
        else
            QToolTip::hideText();
        return true;
    }
    return QWidget::event(event);
}
