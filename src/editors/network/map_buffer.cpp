#include "editors/network/map_buffer.h"

#include <QPainter>
#include <cmath>
#include <utility>

namespace {
// Pixels of the user.
constexpr double LineWidth = 2.2, CurrentWidth = 3.6, Casing = 2.5, HaloWidth = 2.5, ArrowSize = 7.5;

/// Paints a scene into a part of a window, in device pixels.
class CMapPainter
{
public:
    CMapPainter(const CMapScene& scene, const CMapStyle& style, int currentBranch, LabelPictures& pictures)
        : m_scene(scene), m_style(style), m_currentBranch(currentBranch), m_pictures(pictures)
    {
        for (int kind = 0; kind < HDDataTypeCount; ++kind)
            m_symbols[std::size_t(kind)] = LocationKindSymbol(kind, CMapScene::SymbolSize * scene.ratio, style.outline);
    }

    /// `part` is in window pixels; `offset` leads from the plane to the window.
    void Paint(QPainter& painter, const QRect& part, const QPoint& offset) const
    {
        painter.save();
        painter.setClipRect(part);
        painter.fillRect(part, m_style.ground);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.translate(offset);
        const QRectF plane = QRectF(part).translated(-offset);
        PaintLines(painter, plane);
        PaintArrows(painter, plane);
        PaintSymbols(painter, plane);
        PaintLabels(painter, plane);
        painter.restore();
    }

private:
    void PaintLines(QPainter& painter, const QRectF& part) const
    {
        const double ratio = m_scene.ratio, reach = (CurrentWidth + Casing) * ratio;
        const QRectF near = part.adjusted(-reach, -reach, reach, reach);
        const auto& lines = m_scene.lines;
        for (std::size_t i = 0; i < lines.size(); ++i) {
            const std::vector<QPolygonF> parts = lines[i].Clip(near);
            const bool current = int(i) == m_currentBranch;
            const double width = current ? CurrentWidth : LineWidth;
            // The ground's colour around a line shows which of two crossing branches is above.
            for (const auto& [colour, extra] :
                 {std::pair(m_style.ground, Casing), std::pair(current ? m_style.chosen : m_style.water, 0.0)}) {
                const bool casing = extra > 0;
                if (casing && !m_scene.casings)
                    continue;
                // Lines bend so little between their vertices that round joins would look the same, at twice the time.
                painter.setPen(QPen(colour, (width + extra) * ratio, Qt::SolidLine, casing ? Qt::FlatCap : Qt::RoundCap,
                                    Qt::BevelJoin));
                for (const QPolygonF& each : parts)
                    painter.drawPolyline(each);
            }
        }
    }

    void PaintArrows(QPainter& painter, const QRectF& part) const
    {
        const double size = ArrowSize * m_scene.ratio;
        const QRectF near = part.adjusted(-size, -size, size, size);
        painter.setPen(Qt::NoPen);
        painter.setBrush(m_style.dark ? m_style.water.lighter(125) : m_style.water.darker(160));
        for (const CMapScene::Arrow& arrow : m_scene.arrows) {
            if (!near.contains(arrow.at))
                continue;
            const QPointF along = size * arrow.direction, across(-along.y(), along.x());
            const QPointF corners[] = {arrow.at + along, arrow.at - 0.7 * along + 0.75 * across, arrow.at - 0.3 * along,
                                       arrow.at - 0.7 * along - 0.75 * across};
            painter.drawPolygon(corners, 4);
        }
    }

    void PaintSymbols(QPainter& painter, const QRectF& part) const
    {
        const double size = CMapScene::SymbolSize * m_scene.ratio, lanes = 8 * CMapScene::LaneWidth * m_scene.ratio;
        if (m_scene.leaders) {
            const QRectF near = part.adjusted(-lanes, -lanes, lanes, lanes);
            painter.setPen(QPen(m_style.muted, 0.8 * m_scene.ratio));
            for (const CMapScene::Symbol& symbol : m_scene.symbols) {
                if (near.contains(symbol.at))
                    painter.drawLine(symbol.foot, symbol.at);
            }
        }
        const QRectF near = part.adjusted(-size, -size, size, size);
        for (const CMapScene::Symbol& symbol : m_scene.symbols) {
            if (!near.contains(symbol.at))
                continue;
            // On whole pixels, so that it looks the same wherever it is.
            const QPixmap& pixmap = m_symbols[std::size_t(symbol.kind)];
            painter.drawPixmap(int(std::floor(symbol.at.x() - pixmap.width() / 2.0 + 0.5)),
                               int(std::floor(symbol.at.y() - pixmap.height() / 2.0 + 0.5)), pixmap);
        }
    }

    void PaintLabels(QPainter& painter, const QRectF& part) const
    {
        const double halo = HaloWidth * m_scene.ratio;
        const QRectF near = part.adjusted(-halo, -halo, halo, halo);
        const auto& labels = m_scene.labels;
        for (std::size_t i = 0; i < labels.size(); ++i) {
            if (!near.intersects(labels[i].box))
                continue;
            if (int(labels[i].branch) == m_currentBranch) {
                PaintLabel(painter, labels[i], m_style.chosen);
                continue;
            }
            const QRect box = labels[i].box.adjusted(-2 * halo, -2 * halo, 2 * halo, 2 * halo).toAlignedRect();
            painter.drawPixmap(box.topLeft(), LabelPicture(i, box));
        }
    }

    QPixmap LabelPicture(std::size_t label, const QRect& box) const
    {
        if (const QPixmap* known = m_pictures.object(label))
            return *known;
        QPixmap picture(box.size());
        picture.fill(Qt::transparent);
        QPainter painter(&picture);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.translate(-box.topLeft());
        PaintLabel(painter, m_scene.labels[label], m_style.text);
        painter.end();
        m_pictures.insert(label, new QPixmap(picture), 4 * box.width() * box.height());
        return picture;
    }

    void PaintLabel(QPainter& painter, const CMapScene::Label& label, const QColor& colour) const
    {
        const double halo = HaloWidth * m_scene.ratio;
        const QPainterPath& text = m_scene.names[label.branch];
        painter.save();
        painter.translate(label.center);
        painter.rotate(label.angle);
        painter.setPen(Qt::NoPen);
        painter.setBrush(Faded(m_style.ground, 190)); // keeps the name legible on whatever is under it
        painter.drawRoundedRect(text.boundingRect().adjusted(-halo, -halo, halo, halo), halo, halo);
        painter.fillPath(text, colour);
        painter.restore();
    }

    const CMapScene& m_scene;
    const CMapStyle& m_style;
    int m_currentBranch;
    LabelPictures& m_pictures;
    std::array<QPixmap, HDDataTypeCount> m_symbols;
};

} // namespace

void CMapBuffer::Clear()
{
    m_labels.clear();
    m_valid = false;
}

const QPixmap& CMapBuffer::Paint(const CMapScene& scene, const CMapStyle& style, int currentBranch, const QSize& size,
                                 const QPoint& offset)
{
    if (m_picture.size() != size) {
        m_picture = QPixmap(size);
        m_valid = false;
    }
    m_picture.setDevicePixelRatio(1);
    const QPoint moved = offset - std::exchange(m_offset, offset);
    QRegion missing(m_picture.rect());
    if (std::exchange(m_valid, true) && m_picture.rect().translated(moved).intersects(m_picture.rect())) {
        missing = QRegion();
        if (!moved.isNull())
            m_picture.scroll(moved.x(), moved.y(), m_picture.rect(), &missing);
    }
    if (!missing.isEmpty()) {
        const CMapPainter map(scene, style, currentBranch, m_labels);
        QPainter painter(&m_picture);
        for (const QRect& part : missing)
            map.Paint(painter, part, offset);
    }
    m_picture.setDevicePixelRatio(scene.ratio);
    return m_picture;
}
