#include "editors/network/plane_line.h"

namespace {

constexpr double Thin = 0.7;       // pixels between vertices that are looked at
constexpr double Tolerance = 0.35; // pixels that the line may be off

/// Also for rectangles without width or height, which QRectF::intersects says are nowhere.
bool Meets(const QRectF& a, const QRectF& b)
{
    return a.left() <= b.right() && b.left() <= a.right() && a.top() <= b.bottom() && b.top() <= a.bottom();
}

std::vector<QPointF> Project(const std::vector<QPointF>& line, const CMapProjection& projection)
{
    std::vector<QPointF> points;
    points.reserve(line.size());
    for (std::size_t i = 0; i < line.size(); ++i) {
        const QPointF at = projection.ToPlane(line[i]);
        if (i == 0 || i + 1 == line.size() || Distance(at, points.back()) >= Thin)
            points.push_back(at);
    }
    return points;
}

/// Keeps the vertices without which the line would be off by more than a tolerance. D. Douglas, T. Peucker, Algorithms
/// for the reduction of the number of points required to represent a digitized line or its caricature, 1973.
std::vector<QPointF> Simplify(const std::vector<QPointF>& all)
{
    if (all.size() < 3)
        return all;
    std::vector<bool> kept(all.size(), false);
    kept.front() = kept.back() = true;
    std::vector<std::pair<std::size_t, std::size_t>> ranges{{0, all.size() - 1}};
    while (!ranges.empty()) {
        const auto [first, last] = ranges.back();
        ranges.pop_back();
        double farthest = Tolerance;
        std::size_t at = first;
        for (std::size_t i = first + 1; i < last; ++i) {
            const QPointF way = all[last] - all[first];
            const QPointF nearest = all[first] + NearestPart(all[i], all[first], all[last]) * way;
            if (const double off = Distance(all[i], nearest); off > farthest) {
                farthest = off;
                at = i;
            }
        }
        if (at == first)
            continue;
        kept[at] = true;
        ranges.emplace_back(first, at);
        ranges.emplace_back(at, last);
    }
    std::vector<QPointF> points;
    for (std::size_t i = 0; i < all.size(); ++i) {
        if (kept[i])
            points.push_back(all[i]);
    }
    return points;
}

} // namespace

CPlaneLine::CPlaneLine(const std::vector<QPointF>& line, const CMapProjection& projection)
    : CMeasuredLine(Simplify(Project(line, projection)))
{
}

QPointF CPlaneLine::Direction(double distance, double span) const
{
    const QPointF way = At(distance + span) - At(distance - span);
    const double length = std::hypot(way.x(), way.y());
    if (length > 0)
        return way / length;
    return span < Length() ? Direction(distance, 2 * span + 1) : QPointF(1, 0); // a loop closes here
}

std::vector<QPolygonF> CPlaneLine::Clip(const QRectF& rect) const
{
    std::vector<QPolygonF> parts;
    bool inside = false; // the part at hand ends where the next segment begins
    for (const Chunk& chunk : Chunks()) {
        const bool near = Meets(chunk.box, rect);
        inside = inside && near;
        for (std::size_t i = chunk.first; near && i < chunk.last; ++i) {
            const QPointF &a = Points()[i], &b = Points()[i + 1];
            const bool before = std::exchange(inside, Meets(QRectF(a, b).normalized(), rect));
            if (!inside)
                continue;
            if (!before)
                parts.push_back({a});
            parts.back() << b;
        }
    }
    return parts;
}
