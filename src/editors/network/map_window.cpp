// How the map's window is painted.
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
    CLegend legend{.elsewhere = int(Locations().size() - PlacedCount())};
    for (const CPlacedLocation& each : m_marks.Placed())
        ++legend.counts.at(std::size_t(each.kind));
    return legend;
}

/// The pixels of another screen are others.
void CNetworkMap::ScreenChanged()
{
    const double change = devicePixelRatioF() / m_scene->Ratio();
    m_projection.scale *= change;
    m_projection.offset = (QPointF(m_projection.offset) * change).toPoint();
    m_names.clear();
    SceneChanged();
}

void CNetworkMap::paintEvent(QPaintEvent*)
{
    if (m_scene && m_scene->Ratio() != devicePixelRatioF())
        ScreenChanged();
    const CMapStyle style(palette());
    QPainter painter(this);
    painter.drawPixmap(0, 0,
                       m_buffer.Paint(Scene(), style, m_currentBranch, (QSizeF(size()) * devicePixelRatioF()).toSize(),
                                      m_projection.offset));
    painter.setRenderHint(QPainter::Antialiasing);
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
    const auto shown = m_marks.Shown() ? WindowPoint(*m_marks.Shown()) : std::nullopt;
    const auto symbol = m_marks.Selected() ? SymbolPoint(*m_marks.Selected()) : std::nullopt;
    const auto picked = Picked();
    const auto text = [](const Place& place) { return PlaceText(place.branch, place.chainage); };
    if (shown)
        PaintShown(painter, style, *shown);
    if (symbol)
        PaintSelected(painter, style, *symbol);
    if (picked && symbol)
        PaintPlaceLabel(painter, style, rect(), *symbol, text(*picked));
    else if (picked)
        PaintPicked(painter, style, rect(), *WindowPoint(*picked), text(*picked));
    else if (shown)
        PaintPlaceLabel(painter, style, rect(), *shown, text(*m_marks.Shown()));
}

bool CNetworkMap::event(QEvent* event)
{
    if (event->type() == QEvent::ToolTip) {
        const auto* help = static_cast<QHelpEvent*>(event);
        if (const auto location = LocationAt(help->pos()))
            QToolTip::showText(help->globalPos(), LocationText(Locations()[*location]), this);
        else
            QToolTip::hideText();
        return true;
    }
    return QWidget::event(event);
}
