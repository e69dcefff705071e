#include "pages/framework/date_time_edit.h"

#include "grid/date_time_text.h"

CDateTimeEdit::CDateTimeEdit(QWidget* parent) : QLineEdit(parent) {}

void CDateTimeEdit::SetValue(const HDDateTime& value)
{
    m_value = value;
    const QString shown = DateTimeText(value);
    if (shown != text())
        setText(shown);
}

std::optional<HDDateTime> CDateTimeEdit::Value() const
{
    return text() == DateTimeText(m_value) ? m_value : ReadDateTime(text());
}

QString CDateTimeEdit::Complaint() const
{
    return Value() ? QString() : DateTimeRefusal(text());
}

QSize CDateTimeEdit::minimumSizeHint() const
{
    constexpr int beside = 16; // frame and margins
    const int longest = fontMetrics().horizontalAdvance(DateTimeText({2028, 12, 28, 20, 48, 48}));
    return {longest + beside, QLineEdit::minimumSizeHint().height()};
}
