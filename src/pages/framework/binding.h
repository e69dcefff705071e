// Controls bound to values of the document, and rules that enable and show them. The document is written as soon as the
// user has changed a control, each change being an undo step; nothing is written that nobody changed.
//
// A control says what its value is called as the value's declaration does, in the user's language: a check box by its
// own text, any other by a label in the cell to its left. The unit of a number stands in the cell to its right. Fields
// and lists are as wide as what they hold, whatever the window's width. Lists and radio buttons have the declared
// choices. Tool tips tell what the value means, its range and default.
#pragma once

#include "files/field.h"
#include "grid/typing.h"
#include "pages/framework/file_browse.h"

#include <QObject>
#include <cstdint>
#include <functional>
#include <initializer_list>
#include <map>
#include <string>
#include <vector>

class CCtrlEdit;
class CDateTimeEdit;
class CKavo0_hdDoc;
class CKsEditLong;
struct DeclaredKeyword;
class QCheckBox;
class QComboBox;
class QLineEdit;
class QRadioButton;
class QWidget;

/// What depends on a setting and so is more than a number's declaration says.
struct FieldOptions
{
    std::function<QString()> unitText = {}; // symbol of the unit
    std::function<Str()> title = {};
};

/// Assistive programs are told of every setting, so of a new name only.
void SetAccessibleName(QWidget& widget, const QString& name);

class CBindings : public QObject
{
public:
    explicit CBindings(CKavo0_hdDoc* document) : m_document(document) {}

    /// Of the values that are added from now on the meaning stands beside the field, behind the unit: there is room for
    /// it.
    void TellMeanings(bool tell = true) { m_tellsMeanings = tell; }

    // Each value lives in the document, which outlives the page.
    void Add(CCtrlEdit* field, double& value, const FieldOptions& options = {});
    void Add(CKsEditLong* field, std::int32_t& value);
    void Add(QLineEdit* field, std::string& value);
    void Add(CGeoFileEdit* field, std::string& value, const FileKind& kind);
    void Add(CDateTimeEdit* field, HDDateTime& value);
    /// `consequences` of a click are part of the same undo step.
    void Add(QCheckBox* box, bool& value, std::function<void(bool checked)> consequences = {});
    /// By index of the entry. An index without an entry is kept, and shown as its number.
    void Add(QComboBox* box, std::int32_t& index);
    /// Likewise; `choose` is what the user's choice of an entry does. The list then shows what the document has.
    void Add(QComboBox* box, std::int32_t& index, std::function<void(std::int32_t chosen)> choose);
    /// Button n stands for the value n. Another value is kept, with no button pressed.
    void Add(std::initializer_list<QRadioButton*> buttons, std::int32_t& value);
    /// A list that stands for no value: whatever is chosen, it shows its first entry when the page is shown afresh.
    void AddUnbound(QComboBox* box);

    /// The widgets, with label and unit beside them, are enabled, or visible, exactly while the rule holds; it is asked
    /// whenever the page is shown afresh.
    void EnableWhen(std::function<bool()> rule, std::initializer_list<QWidget*> widgets);
    void ShowWhen(std::function<bool()> rule, std::initializer_list<QWidget*> widgets);
    /// A rule of another kind, that applies already.
    void Always(std::function<void()> rule);

    /// Controls show the document's values, and the rules apply.
    void Show();
    /// The rules apply: after a change of the document, or of the language.
    void ApplyRules();
    /// Takes what was typed; false when a field refuses it (the user has been told).
    bool Take();
    /// Likewise while the page stays: a text that may wait for the page is let be.
    bool TakeField();
    /// Whether a click on this button would disable or hide a field that is being typed into: what was typed is then
    /// nobody's value any more.
    bool TakesFieldAway(const QObject* button) const;
    /// How the value at this address is declared; says nothing for one that is none of the global ones.
    const Field& Declaration(const void* value) const;
    /// The control of the value at this address, of several one that can be used now; null for a value of other pages.
    QWidget* ControlFor(const void* value) const;

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    struct Control
    {
        QWidget* widget;
        const void* value; // null for none
        std::function<void()> show;
    };
    const DeclaredKeyword* KeywordOf(const void* value) const;
    QString ToolTip(const void* value, const QString& number, const QString& unit) const;
    void Add(QWidget* control, const void* value, std::function<void()> show);
    void AddTyped(QLineEdit* field, const void* value, TypedField what);
    template <typename T>
    void Store(T& target, T value);
    void AddMeaning(QWidget* control, const void* value);
    void AddLabel(QWidget* control, const void* value, std::function<Str()> title = {});
    void AddRule(std::function<bool()> rule, std::initializer_list<QWidget*> widgets, void (QWidget::*apply)(bool));

    CKavo0_hdDoc* m_document;
    std::vector<Control> m_controls;
    std::vector<CTyping*> m_typed; // children of their fields
    std::vector<std::function<void()>> m_rules;
    struct Condition // of a rule
    {
        std::function<bool()> holds;
        std::vector<QWidget*> widgets;
    };
    std::vector<Condition> m_conditions;
    // Gives a button's value what a click would give it; called again, what it was.
    std::map<const QObject*, std::function<void()>> m_trials;
    std::multimap<const QWidget*, QWidget*> m_beside; // label, unit and meaning of a control
    bool m_tellsMeanings = false;
};
