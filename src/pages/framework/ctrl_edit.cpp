#include "pages/framework/ctrl_edit.h"

#include "files/read_number.h"
#include "grid/bounds.h"
#include "grid/column_spec.h"
#include "grid/digits_mark.h"
#include "ks/units/edit_fields.h"
#include "res/strings.h"

#include <QPainter>
#include <QStyle>
#include <QStyleOptionFrame>
#include <algorithm>

namespace {

constexpr int UsualDigits = 6, TextLimit = 20;

} // namespace

CCtrlEdit::CCtrlEdit(QWidget* parent)
    : QLineEdit(parent),
      m_typing(new CTyping(this, {.complaint = [this] { return Complaint(); },
                                  .store = [this] { Store(); },
                                  .show = [this] { ShowValue(); },
                                  .allowed = [this] { return BoundsText(m_bounds, m_style); },
                                  .unit = [this] { return UnitSymbol(); }}))
{
    setAlignment(Qt::AlignRight);
    setSizePolicy(QSizePolicy::Maximum, QSizePolicy::Fixed);
}

void CCtrlEdit::Setup(const double& value, const Field& declared, std::function<void(double value)> store)
{
    m_style = CKsEditStyle(declared.unit);
    m_style.SetFormat(QStringLiteral("%.%1g").arg(declared.digits ? declared.digits : UsualDigits));
    m_bounds = declared.bounds;
    m_store = std::move(store);
    m_value = &value;
    ShowValue();
}

void CCtrlEdit::Show()
{
    if (!hasFocus() || !m_typing->IsTyped())
        ShowValue();
    else
        UpdateToolTip(); // the unit may be another one
}

void CCtrlEdit::ShowValue()
{
    if (!m_value) // the page has gone
        return;
    m_shown = m_style.ShownText(*m_value);
    setMaxLength(std::max(TextLimit, int(m_shown.size()))); // a number is never cut
    if (text() != m_shown)
        setText(m_shown);
    if (!hasFocus())
        setCursorPosition(0); // should the field be too narrow, the leading digits are those in sight
    m_typing->Shown();
    UpdateToolTip();
}

/// Because the number is rounded, or because the field has no room for all of it.
bool CCtrlEdit::HidesDigits() const
{
    return m_value && (m_style.HidesDigits(*m_value, m_shown) ||
                       fontMetrics().horizontalAdvance(m_shown) > width() - WidthBeside());
}

/// What frame and margins take.
int CCtrlEdit::WidthBeside() const
{
    constexpr int margins = 2 * 2; // that a line edit leaves beside its text
    QStyleOptionFrame option;
    initStyleOption(&option);
    return width() - style()->subElementRect(QStyle::SE_LineEditContents, &option, this).width() + margins;
}

QSize CCtrlEdit::minimumSizeHint() const
{
    const int number = fontMetrics().horizontalAdvance(QStringLiteral("0.031125"));
    return {number + WidthBeside(), QLineEdit::minimumSizeHint().height()};
}

QSize CCtrlEdit::sizeHint() const
{
    return KsNumberFieldSize(*this);
}

QString CCtrlEdit::FullText() const
{
    return HidesDigits()
               ? QStringLiteral("%1: %2").arg(accessibleName(), NumberText(m_style.FullText(*m_value), UnitSymbol()))
               : QString();
}

void CCtrlEdit::UpdateToolTip()
{
    const QString number = NumberToolTip(m_style, *m_value, HidesDigits(), UnitSymbol());
    setToolTip(m_toolTipText ? m_toolTipText(number) : number);
}

void CCtrlEdit::resizeEvent(QResizeEvent* event)
{
    QLineEdit::resizeEvent(event);
    if (m_value)
        UpdateToolTip();
}

KsTyped<double> CCtrlEdit::Typed() const
{
    return KsReadTyped(text(), m_style, UnitSymbol());
}

/// An empty text is none: the value stays.
QString CCtrlEdit::Complaint() const
{
    if (!m_value || text().isEmpty())
        return {};
    const auto typed = Typed();
    if (typed.value)
        return m_bounds.Allow(*typed.value) ? QString() : OutOfRange();
    if (!typed.complaint.isEmpty())
        return typed.complaint;
    return IsValidNumber(text().toStdString()) ? OutOfRange() : LoadString(Str::InvalidNumber); // too large for one
}

void CCtrlEdit::Store()
{
    const auto value = m_value && !text().isEmpty() ? Typed().value : std::nullopt;
    if (value && *value != *m_value)
        m_store(*value);
}

void CCtrlEdit::paintEvent(QPaintEvent* event)
{
    QLineEdit::paintEvent(event);
    if (m_typing->IsTyped() || !HidesDigits())
        return;
    QPainter painter(this);
    const int frame = style()->pixelMetric(QStyle::PM_DefaultFrameWidth, nullptr, this) + 1;
    PaintDigitsMark(painter, rect().adjusted(frame, frame, -frame, -frame), palette());
}
