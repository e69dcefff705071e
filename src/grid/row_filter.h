// What the user wants to see of a table: for each column what its cells have to be.
#pragma once

#include "grid/column_spec.h"
#include "grid/row_source.h"

/// Reads what was typed into the filter of a column:
///   a text           cells that contain it, in capitals or not
///   =text, !=text    cells that are, or are not, the whole text
///   12.5             numbers that show as this with so many decimals
///   >5 >=5 <5 <=5 =5 !=5 2..7 2.. ..7   numbers in the unit shown
///   "", !=""         cells that are empty, or are not
/// A condition that is not complete yet, as ">", lets every cell pass.
class CCellFilter
{
public:
    CCellFilter(const ColumnSpec& column, const QString& text);

    /// Why the text is no condition; empty when it is one.
    const QString& Refusal() const { return m_refusal; }
    bool IsForAll() const { return !m_passes; }
    bool Passes(const CellValue& value) const { return !m_passes || m_passes(value); }

private:
    using Condition = std::function<bool(const CellValue& value)>;
    static Condition EmptyCells(const ColumnSpec& column, bool wanted);
    Condition NumberCondition(const ColumnSpec& column, const QString& text);
    static Condition TextCondition(const ColumnSpec& column, const QString& text);

    Condition m_passes;
    QString m_refusal;
};

/// For each row of the source whether a filter hides it; `texts` stand for the first columns. Empty when no text is a
/// condition. Fixed rows are never hidden.
std::vector<bool> HiddenRows(IRowSource& rows, const std::vector<ColumnSpec>& columns, const QStringList& texts);
/// What the cells of a text column hold, each once and in order; at most `most`.
QStringList TextsOf(IRowSource& rows, const ColumnSpec& column, qsizetype most);
