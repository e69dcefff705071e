#include "editors/network/measured_line.h"

double NearestPart(const QPointF& point, const QPointF& a, const QPointF& b)
{
    const QPointF way = b - a;
    const double square = QPointF::dotProduct(way, way);
    return square > 0 ? std::clamp(QPointF::dotProduct(point - a, way) / square, 0.0, 1.0) : 0;
}

CMeasuredLine::CMeasuredLine(std::vector<QPointF> points) : m_points(std::move(points))
{
    constexpr std::size_t chunk = 32; // segments
    for (std::size_t i = 0; i < m_points.size(); ++i)
        m_along.push_back(i == 0 ? 0 : m_along.back() + Distance(m_points[i - 1], m_points[i]));
    for (std::size_t first = 0; first + 1 < m_points.size(); first += chunk) {
        const std::size_t last = std::min(first + chunk, m_points.size() - 1);
        CExtent around;
        around.Add({&m_points[first], last - first + 1});
        m_chunks.push_back({first, last, around.Box()});
    }
}

QPointF CMeasuredLine::At(double distance) const
{
    if (IsEmpty())
        return m_points.empty() ? QPointF() : m_points.front();
    const auto after = std::upper_bound(m_along.begin() + 1, m_along.end() - 1, distance);
    const auto i = std::size_t(after - m_along.begin());
    const double step = m_along[i] - m_along[i - 1];
    const double part = step > 0 ? std::clamp((distance - m_along[i - 1]) / step, 0.0, 1.0) : 0;
    return m_points[i - 1] + part * (m_points[i] - m_points[i - 1]);
}
