#include "editors/network/linear_reference.h"

#include <algorithm>
#include <cmath>

namespace {

constexpr std::size_t ChunkSegments = 32;

double Distance(const QPointF& a, const QPointF& b)
{
    return std::hypot(a.x() - b.x(), a.y() - b.y());
}

double Distance(const QPointF& point, const QRectF& box)
{
    const double dx = std::max({box.left() - point.x(), 0.0, point.x() - box.right()});
    const double dy = std::max({box.top() - point.y(), 0.0, point.y() - box.bottom()});
    return std::hypot(dx, dy);
}

QRectF BoxOf(const std::vector<QPointF>& points, std::size_t first, std::size_t last)
{
    QPointF low = points[first], high = low;
    for (std::size_t i = first + 1; i <= last; ++i) {
        low = {std::min(low.x(), points[i].x()), std::min(low.y(), points[i].y())};
        high = {std::max(high.x(), points[i].x()), std::max(high.y(), points[i].y())};
    }
    return {low, high};
}

} // namespace

double NearestPart(const QPointF& point, const QPointF& a, const QPointF& b)
{
    const QPointF way = b - a;
    const double square = QPointF::dotProduct(way, way);
    return square > 0 ? std::clamp(QPointF::dotProduct(point - a, way) / square, 0.0, 1.0) : 0;
}

CLinearReference::CLinearReference(const CNetwork& network)
{
    m_lines.reserve(network.branches.size());
    std::transform(network.branches.begin(), network.branches.end(), std::back_inserter(m_lines), &Prepare);
}

CLinearReference::Line CLinearReference::Prepare(const CNetworkBranch& branch)
{
    Line line{branch.start, branch.end, branch.line, {}, {}, {}};
    const auto& points = line.points;
    if (points.size() < 2)
        return line;
    line.along.assign(1, 0.0);
    for (std::size_t i = 1; i < points.size(); ++i)
        line.along.push_back(line.along.back() + Distance(points[i - 1], points[i]));
    for (std::size_t first = 0; first + 1 < points.size(); first += ChunkSegments) {
        const std::size_t last = std::min(first + ChunkSegments, points.size() - 1);
        line.chunks.push_back({first, last, BoxOf(points, first, last)});
    }
    line.box = BoxOf(points, 0, points.size() - 1);
    return line;
}

void CLinearReference::Search(const Line& line, const Chunk& chunk, const QPointF& point, CNetworkPlace& best,
                              bool& found)
{
    for (std::size_t i = chunk.first; i < chunk.last; ++i) {
        const QPointF &a = line.points[i], &b = line.points[i + 1];
        const double part = NearestPart(point, a, b);
        const QPointF nearest = a + part * (b - a);
        const double distance = Distance(point, nearest);
        if (distance > best.distance || (found && distance == best.distance))
            continue;
        const double along = std::lerp(line.along[i], line.along[i + 1], part), length = line.along.back();
        best.chainage = std::lerp(line.start, line.end, length > 0 ? along / length : 0);
        best.point = nearest;
        best.distance = distance;
        found = true;
    }
}

std::optional<CNetworkPlace> CLinearReference::Nearest(const QPointF& point, double tolerance) const
{
    CNetworkPlace best;
    best.distance = tolerance;
    for (std::size_t i = 0; i < m_lines.size(); ++i) {
        const Line& line = m_lines[i];
        if (line.chunks.empty() || Distance(point, line.box) > best.distance)
            continue;
        bool found = best.branch >= 0;
        const double before = best.distance;
        const bool hadOne = found;
        for (const Chunk& chunk : line.chunks) {
            if (Distance(point, chunk.box) <= best.distance)
                Search(line, chunk, point, best, found);
        }
        if (found && (!hadOne || best.distance < before))
            best.branch = int(i);
    }
    return best.branch >= 0 ? std::optional(best) : std::nullopt;
}

std::optional<double> CLinearReference::DistanceAt(int branch, double chainage) const
{
    if (branch < 0 || std::size_t(branch) >= m_lines.size() || m_lines[std::size_t(branch)].chunks.empty())
        return std::nullopt;
    const Line& line = m_lines[std::size_t(branch)];
    const double part = (chainage - line.start) / (line.end - line.start);
    constexpr double rounding = 1e-9; // the ends belong to the branch, in whatever unit they were typed
    if (!(part >= -rounding && part <= 1 + rounding))
        return std::nullopt;
    return std::clamp(part, 0.0, 1.0) * line.along.back();
}

std::optional<QPointF> CLinearReference::PointAt(int branch, double chainage) const
{
    const auto distance = DistanceAt(branch, chainage);
    if (!distance)
        return std::nullopt;
    const Line& line = m_lines[std::size_t(branch)];
    const auto after = std::upper_bound(line.along.begin() + 1, line.along.end() - 1, *distance);
    const auto i = std::size_t(after - line.along.begin());
    const double step = line.along[i] - line.along[i - 1];
    const double part = step > 0 ? (*distance - line.along[i - 1]) / step : 0;
    return line.points[i - 1] + std::clamp(part, 0.0, 1.0) * (line.points[i] - line.points[i - 1]);
}
