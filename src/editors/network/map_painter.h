// Paints a scene into a part of a window, in device pixels.
#pragma once

#include "editors/network/map_scene.h"
#include "editors/network/map_style.h"

#include <QPainter>

class CMapPainter
{
public:
    CMapPainter(const CMapScene& scene, const CMapStyle& style, int currentBranch);

    /// `part` is in window pixels; `offset` leads from the plane to the window.
    void Paint(QPainter& painter, const QRect& part, const QPoint& offset) const;

private:
    void PaintLines(QPainter& painter, const QRectF& part) const;
    void PaintArrows(QPainter& painter, const QRectF& part) const;
    void PaintSymbols(QPainter& painter, const QRectF& part) const;
    void PaintLabels(QPainter& painter, const QRectF& part) const;

    const CMapScene& m_scene;
    const CMapStyle& m_style;
    int m_currentBranch;
    std::array<QPixmap, HDDataTypeCount> m_symbols;
};
