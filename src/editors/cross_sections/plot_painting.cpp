// How the plot of a cross section is painted.
#include "editors/common/quantity.h"
#include "editors/cross_sections/section_plot.h"
#include "editors/cross_sections/section_tables.h"
#include "grid/column_spec.h"

#include <QPainter>
#include <algorithm>

namespace {

/// Whole device pixels for thin straight lines.
double Crisp(double value)
{
    return std::floor(value) + 0.5;
}

} // namespace

void CSectionPlot::paintEvent(QPaintEvent*)
{
    const CPlotStyle style(palette());
    QPainter painter(this);
    painter.fillRect(rect(), style.paper);
    painter.setRenderHint(QPainter::Antialiasing);
    if (m_section)
        PaintTitle(painter, style);
    if (HasPoints()) {
        painter.save();
        painter.setClipRect(m_area);
        PaintWater(painter, style);
        PaintGround(painter, style);
        painter.restore();
        PaintAxes(painter, style);
        PaintPoints(painter, style);
        PaintWidth(painter, style);
    } else {
        PaintHint(painter, style);
    }
    if (hasFocus()) {
        painter.setPen(palette().color(QPalette::Highlight));
        painter.setBrush(Qt::NoBrush);
        painter.drawRect(QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5));
    }
}

void CSectionPlot::PaintTitle(QPainter& painter, const CPlotStyle& style) const
{
    const double line = fontMetrics().height();
    const QRectF row(line, 0.5 * line, width() - 2 * line, 1.6 * line);
    painter.save();
    QFont bold = font();
    bold.setBold(true);
    bold.setPointSizeF(font().pointSizeF() * 1.15);
    painter.setFont(bold);
    painter.setPen(style.text);
    const QString title = painter.fontMetrics().elidedText(Title(), Qt::ElideMiddle, int(row.width()));
    const double used = painter.fontMetrics().horizontalAdvance(title) + line;
    painter.drawText(row, Qt::AlignLeft | Qt::AlignVCenter, title);
    painter.restore();
    if (row.width() - used < 4 * line)
        return;
    painter.setPen(style.muted);
    painter.drawText(row.adjusted(used, 0, 0, 0), Qt::AlignRight | Qt::AlignVCenter,
                     fontMetrics().elidedText(Caption(), Qt::ElideRight, int(row.width() - used)));
}

void CSectionPlot::PaintAxes(QPainter& painter, const CPlotStyle& style) const
{
    const double line = fontMetrics().height(), tick = 0.3 * line;
    painter.setBrush(Qt::NoBrush);
    const auto mark = [&](const QLineF& grid, const QLineF& outside) {
        painter.setPen(style.grid);
        painter.drawLine(grid);
        painter.setPen(style.muted);
        painter.drawLine(outside);
        painter.setPen(style.text);
    };
    for (std::size_t i = 0; i < m_across.ticks.size(); ++i) {
        const double x = Crisp(m_area.left() + m_across.Part(m_across.ticks[i]) * m_area.width());
        mark({x, m_area.top(), x, m_area.bottom()}, {x, m_area.bottom(), x, m_area.bottom() + tick});
        painter.drawText(QRectF(x - 4 * line, m_area.bottom() + tick, 8 * line, 1.1 * line), Qt::AlignCenter,
                         m_across.labels[qsizetype(i)]);
    }
    for (std::size_t i = 0; i < m_up.ticks.size(); ++i) {
        const double y = Crisp(m_area.bottom() - m_up.Part(m_up.ticks[i]) * m_area.height());
        mark({m_area.left(), y, m_area.right(), y}, {m_area.left() - tick, y, m_area.left(), y});
        painter.drawText(QRectF(0, y - line, m_area.left() - 1.6 * tick, 2 * line), Qt::AlignRight | Qt::AlignVCenter,
                         m_up.labels[qsizetype(i)]);
    }
    painter.setPen(style.muted);
    painter.drawRect(QRectF(QPointF(Crisp(m_area.left()), Crisp(m_area.top())),
                            QPointF(Crisp(m_area.right()), Crisp(m_area.bottom()))));
    painter.setPen(style.text);
    painter.drawText(QRectF(m_area.left(), m_area.bottom() + 1.5 * line, m_area.width(), 1.2 * line), Qt::AlignCenter,
                     WithUnit(TitleOf(&CSectionPoint::offset), m_across.group));
    painter.save();
    painter.translate(0.2 * line, m_area.bottom());
    painter.rotate(-90);
    painter.drawText(QRectF(0, 0, m_area.height(), 1.3 * line), Qt::AlignCenter,
                     WithUnit(TitleOf(&CSectionPoint::level), m_up.group));
    painter.restore();
}

QPolygonF CSectionPlot::GroundLine() const
{
    QPolygonF line;
    for (const CSectionPoint& point : m_section->points)
        line << WindowPoint(point);
    return line;
}

void CSectionPlot::PaintGround(QPainter& painter, const CPlotStyle& style) const
{
    const QPolygonF line = GroundLine();
    QPolygonF body = line;
    body << QPointF(line.last().x(), m_area.bottom()) << QPointF(line.first().x(), m_area.bottom());
    painter.setPen(Qt::NoPen);
    painter.setBrush(style.soil);
    painter.drawPolygon(body);
    painter.setPen(QPen(style.ground, 2, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.setBrush(Qt::NoBrush);
    painter.drawPolyline(line);
}

void CSectionPlot::PaintWater(QPainter& painter, const CPlotStyle& style) const
{
    if (!m_water)
        return;
    const QPointF left = WindowPoint({m_water->left, m_water->level});
    const QPointF right = WindowPoint({m_water->right, m_water->level});
    QPolygonF body{left};
    for (const CSectionPoint& point : m_section->points) {
        if (point.offset >= m_water->left && point.offset <= m_water->right && point.level <= m_water->level)
            body << WindowPoint(point);
    }
    body << right;
    painter.setPen(Qt::NoPen);
    painter.setBrush(style.water);
    painter.drawPolygon(body);
    painter.setPen(QPen(style.surface, 1.6));
    painter.drawLine(left, right);
}

/// A dimension line above the water surface.
void CSectionPlot::PaintWidth(QPainter& painter, const CPlotStyle& style) const
{
    if (!m_water)
        return;
    constexpr double head = 6, slim = 2.6;
    const double line = fontMetrics().height();
    const QPointF left = WindowPoint({m_water->left, m_water->level});
    const QPointF right = WindowPoint({m_water->right, m_water->level});
    const double y = Crisp(std::max(left.y() - line, m_area.top() + 1.6 * line));
    painter.setPen(QPen(style.surface, 1));
    painter.drawLine(QPointF(left.x(), y - 0.4 * line), left);
    painter.drawLine(QPointF(right.x(), y - 0.4 * line), right);
    painter.drawLine(QPointF(left.x(), y), QPointF(right.x(), y));
    painter.setBrush(style.surface);
    painter.setPen(Qt::NoPen);
    for (const auto& [x, way] : {std::pair(left.x(), 1.0), std::pair(right.x(), -1.0)}) {
        if (right.x() - left.x() > 3 * head)
            painter.drawPolygon(QPolygonF{{x, y}, {x + way * head, y - slim}, {x + way * head, y + slim}});
    }
    const QString label = tr("Width %1").arg(WithSymbol(UnitGroup::Width, m_section->width));
    QRectF box(0, 0, fontMetrics().horizontalAdvance(label) + 0.6 * line, 1.15 * line);
    box.moveCenter({(left.x() + right.x()) / 2, y - 0.75 * line});
    box.moveLeft(
        std::clamp(box.left(), m_area.left() + 2, std::max(m_area.right() - box.width() - 2, m_area.left() + 2)));
    QColor behind = style.paper;
    behind.setAlpha(215);
    painter.setBrush(behind);
    painter.drawRoundedRect(box, 3, 3);
    painter.setPen(style.surface);
    painter.drawText(box, Qt::AlignCenter, label);
}

void CSectionPlot::PaintPoints(QPainter& painter, const CPlotStyle& style) const
{
    constexpr double radius = 2.8, roomy = 7; // pixels a point needs to stand alone
    const QPolygonF line = GroundLine();
    if (m_area.width() / double(line.size()) > roomy) {
        painter.setPen(QPen(style.ground, 1.4));
        painter.setBrush(style.paper);
        for (const QPointF& at : line)
            painter.drawEllipse(at, radius, radius);
    }
    if (m_point < 0 || m_point >= line.size())
        return;
    painter.setPen(QPen(style.mark, 2));
    painter.setBrush(style.paper);
    painter.drawEllipse(line[m_point], 5, 5);
}

void CSectionPlot::PaintHint(QPainter& painter, const CPlotStyle& style) const
{
    painter.setPen(style.muted);
    painter.drawText(rect().adjusted(20, 20, -20, -20), Qt::AlignCenter | Qt::TextWordWrap,
                     m_section
                         ? tr("This cross section has no points yet. The Insert key in the table of points adds one.")
                         : tr("No cross section is selected."));
}
