#include "pages/framework/field_meaning.h"

#include <QEvent>
#include <QPainter>
#include <QTextLayout>
#include <algorithm>

namespace {

constexpr int UsualLines = 2, LeastLetters = 12, UsualLetters = 40; // letters of a line
constexpr float Strength = 0.75F; // of the text's color: the names of the fields come first

QSize RoomFor(const QFontMetrics& font, int letters, int lines)
{
    return {letters * font.averageCharWidth(), lines * font.lineSpacing()};
}

} // namespace

void CFieldMeaning::SetText(const QString& text)
{
    if (m_text == text)
        return;
    m_text = text;
    setAccessibleName(text);
    update();
}

QSize CFieldMeaning::sizeHint() const
{
    return RoomFor(fontMetrics(), UsualLetters, UsualLines);
}

QSize CFieldMeaning::minimumSizeHint() const
{
    return {0, RoomFor(fontMetrics(), 1, 1).height()};
}

void CFieldMeaning::paintEvent(QPaintEvent*)
{
    if (width() < RoomFor(fontMetrics(), LeastLetters, 1).width())
        return; // a word or two say nothing
    QTextLayout layout(m_text, font());
    const QFontMetrics metrics = fontMetrics();
    const int most = std::max(1, height() / metrics.lineSpacing());
    QStringList lines;
    layout.beginLayout();
    for (QTextLine line = layout.createLine(); line.isValid() && lines.size() < most; line = layout.createLine()) {
        line.setLineWidth(width());
        const bool isLast = lines.size() + 1 == most;
        const QString text = m_text.mid(line.textStart(), isLast ? -1 : line.textLength());
        lines << metrics.elidedText(text, Qt::ElideRight, width());
    }
    layout.endLayout();

    QPainter painter(this);
    QColor color = palette().color(QPalette::WindowText);
    if (isEnabled())
        color.setAlphaF(Strength);
    painter.setPen(color);
    const int top = std::max(0, (height() - int(lines.size()) * metrics.lineSpacing()) / 2);
    for (int i = 0; i < lines.size(); ++i)
        painter.drawText(0, top + i * metrics.lineSpacing() + metrics.ascent(), lines[i]);
}

void CFieldMeaning::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::FontChange)
        updateGeometry();
    QWidget::changeEvent(event);
}
