// Lines, on the map or on a plane: how long they are, what is around them, and where a distance along them is.
#pragma once

#include <QPointF>
#include <QRectF>
#include <algorithm>
#include <cmath>
#include <span>
#include <vector>

inline bool IsFinite(const QPointF& at)
{
    return std::isfinite(at.x()) && std::isfinite(at.y());
}

inline double Distance(const QPointF& a, const QPointF& b)
{
    return std::hypot(a.x() - b.x(), a.y() - b.y());
}

inline double LengthOf(std::span<const QPointF> line)
{
    double length = 0;
    for (std::size_t i = 1; i < line.size(); ++i)
        length += Distance(line[i - 1], line[i]);
    return length;
}

/// The smallest box around points.
struct CExtent
{
    double left = HUGE_VAL, top = HUGE_VAL, right = -HUGE_VAL, bottom = -HUGE_VAL;

    void Add(std::span<const QPointF> points)
    {
        for (const QPointF& at : points) {
            left = std::min(left, at.x());
            right = std::max(right, at.x());
            top = std::min(top, at.y());
            bottom = std::max(bottom, at.y());
        }
    }
    /// Null without any points.
    QRectF Box() const { return left > right ? QRectF() : QRectF(QPointF(left, top), QPointF(right, bottom)); }
};

/// The point of a segment that is nearest to `point`, as the part of the way from `a` to `b`.
double NearestPart(const QPointF& point, const QPointF& a, const QPointF& b);

/// A line with what is asked of it often, computed once.
class CMeasuredLine
{
public:
    struct Chunk // some segments that follow one another
    {
        std::size_t first, last; // vertices, both included
        QRectF box;
    };

    explicit CMeasuredLine(std::vector<QPointF> points);

    /// A single point is no line.
    bool IsEmpty() const { return m_chunks.empty(); }
    double Length() const { return IsEmpty() ? 0 : m_along.back(); }
    /// The point at a distance along the line, limited to its ends.
    QPointF At(double distance) const;

    const std::vector<QPointF>& Points() const { return m_points; }
    const std::vector<double>& Along() const { return m_along; } // from the first vertex, for each vertex
    const std::vector<Chunk>& Chunks() const { return m_chunks; }

private:
    std::vector<QPointF> m_points;
    std::vector<double> m_along;
    std::vector<Chunk> m_chunks;
};
