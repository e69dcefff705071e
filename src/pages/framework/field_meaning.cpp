#include "pages/framework/field_meaning.h"

#include <QEvent>
#include <QPainter>
#include <QTextLayout>
#include <algorithm>
#include <utility>

namespace {

constexpr int LeastLetters = 12, UsualLetters = 40; // of a line
constexpr int MostLines = 4;
constexpr int Air = 5, LeastAir = 2; // pixels between the texts of two rows
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
    CountLines();
    update();
}

void CFieldMeaning::CountLines()
{
    if (!isVisible()) // the width is nobody's yet
        return;
    const int wanted = width() < LeastLetters * fontMetrics().averageCharWidth() ? 1 : int(Lines(MostLines).size());
    if (std::exchange(m_wanted, wanted) != wanted)
        updateGeometry();
}

void CFieldMeaning::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    CountLines();
}

void CFieldMeaning::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    CountLines(); // it has got its width before
}

QSize CFieldMeaning::sizeHint() const
{
    return {UsualLetters * fontMetrics().averageCharWidth(), m_wanted * fontMetrics().lineSpacing() + Air};
}

QSize CFieldMeaning::minimumSizeHint() const
{
    return {0, fontMetrics().lineSpacing()};
}

/// The last one says whether there is more.
QStringList CFieldMeaning::Lines(int most) const
{
    QStringList lines;
    QTextLayout layout(m_text, font());
    layout.beginLayout();
    for (QTextLine line = layout.createLine(); line.isValid() && lines.size() < most; line = layout.createLine()) {
        line.setLineWidth(width());
        const bool isLast = lines.size() + 1 == most;
        const QString text = m_text.mid(line.textStart(), isLast ? -1 : line.textLength()).trimmed();
        lines << (isLast ? fontMetrics().elidedText(text, Qt::ElideRight, width()) : text);
    }
    layout.endLayout();
    return lines;
}

void CFieldMeaning::paintEvent(QPaintEvent*)
{
    const QFontMetrics metrics = fontMetrics();
    if (width() < LeastLetters * metrics.averageCharWidth())
        return; // a word or two say nothing
    const QStringList lines = Lines(std::max(1, (height() - LeastAir) / metrics.lineSpacing()));
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
    if (event->type() == QEvent::FontChange) {
        CountLines();
        updateGeometry();
    }
    QWidget::changeEvent(event);
}
