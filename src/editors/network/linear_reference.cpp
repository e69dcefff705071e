#include "editors/network/linear_reference.h"

namespace {

double DistanceTo(const QRectF& box, const QPointF& point)
{
    return std::hypot(std::max({box.left() - point.x(), 0.0, point.x() - box.right()}),
                      std::max({box.top() - point.y(), 0.0, point.y() - box.bottom()}));
}

} // namespace

CLinearReference::Line::Line(const CNetworkBranch& branch)
    : CMeasuredLine(branch.line), start(branch.start), end(branch.end)
{
    CExtent around;
    around.Add(Points());
    box = around.Box();
}

CLinearReference::CLinearReference(const CNetwork& network) : m_lines(network.branches.begin(), network.branches.end())
{
}

std::optional<CNetworkPlace> CLinearReference::Nearest(const QPointF& point, double tolerance) const
{
    CNetworkPlace best;
    best.distance = tolerance;
    const auto look = [&](int branch, const Line& line, std::size_t i) {
        const QPointF &a = line.Points()[i], &b = line.Points()[i + 1];
        const double part = NearestPart(point, a, b);
        const QPointF nearest = a + part * (b - a);
        const double distance = Distance(point, nearest);
        if (distance > best.distance || (best.branch >= 0 && distance == best.distance))
            return;
        const double along = std::lerp(line.Along()[i], line.Along()[i + 1], part), length = line.Length();
        best = {branch, std::lerp(line.start, line.end, length > 0 ? along / length : 0), nearest, distance};
    };
    for (std::size_t branch = 0; branch < m_lines.size(); ++branch) {
        const Line& line = m_lines[branch];
        if (line.IsEmpty() || DistanceTo(line.box, point) > best.distance)
            continue;
        for (const CMeasuredLine::Chunk& chunk : line.Chunks()) {
            const bool near = DistanceTo(chunk.box, point) <= best.distance;
            for (std::size_t i = chunk.first; near && i < chunk.last; ++i)
                look(int(branch), line, i);
        }
    }
    return best.branch >= 0 ? std::optional(best) : std::nullopt;
}

std::optional<QPointF> CLinearReference::PointAt(int branch, double chainage) const
{
    if (branch < 0 || std::size_t(branch) >= m_lines.size() || m_lines[std::size_t(branch)].IsEmpty())
        return std::nullopt;
    const Line& line = m_lines[std::size_t(branch)];
    const double part = (chainage - line.start) / (line.end - line.start);
    constexpr double rounding = 1e-9; // the ends belong to the branch, in whatever unit they were typed
    if (!(part >= -rounding && part <= 1 + rounding))
        return std::nullopt;
    return line.At(part * line.Length());
}
