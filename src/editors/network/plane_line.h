// A branch's line on the plane of one scale, thinned to what a pixel can show.
#pragma once

#include "editors/network/map_projection.h"
#include "editors/network/measured_line.h"

#include <QPolygonF>

class CPlaneLine : public CMeasuredLine
{
public:
    CPlaneLine(const std::vector<QPointF>& line, const CMapProjection& projection);

    /// The direction from so many pixels before a distance to as many behind it, of length 1.
    QPointF Direction(double distance, double span) const;
    /// The parts of the line that may show in `rect`.
    std::vector<QPolygonF> Clip(const QRectF& rect) const;
};
