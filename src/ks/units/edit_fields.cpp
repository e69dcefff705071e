#include "ks/units/edit_fields.h"

#include "files/read_number.h"
#include "ks/fc/message_box.h"

namespace {

void Refuse(QLineEdit& edit, const CString& message)
{
    KsMessageBox(message, QMessageBox::Ok, &edit);
    edit.setFocus();
    edit.selectAll();
}

} // namespace

CKsEditLong::CKsEditLong(QWidget* parent) : QLineEdit(parent)
{
    setMaxLength(20); // room for a number that is too large, so that the message can say so
}

void CKsEditLong::SetValue(std::int32_t value)
{
    setText(CString::number(value));
}

std::optional<std::int32_t> CKsEditLong::Value() const
{
    return Complaint().isEmpty() ? ReadInteger(text().toStdString()) : std::nullopt;
}

CString CKsEditLong::Complaint() const
{
    const auto value = ReadInteger(text().toStdString());
    return !value                     ? tr("Enter an integer.")
           : m_range.Contains(*value) ? CString()
                                      : tr("Enter an integer from %1 to %2.").arg(m_range.low).arg(m_range.high);
}

std::optional<std::int32_t> CKsEditLong::CheckedValue()
{
    const auto value = Value();
    if (!value)
        Refuse(*this, Complaint());
    return value;
}

bool DDX_KSedit(bool save, QLineEdit& edit, double& value, const CKsEditStyle& style)
{
    if (!save) {
        edit.setText(KsFormatNumber(style.GetFormat(), value));
        edit.setToolTip(style.GetEumToolTipText());
        return true;
    }
    if (edit.text().isEmpty())
        return true;
    const auto number = ReadNumber(edit.text().toStdString());
    if (!number) {
        Refuse(edit, CKsEditLong::tr("Enter a number."));
        return false;
    }
    value = *number;
    return true;
}
