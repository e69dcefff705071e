#include "pages/framework/ctrl_edit.h"

#include "ks/fc/message_box.h"
#include "pages/framework/column_spec.h"
#include "pages/framework/digits_mark.h"
#include "pages/framework/number_syntax.h"
#include "res/strings.h"

#include <QKeyEvent>
#include <QPainter>
#include <QStyle>
#include <QTimer>
#include <algorithm>

CCtrlEdit::CCtrlEdit(QWidget* parent) : QLineEdit(parent)
{
    setAlignment(Qt::AlignRight);
    setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed); // a number needs no more room in a wide window
}

void CCtrlEdit::Setup(double* value, int textLimit, int decimals, bool generalNotation, UnitGroup group, int unit)
{
    m_textLimit = textLimit;
    m_decimals = decimals;
    m_generalNotation = generalNotation;
    m_group = group;
    m_unit = unit;
    m_style.SetEumUnitBaseGroup(group, unit);
    m_style.SetFormat((generalNotation ? QStringLiteral("%.%1g") : QStringLiteral("%-.%1E")).arg(decimals));
    setMaxLength(textLimit);
    m_value = value;
    ShowValue();
}

void CCtrlEdit::SetRange(bool hasMinimum, double minimum, bool hasMaximum, double maximum)
{
    m_hasMinimum = hasMinimum;
    m_minimum = minimum;
    m_hasMaximum = hasMaximum;
    m_maximum = maximum;
}

void CCtrlEdit::SetValue(double value)
{
    *m_value = value;
    ShowValue();
}

void CCtrlEdit::Show()
{
    if (!hasFocus() || !IsTyped())
        ShowValue();
    else
        UpdateToolTip(); // the unit may be another one
}

void CCtrlEdit::ShowValue()
{
    m_shown = m_style.ShownText(*m_value);
    setMaxLength(std::max(m_textLimit, int(m_shown.size()))); // a number is never cut
    if (text() != m_shown)
        setText(m_shown);
    setModified(false);
    UpdateToolTip();
}

void CCtrlEdit::UpdateToolTip()
{
    setToolTip(NumberToolTip(m_style, *m_value, m_shown, UnitSymbol()));
}

bool CCtrlEdit::Refuse(const QString& message)
{
    if (!m_warned) {
        m_warned = true; // one click may ask several times
        QTimer::singleShot(0, this, [this] { m_warned = false; });
        KsMessageBox(message, QMessageBox::Ok, this);
    }
    setFocus(Qt::OtherFocusReason);
    selectAll();
    return false;
}

bool CCtrlEdit::Commit()
{
    if (!m_value || !IsTyped())
        return true;
    if (text().isEmpty()) {
        ShowValue();
        return true;
    }
    const std::string typed = text().toStdString();
    if (!IsValidNumber(typed))
        return Refuse(LoadString(Str::InvalidNumber));
    const auto number = ReadNumber(typed);
    const double value = number ? m_style.UnitConvertFromBase(*number, 0) : 0;
    if (!number || (m_hasMinimum && value < m_minimum) || (m_hasMaximum && value > m_maximum))
        return Refuse(LoadString(Str::NumberOutOfRange));
    setModified(false); // storing reloads the page
    if (value != *m_value) {
        if (m_store)
            m_store(*m_value, value);
        else
            *m_value = value;
    }
    ShowValue();
    return true;
}

void CCtrlEdit::paintEvent(QPaintEvent* event)
{
    QLineEdit::paintEvent(event);
    if (!m_value || IsTyped() || !m_style.HidesDigits(*m_value, m_shown))
        return;
    QPainter painter(this);
    const int frame = style()->pixelMetric(QStyle::PM_DefaultFrameWidth, nullptr, this) + 1;
    PaintDigitsMark(painter, rect().adjusted(frame, frame, -frame, -frame), palette());
}

void CCtrlEdit::focusOutEvent(QFocusEvent* event)
{
    QLineEdit::focusOutEvent(event);
    // A menu or another window in front does not leave the field.
    if (event->reason() != Qt::PopupFocusReason && event->reason() != Qt::ActiveWindowFocusReason)
        Commit();
}

bool CCtrlEdit::event(QEvent* event)
{
    // With nothing of its own to undo the field leaves undo and redo to the document.
    if (event->type() == QEvent::ShortcutOverride) {
        const auto* key = static_cast<QKeyEvent*>(event);
        if ((key->matches(QKeySequence::Undo) || key->matches(QKeySequence::Redo)) && !IsTyped())
            return false;
    }
    return QLineEdit::event(event);
}

void CCtrlEdit::keyPressEvent(QKeyEvent* event)
{
    if ((event->matches(QKeySequence::Undo) || event->matches(QKeySequence::Redo)) && !IsTyped()) {
        event->ignore();
        return;
    }
    if (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter) {
        if (Commit())
            selectAll();
        return;
    }
    if (event->key() == Qt::Key_Escape && IsTyped()) {
        ShowValue();
        selectAll();
        return;
    }
    QLineEdit::keyPressEvent(event);
}
