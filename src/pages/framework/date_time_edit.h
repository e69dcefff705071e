// A field for a date and time in the user's locale.
#pragma once

#include "files/field.h"

#include <QLineEdit>
#include <optional>

class CDateTimeEdit : public QLineEdit
{
    Q_OBJECT
public:
    explicit CDateTimeEdit(QWidget* parent = nullptr);

    void SetValue(const HDDateTime& value);
    /// What the text means; nothing for a text that is no date and time. A text that nobody changed is the value set,
    /// be it a date or not.
    std::optional<HDDateTime> Value() const;
    /// Why the text is no date and time; empty when it is one.
    QString Complaint() const;
    /// A date and time is seen whole.
    QSize minimumSizeHint() const override;

private:
    HDDateTime m_value;
};
