#include "ks/units/edit_fields.h"

#include "files/read_number.h"
#include "ks/fc/message_box.h"
#include "ks/units/typed_number.h"

namespace {

void Refuse(QLineEdit& edit, const CString& message)
{
    KsMessageBox(message, QMessageBox::Ok, &edit);
    edit.setFocus();
    edit.selectAll();
}

/// Gives a field's hint the color of its text, but paler, whatever colors the program has.
class HintColor : public QObject
{
public:
    explicit HintColor(QLineEdit& field) : QObject(&field), m_field(field)
    {
        field.installEventFilter(this);
        Apply();
    }
    bool eventFilter(QObject*, QEvent* event) override
    {
        if (event->type() == QEvent::PaletteChange || event->type() == QEvent::StyleChange)
            Apply();
        return false;
    }

private:
    void Apply()
    {
        QPalette colors = m_field.palette();
        QColor color = colors.color(QPalette::Text);
        color.setAlphaF(0.6F);
        if (colors.color(QPalette::PlaceholderText) == color)
            return;
        colors.setColor(QPalette::PlaceholderText, color);
        m_field.setPalette(colors);
    }
    QLineEdit& m_field;
};

} // namespace

QSize KsNumberFieldSize(const QLineEdit& field)
{
    constexpr int beside = 16; // frame and margins
    const int number = field.fontMetrics().horizontalAdvance(QStringLiteral("-1.23456e-05"));
    return {number + beside, field.minimumSizeHint().height()};
}

void KsShowHint(QLineEdit& field, const QString& hint)
{
    const auto isColor = [](const QObject* child) { return dynamic_cast<const HintColor*>(child); };
    if (std::ranges::none_of(field.children(), isColor))
        new HintColor(field);
    field.setPlaceholderText(hint);
}

CKsEditLong::CKsEditLong(QWidget* parent) : QLineEdit(parent)
{
    setAlignment(Qt::AlignRight);
    setSizePolicy(QSizePolicy::Maximum, QSizePolicy::Fixed);
    setMaxLength(20); // room for a number that is too large, so that the message can say so
}

void CKsEditLong::SetValue(std::int32_t value)
{
    setText(CString::number(value));
}

std::optional<std::int32_t> CKsEditLong::Value() const
{
    return Complaint().isEmpty() ? KsReadTypedInteger(text()).value : std::nullopt;
}

CString CKsEditLong::Complaint() const
{
    const auto typed = KsReadTypedInteger(text());
    if (!typed.value)
        return typed.complaint.isEmpty() ? tr("Enter an integer.") : typed.complaint;
    return m_range.Contains(*typed.value) ? CString()
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
    const auto typed = KsReadTyped(edit.text(), style);
    if (!typed.value) {
        Refuse(edit, typed.complaint.isEmpty() ? CKsEditLong::tr("Enter a number.") : typed.complaint);
        return false;
    }
    value = ReadNumber(edit.text().toStdString()).value_or(style.UnitConvertFromBase(*typed.value, 1));
    return true;
}
