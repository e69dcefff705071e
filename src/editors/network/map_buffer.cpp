#include "editors/network/map_buffer.h"

#include <utility>

void CMapBuffer::Clear()
{
    m_labels.clear();
    m_valid = false;
}

const QPixmap& CMapBuffer::Paint(const CMapScene& scene, const CMapStyle& style, int currentBranch, const QSize& size,
                                 const QPoint& offset)
{
    if (m_picture.size() != size) {
        m_picture = QPixmap(size);
        m_valid = false;
    }
    m_picture.setDevicePixelRatio(1);
    const QPoint moved = offset - std::exchange(m_offset, offset);
    QRegion missing(m_picture.rect());
    if (std::exchange(m_valid, true) && m_picture.rect().translated(moved).intersects(m_picture.rect())) {
        missing = QRegion();
        if (!moved.isNull())
            m_picture.scroll(moved.x(), moved.y(), m_picture.rect(), &missing);
    }
    if (!missing.isEmpty()) {
        const CMapPainter map(scene, style, currentBranch, m_labels);
        QPainter painter(&m_picture);
        for (const QRect& part : missing)
            map.Paint(painter, part, offset);
    }
    m_picture.setDevicePixelRatio(scene.Ratio());
    return m_picture;
}
