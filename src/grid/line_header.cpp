#include "grid/line_header.h"

#include "grid/grid_model.h"
#include "grid/saved_mark.h"

#include <QMouseEvent>
#include <QPainter>

CLineHeader::CLineHeader(const CGridModel& model, QWidget* grid) : QHeaderView(Qt::Vertical, grid), m_model(model)
{
    setSectionsClickable(true);
    connect(&model, &QAbstractItemModel::dataChanged, this, &CLineHeader::ShowMarks);
    connect(&model, &CGridModel::NotesChanged, viewport(), qOverload<>(&QWidget::update));
}

/// A click close to the border of a line is one on the line, which the base would take for the wish to make it higher.
void CLineHeader::mousePressEvent(QMouseEvent* event)
{
    const int line = logicalIndexAt(event->position().toPoint());
    const QPointF middle(event->position().x(), sectionViewportPosition(line) + sectionSize(line) / 2.0);
    QMouseEvent press(QEvent::MouseButtonPress, middle, event->scenePosition(), event->globalPosition(),
                      event->button(), event->buttons(), event->modifiers(), event->pointingDevice());
    QHeaderView::mousePressEvent(line < 0 ? event : &press);
}

/// Two clicks with a key between them, which deletes lines, say, are two clicks.
void CLineHeader::mouseDoubleClickEvent(QMouseEvent* event)
{
    mousePressEvent(event);
}

void CLineHeader::paintSection(QPainter* painter, const QRect& rect, int row) const
{
    painter->save(); // a style may leave it clipped
    QHeaderView::paintSection(painter, rect, row);
    painter->restore();
    PaintLineMark(*painter, rect, palette(), m_model.Saved().MarkOf(row));
    constexpr int left = 10; // beside the mark
    if (const LineNote* note = m_model.NoteOf(row))
        note->icon.paint(painter, QRect(rect.left() + left, rect.top(), rect.height() / 2, rect.height()));
}

/// Where no step was made the numbers stay as they are painted.
void CLineHeader::ShowMarks()
{
    const std::pair now(m_model.Saved().Version(), m_model.HasTyped());
    if (std::exchange(m_shown, now) != now || now.second)
        viewport()->update();
}
