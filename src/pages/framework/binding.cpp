#include "pages/framework/binding.h"

#include "data/global_var.h"
#include "document/document.h"
#include "document/store_value.h"
#include "ks/units/edit_fields.h"
#include "pages/framework/ctrl_edit.h"
#include "pages/framework/date_time_edit.h"
#include "pages/framework/field_meaning.h"
#include "pages/framework/field_tip.h"
#include "pages/framework/output_matrix.h"
#include "res/strings.h"

#include <QButtonGroup>
#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QRadioButton>
#include <QUndoStack>
#include <algorithm>

namespace {

/// Where a control of a grid layout stands; without cells for a control that stands in none.
struct Cell
{
    QGridLayout* cells = nullptr;
    int row = 0, column = 0, rows = 0, columns = 0;
};

Cell CellOf(QWidget& control)
{
    if (!control.parentWidget())
        return {};
    for (auto* cells : control.parentWidget()->findChildren<QGridLayout*>()) {
        const int index = cells->indexOf(&control);
        if (index < 0)
            continue;
        Cell cell{.cells = cells};
        cells->getItemPosition(index, &cell.row, &cell.column, &cell.rows, &cell.columns);
        return cell;
    }
    return {};
}

/// A new widget in a cell beside the control: that many to the left (negative) or to the right of it. Null for a
/// control that stands in no cells.
template <typename W>
W* AddBeside(QWidget& control, int side, const char* name)
{
    const Cell its = CellOf(control);
    if (!its.cells)
        return nullptr;
    auto* beside = new W(control.parentWidget());
    beside->setObjectName(name + control.objectName().section(u'_', -1)); // with the control's number
    its.cells->addWidget(beside, its.row, its.column + side + (side < 0 ? 0 : its.columns - 1));
    return beside;
}

/// A control takes no more room than it needs, and starts where the others of its column do.
void PackIntoCell(QWidget& control)
{
    if (const Cell its = CellOf(control); its.cells)
        its.cells->setAlignment(&control, Qt::AlignLeft);
}

} // namespace

void SetAccessibleName(QWidget& widget, const QString& name)
{
    if (widget.accessibleName() != name)
        widget.setAccessibleName(name);
}

const Field& CBindings::Declaration(const void* value) const
{
    static constexpr Field none;
    const DeclaredKeyword* keyword = KeywordOf(value);
    return keyword ? *FindField(keyword->Fields(), &m_document->Parameters().Global, value) : none;
}

const DeclaredKeyword* CBindings::KeywordOf(const void* value) const
{
    for (const DeclaredSection& section : HDGlobals().Sections())
        for (const DeclaredKeyword& keyword : section.keywords)
            if (FindField(keyword.Fields(), &m_document->Parameters().Global, value))
                return &keyword;
    return nullptr;
}

QString CBindings::ToolTip(const void* value, const QString& number, const QString& unit) const
{
    const DeclaredKeyword* keyword = KeywordOf(value);
    return keyword ? FieldToolTip(*keyword, Declaration(value), number, unit) : number;
}

template <typename T>
void CBindings::Store(T& target, T value)
{
    StoreValue(*m_document, target, value);
    ApplyRules();
}

void CBindings::ApplyRules()
{
    if (CKsTypedText::IsEntering()) // nobody looks
        return;
    for (const auto& rule : m_rules)
        rule();
}

void CBindings::Always(std::function<void()> rule)
{
    rule();
    m_rules.push_back(std::move(rule));
}

void CBindings::AddLabel(QWidget* control, const void* value, std::function<Str()> title)
{
    const TextLine declared = Declaration(value).title;
    QLabel* label = declared ? AddBeside<QLabel>(*control, -1, "label_") : nullptr;
    if (!label)
        return;
    label->setBuddy(control);
    m_beside.emplace(control, label);
    Always([this, control, value, label, declared, title] {
        label->setText(LoadLine(title ? title() : declared.text, declared.line));
        const auto* number = qobject_cast<CCtrlEdit*>(control);
        label->setToolTip(ToolTip(value, {}, number ? number->UnitSymbol() : QString()));
        SetAccessibleName(*control, PlainTitle(label->text()));
    });
    AddMeaning(control, value);
}

void CBindings::AddMeaning(QWidget* control, const void* value)
{
    constexpr int behindUnit = 2;
    const TextLine declared = Declaration(value).meaning;
    auto* meaning = declared && m_tellsMeanings ? AddBeside<CFieldMeaning>(*control, behindUnit, "meaning_") : nullptr;
    if (!meaning)
        return;
    m_beside.emplace(control, meaning);
    Always([this, control, value, meaning, declared] {
        meaning->SetText(LoadLine(declared.text, declared.line));
        const auto* number = qobject_cast<CCtrlEdit*>(control);
        meaning->setToolTip(ToolTip(value, {}, number ? number->UnitSymbol() : QString()));
    });
}

void CBindings::Add(QWidget* control, const void* value, std::function<void()> show)
{
    m_controls.push_back({control, value, std::move(show)});
    if (value && !qobject_cast<CCtrlEdit*>(control)) // which says its number and unit, too
        Always([this, control, value] { control->setToolTip(ToolTip(value, {}, {})); });
}

void CBindings::AddTyped(QLineEdit* field, const void* value, TypedField what)
{
    auto* typing = new CTyping(field, std::move(what));
    m_typed.push_back(typing);
    AddLabel(field, value);
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
    field->Setup(value, Declaration(&value), [this, &value](double number) { Store(value, number); });
    field->SetUnitText(options.unitText);
    field->SetToolTipText(
        [this, field, &value](const QString& number) { return ToolTip(&value, number, field->UnitSymbol()); });
    m_typed.push_back(&field->Typing());
    PackIntoCell(*field);
    AddLabel(field, &value, options.title);
    const bool hasUnit = options.unitText || !field->UnitSymbol().isEmpty();
    QLabel* unit = hasUnit ? AddBeside<QLabel>(*field, 1, "unit_") : nullptr;
    if (unit)
        m_beside.emplace(field, unit);
    Add(field, &value, [field, unit] {
        field->Show();
        if (unit)
            unit->setText(field->UnitSymbol());
    });
}

void CBindings::Add(CKsEditLong* field, std::int32_t& value)
{
    PackIntoCell(*field);
    AddTyped(field, &value,
             {.complaint = [field] { return field->Complaint(); },
              .store = [this, field, &value] { Store(value, *field->Value()); },
              .show = [field, &value] { field->SetValue(value); },
              .waitsForPage = true});
}

void CBindings::Add(QLineEdit* field, std::string& value)
{
    AddTyped(field, &value,
             {.complaint = [field] { return UnseenRefusal(field->text(), Tabs::Taken); }, // one may delimit columns
              .store = [this, field, &value] { Store(value, field->text().toStdString()); },
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
    AddLabel(field, &value);
    Always([field] { field->Retranslate(); });
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

void CBindings::Add(QCheckBox* box, bool& value, std::function<void(bool checked)> consequences)
{
    Add(box, &value, [box, &value] { box->setChecked(value); });
    m_trials[box] = [&value] { value = !value; };
    if (const TextLine title = Declaration(&value).title) {
        Always([this, box, &value, title] {
            const QString text = LoadLine(title.text, title.line);
            if (auto* matrix = qobject_cast<COutputMatrix*>(box->parentWidget()))
                matrix->SetTitle(*box, text, ToolTip(&value, {}, {}));
            else
                box->setText(text);
        });
    }
    connect(box, &QCheckBox::clicked, this, [this, &value, consequences](bool checked) {
        if (!consequences || m_document->IsReadOnly()) // which refuses the value
            return Store(value, checked);
        QUndoStack& steps = m_document->UndoStack();
        steps.beginMacro(LoadString(Str::UndoValue));
        Store(value, checked);
        consequences(checked);
        steps.endMacro();
    });
}

void CBindings::Add(QComboBox* box, std::int32_t& index)
{
    Add(box, index, [this, &index](std::int32_t chosen) { Store(index, chosen); });
}

void CBindings::Add(QComboBox* box, std::int32_t& index, std::function<void(std::int32_t chosen)> choose)
{
    PackIntoCell(*box);
    box->setSizeAdjustPolicy(QComboBox::AdjustToContents); // of the language, too
    AddLabel(box, &index);
    if (const Str choices = Declaration(&index).choices.text; choices != Str::None) {
        Always([box, choices] {
            int entry = 0;
            for (const QString& text : LoadString(choices).split(u'\n')) {
                if (entry == box->count())
                    box->addItem(text);
                else if (box->itemText(entry) != text)
                    box->setItemText(entry, text);
                ++entry;
            }
        });
    }
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
        m_trials[button] = [&value, other = std::int32_t(id)]() mutable { std::swap(value, other); };
        group->addButton(button, id++);
    }
    if (const Str choices = Declaration(&value).choices.text; choices != Str::None) {
        Always([group, choices] {
            for (QAbstractButton* button : group->buttons())
                button->setText(LoadLine(choices, group->id(button)));
        });
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
    PackIntoCell(*box);
    box->setSizeAdjustPolicy(QComboBox::AdjustToContents);
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
    m_conditions.push_back({rule, widgets});
    m_rules.push_back([this, rule = std::move(rule), widgets = std::vector(widgets), apply] {
        const bool holds = rule();
        for (QWidget* widget : widgets) {
            (widget->*apply)(holds);
            const auto [first, last] = m_beside.equal_range(widget);
            std::for_each(first, last, [&](const auto& pair) { (pair.second->*apply)(holds); });
        }
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
    for (const CTyping* typing : m_typed)
        static_cast<QLineEdit*>(typing->parent())->setReadOnly(m_document->IsReadOnly());
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

bool CBindings::TakesFieldAway(const QObject* button) const
{
    const auto trial = m_trials.find(button);
    if (trial == m_trials.end())
        return false;
    trial->second();
    const auto isOf = [](const Condition& condition, const QWidget* field) {
        return std::ranges::any_of(condition.widgets,
                                   [field](const QWidget* w) { return w == field || w->isAncestorOf(field); });
    };
    const auto goes = [&](const CTyping* typing) {
        const auto* field = qobject_cast<const QWidget*>(typing->parent());
        return typing->IsTyped() &&
               std::ranges::any_of(m_conditions, [&](const auto& c) { return isOf(c, field) && !c.holds(); });
    };
    const bool takesAway = std::ranges::any_of(m_typed, goes);
    trial->second();
    return takesAway;
}
