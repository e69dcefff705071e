// Between map coordinates (metres, y to the north) and the pixels of a map window (y down).
#pragma once

#include <QPointF>
#include <QRectF>

struct CNetwork;

/// A pixel is one of the device. The plane is the whole map at the present scale; a window shows the part of it that
/// begins at -offset. Everything drawn is computed on the plane, so that moving the window moves it as a whole.
struct CMapProjection
{
    QPointF origin;   // map coordinates of the plane's zero: near the data, so that numbers stay small
    double scale = 1; // pixels a metre
    QPoint offset;    // from the plane to the window, whole pixels

    QPointF ToPlane(const QPointF& map) const
    {
        return {(map.x() - origin.x()) * scale, (origin.y() - map.y()) * scale};
    }
    QPointF ToWindow(const QPointF& map) const { return ToPlane(map) + offset; }
    QPointF ToMap(const QPointF& window) const
    {
        const QPointF plane = window - offset;
        return {origin.x() + plane.x() / scale, origin.y() - plane.y() / scale};
    }
    /// Shows the whole network: in the whole window, or, when the legend would cover branches, in the larger part
    /// beside it; but the legend rather covers something than that the network becomes small. `ratio`: device pixels a
    /// pixel of the user's.
    void Fit(const CNetwork& network, const QRectF& window, const QRectF& legend, double ratio);
    /// Zooms around a point of the window, not farther out than half of what shows everything.
    void Zoom(const CNetwork& network, const QRectF& window, const QPointF& at, double factor, double ratio);
};
