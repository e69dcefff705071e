// The map as it was painted last.
#pragma once

#include "editors/network/map_scene.h"
#include "editors/network/map_style.h"

#include <QCache>
#include <QPixmap>

/// Names that were painted already, by their place in the scene; turned outlines are slow to fill. The cost is bytes.
using LabelPictures = QCache<std::size_t, QPixmap>;

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
    LabelPictures m_labels{LabelMemory}; // of the present scene
    bool m_valid = false;
};
