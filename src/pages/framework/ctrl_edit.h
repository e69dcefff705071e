// The single-value field: a number of the document, shown in the user's unit.
#pragma once

#include "ks/units/edit_style.h"
#include "grid/typing.h"

#include <QLineEdit>
#include <functional>
#include <optional>

class CCtrlEdit : public QLineEdit
{
    Q_OBJECT
public:
    explicit CCtrlEdit(QWidget* parent = nullptr);

    /// Binds the field to a number of the document, in base units, and shows it. `decimals` are significant digits in
    /// general notation and digits behind the point in scientific notation. `unit` below 0 is the user's unit.
    void Setup(double* value, int textLimit, int decimals, bool generalNotation, UnitGroup group, int unit = -1);
    /// Bounds of what may be typed, in base units.
    void SetRange(bool hasMinimum, double minimum, bool hasMaximum, double maximum);
    /// The page goes; the field lets the value be.
    void Unbind() { m_value = nullptr; }
    /// How an accepted number gets into the document; without it the bound value is simply set.
    void SetStore(std::function<void(double& target, double value)> store) { m_store = std::move(store); }

    /// Symbol of a unit that depends on a setting, instead of the unit group's.
    void SetUnitText(std::function<QString()> text) { m_unitText = std::move(text); }
    QString UnitSymbol() const { return m_unitText ? m_unitText() : m_style.UnitSymbol(); }

    /// Stores into the bound value and shows it.
    void SetValue(double value);
    /// Shows the bound value and unit as they are now. A text being typed stays.
    void Show();
    const CKsEditStyle& Style() const { return m_style; }

    /// Leaving the field: takes the text. False when it is no number or out of range; the user has been told, the field
    /// has the focus and the value is what it was. A text that nobody changed changes nothing.
    bool Commit() { return m_typing->Take(); }
    CTyping& Typing() const { return *m_typing; }

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void ShowValue();
    void UpdateToolTip();
    void Store();
    std::optional<double> Typed() const; // in base units; nothing for a text that is no number
    bool InRange(double value) const;
    QString Complaint() const;
    QString Allowed() const;

    CKsEditStyle m_style;
    UnitGroup m_group = UnitGroup(999);
    int m_unit = -1;
    int m_textLimit = 0, m_decimals = 0;
    bool m_generalNotation = true;
    double* m_value = nullptr;
    bool m_hasMinimum = false, m_hasMaximum = false;
    double m_minimum = 0, m_maximum = 0;
    std::function<void(double&, double)> m_store;
    std::function<QString()> m_unitText;
    QString m_shown;   // the value as text
    CTyping* m_typing; // child
};
