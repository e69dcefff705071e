#include "ks/units/typed_number.h"

#include "files/read_number.h"
#include "ks/units/formula.h"
#include "ks/units/unit_groups.h"

#include <QCoreApplication>
#include <QRegularExpression>
#include <QStringList>
#include <algorithm>
#include <cmath>
#include <limits>

namespace {

CString Text(const char* text)
{
    return QCoreApplication::translate("CKsEditStyle", text);
}

/// How long the number is that the text begins with; 0 for none.
qsizetype NumberLength(const CString& text)
{
    qsizetype length = 0;
    while (length < text.size() && QStringView(u"0123456789.eE+-").contains(text[length]))
        ++length;
    while (length > 0 && !IsValidNumber(text.first(length).toStdString()))
        --length; // "12e" may be an amount of e
    return length;
}

KsTyped<double> ReadFormula(const CString& text)
{
    const CKsFormula formula(text);
    if (!formula.Fault().isEmpty())
        return {{}, formula.Fault()};
    const double value = formula.Value();
    if (!std::isfinite(value))
        return {{}, Text(QT_TRANSLATE_NOOP("CKsEditStyle", "The result of \"%1\" is no number.")).arg(text)};
    return {value};
}

constexpr QChar Fraction(0x2044); // ⁄

/// With the signs that a keyboard has: "m1/3/s" for "m¹⁄³/s".
CString AsTyped(const CString& unit)
{
    return unit.normalized(CString::NormalizationForm_KC).replace(Fraction, u'/');
}

/// A unit without the signs about its powers: "m^(1/3)/s" is "m1/3/s".
CString PlainPowers(const CString& unit)
{
    return AsTyped(unit).remove(u'^').remove(u'(').remove(u')');
}

/// Whether it is the field's own: its powers that are fractions can be typed, too.
bool IsOwn(const CString& unit, const CString& symbol)
{
    return !symbol.isEmpty() &&
           (unit == symbol || (symbol.contains(Fraction) && PlainPowers(unit) == PlainPowers(symbol)));
}

/// Whether it is a unit of anything, be it with powers that are fractions, which the unit library has not.
bool IsAnyUnit(const CString& unit)
{
    static const QRegularExpression powers(QStringLiteral("\\^?\\(?\\d+/\\d+\\)?|\\^\\d*\\.\\d+"));
    return KsIsUnit(unit) || (AsTyped(unit).contains(powers) && KsIsUnit(AsTyped(unit).remove(powers)));
}

KsTyped<double> ReadAmount(double number, const CString& unit, const CKsEditStyle& style, const CString& symbol)
{
    if (IsOwn(unit, symbol))
        return {style.UnitConvertFromBase(number, 0)}; // as without it, to the last bit
    if (const auto factor = KsTypedUnitFactor(style.Group(), unit)) {
        // As if the amount had been typed in the unit that it is round in, that of the field or that of the file: 3 yd
        // are 9 where feet are shown, and 2 m are 2 in the file, to the last bit.
        const double shown = KsFifteenDigits(double(number * *factor / style.Conversion().factor));
        const double base = KsFifteenDigits(double(number * *factor));
        const bool isRound = KsFifteenDigits(number) == number; // all its digits count otherwise
        const bool isRounder = KsShortestNumber(shown).size() < KsShortestNumber(base).size();
        const double value = !isRound    ? double(number * *factor)
                             : isRounder ? style.UnitConvertFromBase(shown, 0)
                                         : base;
        return std::isfinite(value) ? KsTyped<double>{value} : KsTyped<double>{};
    }
    if (!IsAnyUnit(unit))
        return {};
    const CString possible = KsTypedUnits(style, symbol).join(QStringLiteral(", "));
    return {
        {},
        possible.isEmpty()
            ? Text(QT_TRANSLATE_NOOP("CKsEditStyle", "This number has no unit; \"%1\" cannot stand here.")).arg(unit)
            : Text(QT_TRANSLATE_NOOP("CKsEditStyle", "\"%1\" is no unit of this quantity. Possible are %2."))
                  .arg(unit, possible)};
}

} // namespace

QStringList KsTypedUnits(const CKsEditStyle& style, const CString& symbol)
{
    QStringList units;
    const auto add = [&units](const CString& unit) {
        if (!unit.isEmpty() && !units.contains(unit))
            units << unit;
    };
    add(symbol);
    if (const KsUnitGroupRow* row = KsFindUnitGroup(style.Group())) {
        add(CString::fromUtf8(row->base.symbol));
        add(CString::fromUtf8(row->usCustomary.symbol));
        for (const CString& unit : CString::fromUtf8(row->alsoTyped).split(QStringLiteral(", "), Qt::SkipEmptyParts))
            add(unit);
    }
    return units;
}

std::optional<double> KsReadNumber(QStringView text, const CKsEditStyle& style)
{
    char plain[400]; // any number that a double can be told by
    if (text.size() > qsizetype(sizeof plain))
        return std::nullopt;
    const auto end = std::transform(text.begin(), text.end(), plain, [](QChar c) { return c.toLatin1(); });
    const auto number = ReadNumber({plain, std::size_t(end - plain)});
    return number ? std::optional(style.UnitConvertFromBase(*number, 0)) : std::nullopt;
}

KsTyped<double> KsReadTyped(QStringView text, const CKsEditStyle& style)
{
    return KsReadTyped(text, style, style.UnitSymbol());
}

KsTyped<double> KsReadTyped(QStringView given, const CKsEditStyle& style, const CString& symbol)
{
    if (const auto number = KsReadNumber(given, style))
        return {*number};
    const CString text = given.toString();
    const std::string plain = text.toStdString();
    if (const auto number = ReadNumber(plain)) // a very long one
        return {style.UnitConvertFromBase(*number, 0)};
    if (IsValidNumber(plain)) // too large for a number
        return {};
    if (text.startsWith(u'=')) {
        KsTyped<double> result = ReadFormula(text.sliced(1));
        if (result.value)
            result.value = style.UnitConvertFromBase(KsFifteenDigits(*result.value), 0);
        return result;
    }
    const qsizetype length = NumberLength(text);
    const auto number = ReadNumber(plain.substr(0, std::size_t(length))); // its characters are bytes
    return number ? ReadAmount(*number, text.sliced(length).trimmed(), style, symbol) : KsTyped<double>();
}

KsTyped<std::int32_t> KsReadTypedInteger(const CString& text)
{
    if (!text.startsWith(u'='))
        return {ReadInteger(text.toStdString())};
    const KsTyped<double> result = ReadFormula(text.sliced(1));
    using Limits = std::numeric_limits<std::int32_t>;
    if (!result.value)
        return {{}, result.complaint};
    if (*result.value != std::floor(*result.value) || *result.value < Limits::min() || *result.value > Limits::max())
        return {{}, Text(QT_TRANSLATE_NOOP("CKsEditStyle", "The result of \"%1\" is no integer.")).arg(text.sliced(1))};
    return {std::int32_t(*result.value)};
}
