#include "editors/network/plane_line.h"

#include "editors/network/linear_reference.h"

#include <algorithm>
#include <cmath>

namespace {

constexpr qsizetype BoxSegments = 32;
constexpr double Thin = 0.7;       // pixels between vertices that are looked at
constexpr double Tolerance = 0.35; // pixels that the line may be off

double Distance(const QPointF& a, const QPointF& b)
{
    return std::hypot(a.x() - b.x(), a.y() - b.y());
}

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
    QPolygonF all;
    all.reserve(qsizetype(line.size()));
    for (std::size_t i = 0; i < line.size(); ++i) {
        const QPointF at = projection.ToPlane(line[i]);
        if (i == 0 || i + 1 == line.size() || Distance(at, all.back()) >= Thin)
            all.append(at);
    }
    Simplify(all);
    for (qsizetype i = 0; i < m_points.size(); ++i)
        m_along.push_back(i == 0 ? 0 : m_along.back() + Distance(m_points[i - 1], m_points[i]));
    for (qsizetype i = 0; i + 1 < m_points.size(); i += BoxSegments)
        m_boxes.push_back(BoxOf(m_points.constData() + i, std::min(BoxSegments + 1, m_points.size() - i)));
}

/// Keeps the vertices without which the line would be off by more than a tolerance. D. Douglas, T. Peucker, Algorithms
/// for the reduction of the number of points required to represent a digitized line or its caricature, 1973.
void CPlaneLine::Simplify(const QPolygonF& all)
{
    if (all.size() < 3) {
        m_points = all;
        return;
    }
    std::vector<bool> kept(std::size_t(all.size()), false);
    kept.front() = kept.back() = true;
    std::vector<std::pair<qsizetype, qsizetype>> ranges{{0, all.size() - 1}};
    while (!ranges.empty()) {
        const auto [first, last] = ranges.back();
        ranges.pop_back();
        double farthest = Tolerance;
        qsizetype at = -1;
        for (qsizetype i = first + 1; i < last; ++i) {
            const QPointF way = all[last] - all[first];
            const QPointF nearest = all[first] + NearestPart(all[i], all[first], all[last]) * way;
            if (const double off = Distance(all[i], nearest); off > farthest) {
                farthest = off;
                at = i;
            }
        }
        if (at < 0)
            continue;
        kept[std::size_t(at)] = true;
        ranges.emplace_back(first, at);
        ranges.emplace_back(at, last);
    }
    for (qsizetype i = 0; i < all.size(); ++i) {
        if (kept[std::size_t(i)])
            m_points.append(all[i]);
    }
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
