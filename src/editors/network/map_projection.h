// Between map coordinates (metres, y to the north) and the pixels of a map window (y down).
#pragma once

#include <QPointF>
#include <QRectF>
#include <QSizeF>
#include <algorithm>
#include <cmath>

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
    /// Changes the scale while `window` keeps showing the same place.
    void ZoomAt(const QPointF& window, double newScale)
    {
        const QPointF map = ToMap(window);
        scale = newScale;
        offset = (window - ToPlane(map)).toPoint();
    }
    void CenterAt(const QPointF& map, const QRectF& window) { offset = (window.center() - ToPlane(map)).toPoint(); }
    /// Shows all of `extent` in a part of the window, with a margin of so many pixels and at most a scale.
    void Fit(const QRectF& extent, const QRectF& window, double margin, double mostScale)
    {
        const double width = std::max(window.width() - 2 * margin, 1.0);
        const double height = std::max(window.height() - 2 * margin, 1.0);
        if (extent.width() > 0 || extent.height() > 0)
            scale = std::min(extent.width() > 0 ? width / extent.width() : HUGE_VAL,
                             extent.height() > 0 ? height / extent.height() : HUGE_VAL);
        scale = std::min(scale, mostScale);
        CenterAt(extent.center(), window);
    }
};
