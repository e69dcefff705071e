// Numbers as other programs write them: with a decimal comma, with signs between the thousands.
#pragma once

#include <QString>

/// What stands between whole numbers and decimals.
enum class DecimalSign
{
    Point,
    Comma
};

/// The number that the text begins with as cells take it - "1234.5" for "1.234,5", "1 234,5" or "1'234,5" - and what
/// stands behind it, a unit for example, after a blank. A text that begins with no such number comes back as it is.
/// Between thousands there is one sign, everywhere the same, and groups of three digits.
QString PlainNumber(QStringView text, DecimalSign decimal);
/// Whether the text is such a number, with something behind it or not.
bool IsForeignNumber(QStringView text, DecimalSign decimal);
