#include "grid/cell_text.h"

#include "data/river_pos.h"
#include "grid/date_time_text.h"
#include "grid/number_syntax.h"
#include "res/strings.h"

namespace {

bool IsEmpty(const ColumnSpec& column, const CellValue& value)
{
    if (std::holds_alternative<std::monostate>(value))
        return true;
    const auto* number = std::get_if<double>(&value);
    return number && column.emptyIsNotGiven && *number == NotGiven;
}

} // namespace

QString ShownText(const ColumnSpec& column, const CellValue& value)
{
    if (column.ActsAtOnce())
        return {}; // a picture
    const auto* number = std::get_if<double>(&value);
    if (!number || IsEmpty(column, value))
        return EditText(column, value);
    // Decimals are those of the number itself; cut to significant digits first, it would end in zeros that it has not.
    const int decimals = FindControl(column.control).decimals;
    if (decimals == AsFormatted || KsUnits::Instance().AllDigits())
        return column.style.ShownText(*number);
    return KsFormatNumber(QStringLiteral("%-.%1lf").arg(decimals), column.style.UnitConvertFromBase(*number, 1));
}

bool HidesDigits(const ColumnSpec& column, const CellValue& value, const QString& shown)
{
    const auto* number = std::get_if<double>(&value);
    return number && !IsEmpty(column, value) && column.style.HidesDigits(*number, shown);
}

QString FullText(const ColumnSpec& column, const CellValue& value)
{
    return NumberText(EditText(column, value), column.UnitSymbol());
}

QString CellToolTip(const ColumnSpec& column, const CellValue& value)
{
    if (column.Kind() == CellKind::Text)
        return ShownText(column, value); // may be longer than its cell, a path in particular
    const auto* number = std::get_if<double>(&value);
    if (!number || IsEmpty(column, value))
        return column.ToolTip(false);
    return NumberToolTip(column.style, *number, ShownText(column, value), column.UnitSymbol());
}

QString EditText(const ColumnSpec& column, const CellValue& value)
{
    if (IsEmpty(column, value))
        return {};
    if (const auto* number = std::get_if<double>(&value))
        return KsShortestNumber(column.style.UnitConvertFromBase(*number, 1));
    if (const auto* integer = std::get_if<std::int32_t>(&value))
        return column.Kind() == CellKind::Choice ? column.choices.TextOf(*integer) : QString::number(*integer);
    if (const auto* time = std::get_if<HDDateTime>(&value))
        return DateTimeText(*time);
    return QString::fromStdString(std::get<std::string>(value));
}

CellReading ReadCell(const ColumnSpec& column, const QString& text)
{
    if (column.Kind() == CellKind::Text)
        return {(FindControl(column.control).upperCase ? text.toUpper() : text).toStdString(), {}};
    if (text.isEmpty())
        return {};
    if (column.Kind() == CellKind::Button)
        return {{}, LoadString(Str::CellLocked)};
    if (column.Kind() == CellKind::Flag)
        return text == u'0' || text == u'1' ? CellReading{std::int32_t(text == u'1'), {}}
                                            : CellReading{{}, LoadString(Str::FlagRequired)};
    if (column.Kind() == CellKind::DateTime) {
        const auto time = ReadDateTime(text);
        return time ? CellReading{*time, {}} : CellReading{{}, DateTimeRefusal(text)};
    }
    if (column.Kind() == CellKind::TextChoice) {
        if (const auto entry = column.choices.EntryOf(text))
            return {entry->toStdString(), {}};
        return {{}, LoadString(Str::ChoiceRequired).arg(column.choices.entries().join(QStringLiteral(", ")))};
    }
    if (column.Kind() == CellKind::Choice) {
        if (const auto index = column.choices.IndexOf(text))
            return {*index, {}};
        return {{}, LoadString(Str::ChoiceRequired).arg(column.choices.entries().join(QStringLiteral(", ")))};
    }
    if (column.Kind() == CellKind::Integer) {
        bool isInteger = false;
        const std::int32_t value = text.toInt(&isInteger);
        return isInteger ? CellReading{value, {}} : CellReading{{}, LoadString(Str::IntegerRequired)};
    }
    const auto number = ReadNumber(text.toStdString());
    if (!number)
        return {{}, LoadString(Str::GridNumberRequired)};
    return {column.style.UnitConvertFromBase(*number, 0), {}};
}
