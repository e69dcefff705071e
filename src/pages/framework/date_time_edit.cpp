#include "pages/framework/date_time_edit.h"

#include "ks/fc/message_box.h"
#include "pages/framework/date_time_text.h"

#include <QKeyEvent>
#include <QScopedValueRollback>
#include <QTimer>

CDateTimeEdit::CDateTimeEdit(QWidget* parent) : QLineEdit(parent) {}

void CDateTimeEdit::SetValue(const HDDateTime& value)
{
    m_value = value;
    const QString shown = DateTimeText(value);
    if (shown != text())
        setText(shown);
    setModified(false);
}

std::optional<HDDateTime> CDateTimeEdit::Value() const
{
    return text() == DateTimeText(m_value) ? m_value : ReadDateTime(text());
}

std::optional<HDDateTime> CDateTimeEdit::CheckedValue()
{
    const auto value = Value();
    if (!value && !m_telling) {
        const QScopedValueRollback telling(m_telling, true);
        KsMessageBox(DateTimeRefusal(text()), QMessageBox::Ok, this);
        setFocus(Qt::OtherFocusReason);
    }
    return value;
}

void CDateTimeEdit::focusOutEvent(QFocusEvent* event)
{
    QLineEdit::focusOutEvent(event);
    const bool elsewhere = event->reason() == Qt::ActiveWindowFocusReason || event->reason() == Qt::PopupFocusReason;
    if (!elsewhere && !m_telling && isModified() && isVisible() && !Value())
        QTimer::singleShot(0, this, &CDateTimeEdit::CheckedValue); // the focus has to arrive first to be taken back
}

void CDateTimeEdit::keyPressEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Escape && isModified())
        SetValue(m_value);
    else
        QLineEdit::keyPressEvent(event);
}
