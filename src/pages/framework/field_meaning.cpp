#include "pages/framework/field_meaning.h"

#include <QEvent>
#include <QPainter>
#include <QTextLayout>
#include <algorithm>

namespace {

constexpr int UsualLines = 2, LeastLetters = 12, UsualLetters = 40; // letters of a line
constexpr int Air = 3;                                              // pixels between the texts of two rows
// The names of the fields come first: of their color and of their font.
constexpr float Strength = 0.75F;
constexpr double Size = 0.88;

} // namespace

CFieldMeaning::CFieldMeaning(QWidget* parent) : QWidget(parent)
{
    QFont small = font();
    if (small.pointSizeF() > 0)
        small.setPointSizeF(Size * small.pointSizeF());
    setFont(small);
}

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
    return {UsualLetters * fontMetrics().averageCharWidth(), UsualLines * fontMetrics().lineSpacing() + Air};
}

QSize CFieldMeaning::minimumSizeHint() const
{
    return {0, fontMetrics().lineSpacing()};
}

/// As many as there is room for; the last one says whether there is more.
QStringList CFieldMeaning::Lines() const
{
    const int most = std::max(1, height() / fontMetrics().lineSpacing());
    QStringList lines;
    QTextLayout layout(m_text, font());
    layout.beginLayout();
    for (QTextLine line = layout.createLine(); line.isValid() && lines.size() < most; line = layout.createLine()) {
        line.setLineWidth(width());
        const bool isLast = lines.size() + 1 == most;
        const QString text = m_text.mid(line.textStart(), isLast ? -1 : line.textLength());
        lines << fontMetrics().elidedText(text, Qt::ElideRight, width());
    }
    layout.endLayout();
    return lines;
}

void CFieldMeaning::paintEvent(QPaintEvent*)
{
    const QFontMetrics metrics = fontMetrics();
    if (width() < LeastLetters * metrics.averageCharWidth())
        return; // a word or two say nothing
    const QStringList lines = Lines();
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
