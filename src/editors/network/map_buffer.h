// The map as it was painted last.
#pragma once

#include "editors/network/map_painter.h"

#include <QPixmap>

/// Keeps the picture of a map without its marks: what moved is copied, and only what comes into sight is painted.
class CMapBuffer
{
public:
    /// The picture is to be painted anew; with another scene or style the names, too.
    void Invalidate() { m_valid = false; }
    void Clear();

    /// The picture of the scene as large as `size`, in device pixels; `offset` leads from the plane to the window.
    const QPixmap& Paint(const CMapScene& scene, const CMapStyle& style, int currentBranch, const QSize& size,
                         const QPoint& offset);

private:
    static constexpr int LabelMemory = 32 << 20; // bytes
    QPixmap m_picture;
    QPoint m_offset;
    CMapPainter::LabelPictures m_labels{LabelMemory}; // of the present scene
    bool m_valid = false;
};
