#include "pages/framework/binding.h"

#include "data/global_var.h"
#include "document/document.h"
#include "document/store_value.h"
#include "ks/units/edit_fields.h"
#include "pages/framework/ctrl_edit.h"
#include "pages/framework/date_time_edit.h"
#include "res/strings.h"

#include <QButtonGroup>
#include <QCheckBox>
#include <QComboBox>
#include <QKeyEvent>
#include <QLabel>
#include <QRadioButton>
#include <QUndoStack>
#include <algorithm>

namespace {

constexpr int UsualDigits = 6;

/// The declaration of a global value; one without a name for a number that is none.
Field Declaration(const HD_Global_Var& globals, const double& value)
{
    for (const GlobalSection& section : HDGlobalSections())
        for (const GlobalKeyword& keyword : section.keywords)
            for (const Field& field : keyword.Fields())
                if (field.constAddress(&globals) == &value)
                    return field;
    return {};
}

} // namespace

template <typename T>
void CBindings::Store(T& target, T value)
{
    StoreValue(*m_document, target, value);
    ApplyRules();
}

void CBindings::ApplyRules()
{
    for (const auto& rule : m_rules)
        rule();
}

void CBindings::Add(QWidget* control, const void* value, std::function<void()> show)
{
    m_controls.push_back({control, value, std::move(show)});
}

void CBindings::AddTyped(QLineEdit* field, const void* value, TypedField what)
{
    auto* typing = new CTyping(field, std::move(what));
    m_typed.push_back(typing);
    Add(field, value, [typing] {
        if (!typing->IsTyped()) // a text that has not been taken yet stays
            typing->Revert();
    });
}

QWidget* CBindings::ControlFor(const void* value) const
{
    QWidget* found = nullptr;
    for (const Control& control : m_controls) {
        const auto* button = qobject_cast<const QRadioButton*>(control.widget);
        const bool isBest = control.widget->isEnabled() && (!button || button->isChecked());
        if (control.value == value && (isBest || !found))
            found = control.widget;
    }
    return found;
}

void CBindings::Add(CCtrlEdit* field, double& value, const FieldOptions& options)
{
    const Field declared = Declaration(m_document->Parameters().Global, value);
    field->Setup(&value, options.textLimit, declared.digits ? declared.digits : UsualDigits, true, declared.unit);
    field->SetRange(declared.minimum.has_value(), declared.minimum.value_or(0), declared.maximum.has_value(),
                    declared.maximum.value_or(0));
    field->SetUnitText(options.unitText);
    field->SetStore([this](double& target, double number) { Store(target, number); });
    m_typed.push_back(&field->Typing());
    Add(field, &value, [field, label = options.unitLabel] {
        field->Show();
        if (label)
            label->setText(field->UnitSymbol());
    });
}

void CBindings::Add(CKsEditLong* field, std::int32_t& value)
{
    field->setAlignment(Qt::AlignRight); // as the other numbers
    AddTyped(field, &value,
             {.complaint = [field] { return field->Complaint(); },
              .store = [this, field, &value] { Store(value, *field->Value()); },
              .show = [field, &value] { field->SetValue(value); },
              .waitsForPage = true});
}

void CBindings::Add(QLineEdit* field, std::string& value)
{
    AddTyped(field, &value,
             {.store = [this, field, &value] { Store(value, field->text().toStdString()); },
              .show =
                  [field, &value] {
                      const QString text = QString::fromStdString(value);
                      if (field->text() != text)
                          field->setText(text);
                  }});
}

void CBindings::Add(CGeoFileEdit* field, std::string& value, const FileKind& kind)
{
    field->SetUp(*m_document, kind);
    Add(field->Field(), value);
    connect(field, &CGeoFileEdit::Chosen, this,
            [this, field, &value] { Store(value, field->Field()->text().toStdString()); });
}

void CBindings::Add(CDateTimeEdit* field, HDDateTime& value)
{
    AddTyped(field, &value,
             {.complaint = [field] { return field->Complaint(); },
              .store = [this, field, &value] { Store(value, *field->Value()); },
              .show = [field, &value] { field->SetValue(value); }});
}

template <typename T>
void CBindings::AddFlag(QCheckBox* box, T& value, std::function<void(bool checked)> consequences)
{
    Add(box, &value, [box, &value] { box->setChecked(value != T(0)); });
    connect(box, &QCheckBox::clicked, this, [this, &value, consequences](bool checked) {
        if (!consequences)
            return Store(value, T(checked));
        QUndoStack& steps = m_document->UndoStack();
        steps.beginMacro(LoadString(Str::UndoValue));
        Store(value, T(checked));
        consequences(checked);
        steps.endMacro();
    });
}

void CBindings::Add(QCheckBox* box, bool& value, std::function<void(bool checked)> consequences)
{
    AddFlag(box, value, std::move(consequences));
}

void CBindings::Add(QCheckBox* box, std::int32_t& flag)
{
    AddFlag(box, flag);
}

void CBindings::Add(QComboBox* box, std::int32_t& index)
{
    Add(box, index, [this, &index](std::int32_t chosen) { Store(index, chosen); });
}

void CBindings::Add(QComboBox* box, std::int32_t& index, std::function<void(std::int32_t chosen)> choose)
{
    const int entries = box->count();
    box->setFocusPolicy(Qt::StrongFocus); // not by the wheel
    box->installEventFilter(this);
    const auto show = [box, entries, &index] {
        while (box->count() > entries)
            box->removeItem(entries);
        if (index < 0 || index >= entries)
            box->addItem(QString::number(index));
        box->setCurrentIndex(index >= 0 && index < entries ? index : entries);
    };
    Add(box, &index, show);
    connect(box, &QComboBox::activated, this, [entries, show, choose = std::move(choose)](int chosen) {
        if (chosen < entries)
            choose(std::int32_t(chosen));
        show();
    });
}

void CBindings::Add(std::initializer_list<QRadioButton*> buttons, std::int32_t& value)
{
    auto* group = new QButtonGroup(this);
    int id = 0;
    for (QRadioButton* button : buttons) {
        Add(button, &value, [] {}); // shown by its group
        group->addButton(button, id++);
    }
    Add(*buttons.begin(), nullptr, [group, &value] {
        group->setExclusive(false); // else a pressed button could not be released
        for (QAbstractButton* button : group->buttons())
            button->setChecked(group->id(button) == value);
        group->setExclusive(true);
    });
    connect(group, &QButtonGroup::idClicked, this, [this, &value](int chosen) { Store(value, std::int32_t(chosen)); });
}

void CBindings::AddUnbound(QComboBox* box)
{
    Add(box, nullptr, [box] { box->setCurrentIndex(0); });
}

bool CBindings::eventFilter(QObject* object, QEvent* event)
{
    // A wheel that scrolls the page changes no list that it happens to pass.
    const auto* list = qobject_cast<QComboBox*>(object);
    if (event->type() == QEvent::Wheel && list && !list->hasFocus()) {
        event->ignore();
        return true;
    }
    // A list leaves undo and redo to the document.
    if (event->type() == QEvent::ShortcutOverride || event->type() == QEvent::KeyPress) {
        const auto* key = static_cast<QKeyEvent*>(event);
        if (key->matches(QKeySequence::Undo) || key->matches(QKeySequence::Redo)) {
            event->ignore();
            return true;
        }
    }
    return QObject::eventFilter(object, event);
}

void CBindings::AddRule(std::function<bool()> rule, std::initializer_list<QWidget*> widgets,
                        void (QWidget::*apply)(bool))
{
    m_rules.push_back([rule = std::move(rule), widgets = std::vector(widgets), apply] {
        const bool holds = rule();
        for (QWidget* widget : widgets)
            (widget->*apply)(holds);
    });
}

void CBindings::EnableWhen(std::function<bool()> rule, std::initializer_list<QWidget*> widgets)
{
    AddRule(std::move(rule), widgets, &QWidget::setEnabled);
}

void CBindings::ShowWhen(std::function<bool()> rule, std::initializer_list<QWidget*> widgets)
{
    AddRule(std::move(rule), widgets, &QWidget::setVisible);
}

void CBindings::Show()
{
    for (const Control& control : m_controls)
        control.show();
    ApplyRules();
}

bool CBindings::Take()
{
    return std::all_of(m_typed.begin(), m_typed.end(), [](CTyping* typing) { return typing->Take(); });
}

bool CBindings::TakeField()
{
    return std::all_of(m_typed.begin(), m_typed.end(), [](CTyping* typing) { return typing->TakeField(); });
}
