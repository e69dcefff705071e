// A branch's line on the plane of one scale, thinned to what a pixel can show.
#pragma once

#include "editors/network/map_projection.h"

#include <QPolygonF>
#include <vector>

class CPlaneLine
{
public:
    CPlaneLine(const std::vector<QPointF>& line, const CMapProjection& projection);

    bool IsEmpty() const { return m_along.size() < 2; }
    double Length() const { return m_along.empty() ? 0 : m_along.back(); } // pixels
    /// The point at a distance along the line, limited to its ends.
    QPointF At(double distance) const;
    /// The direction from so many pixels before a distance to as many behind it, of length 1.
    QPointF Direction(double distance, double span) const;
    /// The parts of the line that may show in `rect`.
    void Clip(const QRectF& rect, std::vector<QPolygonF>& parts) const;

private:
    void Simplify(const QPolygonF& all);
    QPolygonF m_points;
    std::vector<double> m_along;
    std::vector<QRectF> m_boxes; // of so many segments each
};
