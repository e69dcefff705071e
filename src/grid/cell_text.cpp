#include "grid/cell_text.h"

#include "base/not_given.h"
#include "grid/date_time_text.h"
#include "grid/grid_texts.h"
#include "grid/typing.h"
#include "ks/fc/branch_name.h"
#include "ks/fc/shown_text.h"
#include "ks/units/typed_number.h"

#include <cmath>

namespace {

CellReading Refused(const QString& complaint, const QString& otherwise)
{
    return {{}, complaint.isEmpty() ? otherwise : complaint};
}

} // namespace

bool IsEmptyCell(const ColumnSpec& column, const CellValue& value)
{
    if (std::holds_alternative<std::monostate>(value))
        return true;
    if (const auto* number = std::get_if<double>(&value))
        return column.emptyIsNotGiven && (*number == NotGiven || std::isnan(*number));
    const auto* text = std::get_if<std::string>(&value);
    return text && text->empty();
}

QString ShownText(const ColumnSpec& column, const CellValue& value)
{
    if (column.ActsAtOnce())
        return {}; // a picture
    const auto* number = std::get_if<double>(&value);
    if (!number || IsEmptyCell(column, value))
        return EditText(column, value);
    // Decimals are those of the number itself; cut to significant digits first, it would end in zeros that it has not.
    const int decimals = column.control.decimals;
    if (decimals == AsFormatted || KsUnits::Instance().AllDigits())
        return column.style.ShownText(*number);
    if (decimals == UpToThousandths)
        return column.style.RoundedText(*number);
    return KsFormatNumber(QStringLiteral("%-.%1lf").arg(decimals), column.style.UnitConvertFromBase(*number, 1));
}

bool HidesDigits(const ColumnSpec& column, const CellValue& value, const QString& shown)
{
    const auto* number = std::get_if<double>(&value);
    return number && !IsEmptyCell(column, value) && column.style.HidesDigits(*number, shown);
}

QString FullText(const ColumnSpec& column, const CellValue& value)
{
    return NumberText(EditText(column, value), column.UnitSymbol());
}

QString CellToolTip(const ColumnSpec& column, const CellValue& value)
{
    if (column.Kind() == CellKind::Text)
        return KsVisibleText(ShownText(column, value)); // may be longer than its cell, a path in particular
    const auto* number = std::get_if<double>(&value);
    if (!number || IsEmptyCell(column, value))
        return column.ToolTip();
    return NumberToolTip(column.style, *number, HidesDigits(column, value, ShownText(column, value)),
                         column.UnitSymbol());
}

QString EditText(const ColumnSpec& column, const CellValue& value)
{
    if (IsEmptyCell(column, value))
        return {};
    if (const auto* number = std::get_if<double>(&value))
        return column.style.FullText(*number);
    if (const auto* integer = std::get_if<std::int32_t>(&value))
        return column.Kind() == CellKind::Choice ? column.choices.TextOf(*integer) : QString::number(*integer);
    if (const auto* time = std::get_if<HDDateTime>(&value))
        return DateTimeText(*time);
    return QString::fromStdString(std::get<std::string>(value));
}

std::optional<double> ReadPlainNumber(const ColumnSpec& column, QStringView text)
{
    const auto number = KsReadNumber(text, column.style);
    return number && column.bounds.Allow(*number) ? number : std::nullopt;
}

static CellReading ReadNumberCell(const ColumnSpec& column, QStringView text)
{
    KsTyped<double> number{KsReadNumber(text, column.style), {}};
    if (!number.value) // an amount or a formula, which are rare
        number = KsReadTyped(text, column.style, column.UnitSymbol());
    if (!number.value)
        return Refused(number.complaint, GridTexts::tr("Floating point number required"));
    if (!column.bounds.Allow(*number.value))
        return {{}, OutOfRange()};
    return {*number.value, {}};
}

CellReading ReadCell(const ColumnSpec& column, QStringView given)
{
    given = WithoutLineEnds(given);
    if (column.Kind() == CellKind::Number && !given.isEmpty())
        return ReadNumberCell(column, given);
    const QString text = given.toString();
    if (column.Kind() == CellKind::Text) {
        const QString taken = column.control.upperCase ? KsBranchKey(text)
                              : column.control.trimmed ? text.trimmed()
                                                       : text;
        return {taken.toStdString(), UnseenRefusal(taken)};
    }
    if (text.isEmpty())
        return {{}, column.isRequired ? GridTexts::tr("Floating point number required") : QString()};
    if (column.Kind() == CellKind::Button)
        return {{}, GridTexts::tr("The cell is locked.")};
    if (column.Kind() == CellKind::Flag)
        return text == u'0' || text == u'1' ? CellReading{std::int32_t(text == u'1'), {}}
                                            : CellReading{{}, GridTexts::tr("Please enter 0 or 1.")};
    if (column.Kind() == CellKind::DateTime) {
        const auto time = ReadDateTime(text);
        return time ? CellReading{*time, {}} : CellReading{{}, DateTimeRefusal(text)};
    }
    if (column.Kind() == CellKind::TextChoice || column.Kind() == CellKind::Choice) {
        const auto entry = column.choices.EntryOf(text);
        if (entry && column.Kind() == CellKind::TextChoice)
            return {entry->toStdString(), {}};
        if (const auto index = column.choices.IndexOf(text); index && column.Kind() == CellKind::Choice)
            return {*index, {}};
        return {{}, GridTexts::tr("One of these is required: %1").arg(column.choices.entries().join(", "))};
    }
    const auto integer = KsReadTypedInteger(text);
    return integer.value ? CellReading{*integer.value, {}}
                         : Refused(integer.complaint, GridTexts::tr("Please enter an integer."));
}
