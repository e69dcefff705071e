#include "grid/column_spec.h"

#include "base/not_given.h"
#include "files/read_number.h"
#include "grid/grid_texts.h"
#include "grid/typing.h"
#include "ks/fc/exchange.h"

#include <cmath>

CellAccess FieldAccess(const Field& field)
{
    return VisitKind(field.kind, [&]<typename T>(std::type_identity<T>) -> CellAccess {
        if constexpr (std::is_same_v<T, GroupType>)
            Q_UNREACHABLE(); // a table of its own
        else if constexpr (std::is_same_v<T, bool>)
            return {[field](const void* row) -> CellValue { return std::int32_t(field.In<bool>(row)); },
                    [field](void* row, const CellValue& value) {
                        field.In<bool>(row) = std::get<std::int32_t>(value) != 0;
                    }};
        else if (std::is_same_v<T, double> && field.mayBeUnknown)
            return {[field](const void* row) -> CellValue {
                        const double value = field.In<double>(row);
                        return std::isnan(value) ? NotGiven : value; // the one mark that cells know
                    },
                    [field](void* row, const CellValue& value) {
                        const double given = std::get<double>(value);
                        field.In<double>(row) = given == NotGiven ? KsUnset : given;
                    }};
        else {
            CellAccess access{[field](const void* row) -> CellValue { return field.In<T>(row); },
                              [field](void* row, const CellValue& value) { field.In<T>(row) = std::get<T>(value); }};
            const auto in = [address = field.constAddress](const void* row) {
                return static_cast<const T*>(address(row));
            };
            if constexpr (std::is_same_v<T, double>)
                access.number = in;
            else if constexpr (std::is_same_v<T, std::string>)
                access.text = in;
            return access;
        }
    });
}

template <typename T>
static const T* ValueIn(const CellAccess& cell, const std::function<const T*(const void*)>& inRow, const void* row,
                        CellValue& copy)
{
    if (const T* const value = inRow ? inRow(row) : nullptr)
        return value;
    copy = cell.get(row);
    return std::get_if<T>(&copy);
}

const double* CellAccess::NumberIn(const void* row, CellValue& copy) const
{
    return ValueIn(*this, number, row, copy);
}

const std::string* CellAccess::TextIn(const void* row, CellValue& copy) const
{
    return ValueIn(*this, text, row, copy);
}

QString Choices::TextOf(std::int32_t index) const
{
    const QStringList texts = entries();
    return index >= first && index - first < texts.size() ? texts[index - first] : QString::number(index);
}

std::optional<QString> Choices::EntryOf(const QString& text) const
{
    for (const QString& entry : entries())
        if (entry.compare(text.trimmed(), Qt::CaseInsensitive) == 0)
            return entry;
    return std::nullopt;
}

std::optional<std::int32_t> Choices::IndexOf(const QString& text) const
{
    const QStringList texts = entries();
    const qsizetype entry = texts.indexOf(EntryOf(text).value_or(QString()));
    if (entry >= 0)
        return first + std::int32_t(entry);
    const auto number = ReadInteger(text.trimmed().toStdString());
    return number && *number >= first && *number - first < texts.size() ? number : std::nullopt;
}

QString NumberText(const QString& number, const QString& unit)
{
    return unit.isEmpty() ? number : number + u' ' + unit;
}

QString WithUnit(const QString& name, UnitGroup group)
{
    return QStringLiteral("%1 [%2]").arg(name, CKsEditStyle(group).UnitSymbol());
}

QString NumberToolTip(const CKsEditStyle& style, double value, bool hidesDigits, const QString& unit)
{
    const QString unitTip = KsUnitToolTip(unit);
    if (!hidesDigits)
        return unitTip;
    const QString full = GridTexts::tr("Full value: %1").arg(NumberText(style.FullText(value), unit));
    return unitTip.isEmpty() ? full : full + u'\n' + unitTip;
}

CellValue ColumnSpec::EmptyValue() const
{
    switch (Kind()) {
    case CellKind::Text:
    case CellKind::TextChoice:
        return std::string();
    case CellKind::Integer:
    case CellKind::Flag:
        return std::int32_t(0);
    case CellKind::DateTime:
        return HDDateTime{};
    case CellKind::Button:
        return {};
    case CellKind::Choice:
        return choices.whenEmptied;
    case CellKind::Number:
        break;
    }
    return emptyIsNotGiven ? NotGiven : style.UnitConvertFromBase(0, 0);
}

CellValue ColumnSpec::NewLineValue() const
{
    if (fill)
        return FillValue();
    if (choices.inNewLines)
        return *choices.inNewLines;
    return emptyIsNotGiven ? CellValue(NotGiven) : CellValue();
}

QStringList ColumnSpec::HeaderLines() const
{
    constexpr qsizetype mostLetters = 18;
    const QString text = header();
    QStringList lines{text};
    if (text.size() > mostLetters) { // broken where both halves are about as long
        const qsizetype before = text.lastIndexOf(u' ', text.size() / 2), behind = text.indexOf(u' ', text.size() / 2);
        const bool isBefore = before > 0 && (behind < 0 || text.size() / 2 - before <= behind - text.size() / 2);
        if (const qsizetype space = isBefore ? before : behind; space > 0)
            lines = {text.first(space), text.sliced(space + 1)};
    }
    if (const QString unit = UnitLine(); !unit.isEmpty())
        lines << unit;
    return lines;
}

QString ColumnSpec::UnitLine() const
{
    const QString unit = unitBelow ? UnitSymbol() : QString();
    return unit.isEmpty() ? unit : QStringLiteral("[%1]").arg(unit);
}
