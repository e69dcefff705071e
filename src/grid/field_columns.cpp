#include "grid/field_columns.h"

GridControl FieldColumns::ControlFor(const Field& field, const ColumnSpec& column) const
{
    const bool hasChoices = bool(column.choices.entries);
    const auto number = [&](std::type_identity<double>) {
        if (m_style.besideAPicture)
            return Control::Measured;
        return column.asFormatted || field.digits                            ? Control::Formatted
               : column.emptyIsNotGiven && field.unit == UnitGroup::Chainage ? Control::Chainage
                                                                             : Control::Number;
    };
    const auto text = [&](std::type_identity<std::string>) {
        return hasChoices               ? Control::DropDownList
               : column.upperCase       ? Control::Text
               : m_style.besideAPicture ? Control::TrimmedText
                                        : Control::FreeText;
    };
    return VisitKind(field.kind, Overloads{number, text,
                                           [&](std::type_identity<bool>) {
                                               return hasChoices ? Control::DropDown : Control::CheckBox;
                                           },
                                           [](std::type_identity<HDDateTime>) { return Control::DateTime; },
                                           [&](auto) { return hasChoices ? Control::DropDown : Control::Integer; }});
}

/// The row of the globals reads and writes what the column names; other rows go on as before.
void FieldColumns::AddGlobalRow(ColumnSpec& column, CellAccess& access) const
{
    const auto isGlobal = [globals = m_globals](const void* row) { return row == globals; };
    const auto name = [text = m_style.text, row = m_style.globalRow] { return text({row}).toStdString(); };
    access.get = [isGlobal, name, get = access.get, number = column.globalNumber, index = column.globalIndex,
                  isText = column.Kind() == CellKind::Text](const void* row) -> CellValue {
        if (!isGlobal(row))
            return get(row);
        if (number || index)
            return number ? CellValue(*number) : CellValue(*index);
        return isText ? CellValue(name()) : CellValue();
    };
    access.set = [isGlobal, set = access.set, number = column.globalNumber,
                  index = column.globalIndex](void* row, const CellValue& value) {
        if (!isGlobal(row))
            set(row, value);
        else if (number)
            *number = std::get<double>(value);
        else if (index)
            *index = std::get<std::int32_t>(value);
    };
    if (access.number)
        access.number = [isGlobal, in = access.number, number = column.globalNumber](const void* row) {
            return isGlobal(row) ? number : in(row);
        };
    if (access.text)
        access.text = [isGlobal, in = access.text](const void* row) { return isGlobal(row) ? nullptr : in(row); };
    const bool hasGlobal = column.globalNumber || column.globalIndex;
    column.locked = [isGlobal, hasGlobal, locked = column.locked](const void* row) {
        return isGlobal(row) ? !hasGlobal || (locked && locked(nullptr)) : locked && locked(row);
    };
}

FieldColumns& FieldColumns::Add(const Field& field, CellAccess access, ColumnSpec column)
{
    if (!column.header) {
        const UnitGroup named = m_style.besideAPicture ? field.unit : UnitGroup::None;
        column.header = [text = m_style.text, title = field.title, named] {
            return named == UnitGroup::None ? text(title) : WithUnit(text(title), named);
        };
    }
    column.names = [texts = m_style.inAllLanguages, title = field.title, name = field.name] {
        return QStringList(title ? texts(title) : QStringList()) << QString::fromUtf8(name);
    };
    if (!column.hint && field.meaning)
        column.hint = [text = m_style.text, meaning = field.meaning] { return text(meaning); };
    column.name = field.name;
    column.style = CKsEditStyle(field.unit);
    if (field.digits)
        column.style.SetFormat(QStringLiteral("%.%1lg").arg(field.digits));
    column.bounds = field.bounds;
    column.along = field.along;
    column.unitBelow = !m_style.besideAPicture;
    if (m_style.besideAPicture) {
        column.width = 0;
        column.isRequired = column.Kind() == CellKind::Number && !column.emptyIsNotGiven;
    }
    if (m_globals)
        AddGlobalRow(column, access);
    column.access = std::make_shared<CellAccess>(std::move(access));
    m_model.AddColumn(std::move(column));
    return *this;
}

FieldColumns& FieldColumns::Value(CellAccess access, const Field& field, ColumnSpec column)
{
    if (field.choices) {
        column.choices.entries = [text = m_style.text, entries = field.choices] { return text(entries).split(u'\n'); };
        column.choices.first = field.firstChoice;
    }
    column.emptyIsNotGiven = column.emptyIsNotGiven || field.mayBeUnknown;
    column.control = ControlFor(field, column);
    return Add(field, std::move(access), std::move(column));
}

FieldColumns& FieldColumns::Button(ColumnSpec column)
{
    column.control = Control::PushButton;
    return Add({}, {[](const void*) { return CellValue(); }, [](void*, const CellValue&) {}}, std::move(column));
}
