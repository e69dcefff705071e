#include "editors/network/plane_line.h"

#include <algorithm>
#include <cmath>

namespace {

constexpr qsizetype BoxSegments = 32;
constexpr double Thin = 0.7; // pixels between the vertices that are kept

QRectF BoxOf(const QPointF* points, qsizetype count)
{
    QPointF low = points[0], high = low;
    for (qsizetype i = 1; i < count; ++i) {
        low = {std::min(low.x(), points[i].x()), std::min(low.y(), points[i].y())};
        high = {std::max(high.x(), points[i].x()), std::max(high.y(), points[i].y())};
    }
    return {low, high};
}

/// Also for rectangles without width or height, which QRectF::intersects says are nowhere.
bool Meets(const QRectF& a, const QRectF& b)
{
    return a.left() <= b.right() && b.left() <= a.right() && a.top() <= b.bottom() && b.top() <= a.bottom();
}

} // namespace

CPlaneLine::CPlaneLine(const std::vector<QPointF>& line, const CMapProjection& projection)
{
    m_points.reserve(static_cast<qsizetype>(line.size()));
    for (std::size_t i = 0; i < line.size(); ++i) {
        const QPointF at = projection.ToPlane(line[i]);
        const double step =
            m_points.isEmpty() ? 0 : std::hypot(at.x() - m_points.back().x(), at.y() - m_points.back().y());
        if (i > 0 && i + 1 < line.size() && step < Thin)
            continue;
        m_along.push_back(m_along.empty() ? 0 : m_along.back() + step);
        m_points.append(at);
    }
    for (qsizetype i = 0; i + 1 < m_points.size(); i += BoxSegments)
        m_boxes.push_back(BoxOf(m_points.constData() + i, std::min(BoxSegments + 1, m_points.size() - i)));
}

QPointF CPlaneLine::At(double distance) const
{
    if (IsEmpty())
        return m_points.value(0);
    const auto after = std::upper_bound(m_along.begin() + 1, m_along.end() - 1, distance);
    const auto i = after - m_along.begin();
    const double step = m_along[std::size_t(i)] - m_along[std::size_t(i - 1)];
    const double part = step > 0 ? std::clamp((distance - m_along[std::size_t(i - 1)]) / step, 0.0, 1.0) : 0;
    return m_points[i - 1] + part * (m_points[i] - m_points[i - 1]);
}

QPointF CPlaneLine::Direction(double distance, double span) const
{
    const QPointF way = At(distance + span) - At(distance - span);
    const double length = std::hypot(way.x(), way.y());
    if (length > 0)
        return way / length;
    return span < Length() ? Direction(distance, 2 * span + 1) : QPointF(1, 0); // a loop closes here
}

void CPlaneLine::Clip(const QRectF& rect, std::vector<QPolygonF>& parts) const
{
    QPolygonF part;
    const auto finish = [&] {
        if (part.size() > 1)
            parts.push_back(part);
        part.clear();
    };
    for (std::size_t box = 0; box < m_boxes.size(); ++box) {
        if (!Meets(m_boxes[box], rect)) {
            finish();
            continue;
        }
        const auto first = qsizetype(box) * BoxSegments;
        const auto last = std::min(first + BoxSegments, m_points.size() - 1);
        for (qsizetype i = first; i < last; ++i) {
            if (!Meets(QRectF(m_points[i], m_points[i + 1]).normalized(), rect)) {
                finish();
                continue;
            }
            if (part.isEmpty())
                part << m_points[i];
            part << m_points[i + 1];
        }
    }
    finish();
}
