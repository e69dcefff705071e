// The single-value field: a number of the document, shown in the user's unit.
#pragma once

#include "files/field.h"
#include "grid/typing.h"
#include "ks/units/typed_number.h"

#include <QLineEdit>
#include <functional>

class CCtrlEdit : public QLineEdit
{
    Q_OBJECT
public:
    explicit CCtrlEdit(QWidget* parent = nullptr);

    /// Shows a number of the document, in base units, as it is declared. `store` gets what the user makes of it.
    void Setup(const double& value, const Field& declared, std::function<void(double value)> store);
    /// The page goes; the field lets the value be.
    void Unbind() { m_value = nullptr; }

    /// What the tool tip says, given the line or two about the number and its unit.
    void SetToolTipText(std::function<QString(const QString& number)> text) { m_toolTipText = std::move(text); }
    /// Symbol of a unit that depends on a setting, instead of the unit group's.
    void SetUnitText(std::function<QString()> text) { m_unitText = std::move(text); }
    QString UnitSymbol() const { return m_unitText ? m_unitText() : m_style.UnitSymbol(); }

    /// Shows the bound value and unit as they are now. A text being typed stays.
    void Show();
    /// Takes the text when the field is left. It is refused when it is no number or out of range; the user has been
    /// told, the field has the focus and the value is what it was. A text that nobody changed changes nothing.
    CTyping& Typing() const { return *m_typing; }
    /// "Theta: 0.123456789", where the field shows fewer digits than the number has; empty otherwise.
    QString FullText() const;
    /// Room for a small number: "0.031125".
    QSize minimumSizeHint() const override;
    QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    bool HidesDigits() const;
    int WidthBeside() const;
    void ShowValue();
    void UpdateToolTip();
    void Store();
    KsTyped<double> Typed() const; // in base units
    QString Complaint() const;

    CKsEditStyle m_style;
    const double* m_value = nullptr;
    Bounds m_bounds;
    std::function<void(double)> m_store;
    std::function<QString()> m_unitText;
    std::function<QString(const QString& number)> m_toolTipText;
    QString m_shown;   // the value as text
    CTyping* m_typing; // child
};
