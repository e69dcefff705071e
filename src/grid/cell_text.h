// Between the value of a cell and its texts.
#pragma once

#include "grid/column_spec.h"

/// Nothing, the mark of a number that is not given where the column shows that as empty, or a text without letters.
bool IsEmptyCell(const ColumnSpec& column, const CellValue& value);
/// The text of a cell that is not being edited.
QString ShownText(const ColumnSpec& column, const CellValue& value);
/// Whether `shown`, the text of a cell, leaves out digits of its number.
bool HidesDigits(const ColumnSpec& column, const CellValue& value, const QString& shown);
/// The whole value with its unit.
QString FullText(const ColumnSpec& column, const CellValue& value);
/// The whole text where the cell may not show it, and the unit.
QString CellToolTip(const ColumnSpec& column, const CellValue& value);
/// The text that editing starts with and that is copied: it reads back to the same number, in display units.
QString EditText(const ColumnSpec& column, const CellValue& value);

/// The number, in base units, of a text that is nothing but one and which the column takes; nothing for any other text,
/// taken or not.
std::optional<double> ReadPlainNumber(const ColumnSpec& column, QStringView text);

struct CellReading
{
    CellValue value;
    QString refusal; // why the text is no value of the column; empty when it is one
};
/// What a typed or pasted text means. Nothing typed is the empty cell. A text that is refused to the user is a value
/// all the same: other editors may send it.
CellReading ReadCell(const ColumnSpec& column, QStringView given);
