// Paints a scene into a part of a window, in device pixels.
#pragma once

#include "editors/network/map_scene.h"
#include "editors/network/map_style.h"

#include <QCache>
#include <QPainter>

class CMapPainter
{
public:
    /// Names that were painted already, by their place in the scene; turned outlines are slow to fill. The cost is
    /// bytes. Empty it when the scene or the style changes.
    using LabelPictures = QCache<std::size_t, QPixmap>;

    CMapPainter(const CMapScene& scene, const CMapStyle& style, int currentBranch, LabelPictures& pictures);

    /// `part` is in window pixels; `offset` leads from the plane to the window.
    void Paint(QPainter& painter, const QRect& part, const QPoint& offset) const;

private:
    void PaintLines(QPainter& painter, const QRectF& part) const;
    void PaintArrows(QPainter& painter, const QRectF& part) const;
    void PaintSymbols(QPainter& painter, const QRectF& part) const;
    void PaintLabels(QPainter& painter, const QRectF& part) const;
    void PaintLabel(QPainter& painter, const CMapScene::Label& label, const QColor& colour) const;
    QPixmap LabelPicture(std::size_t label, const QRect& box) const;

    const CMapScene& m_scene;
    const CMapStyle& m_style;
    int m_currentBranch;
    LabelPictures& m_pictures;
    std::array<QPixmap, HDDataTypeCount> m_symbols;
};
