// What is done to many cells at once: filled, continued, interpolated along the branches, calculated. Each computes its
// results and changes nothing; CGridModel::ChangeCells makes them one step to undo.
#pragma once

#include "grid/cell_results.h"
#include "grid/shown_numbers.h"

#include <QStringList>

class CKsFormula;
class CSavedLines;

/// The first row of the block over the others; the row above over a block of one.
CCellResults FillDown(const CTableRows& rows, CellBlock block);

/// The cells become what blank ones are stored as: what the column fills new lines with, or nothing.
CCellResults Clear(const CTableRows& rows, const CellBlock& block);

/// Cells of columns with a global value become that.
CCellResults ResetToGlobal(const CTableRows& rows, const CellBlock& block);

/// Cells become what they held when the document was saved.
CCellResults RevertToSaved(const CTableRows& rows, const CSavedLines& saved, const CellBlock& block);

/// Numbers that grow by `step` from row to row, in the units shown, from what stands in the first row of each column.
CCellResults FillSeries(const CTableRows& rows, const CellBlock& block, double step);
/// How much the second row of the block is more than the first one, in the unit shown; 0 where that is no number.
double StepOf(const CTableRows& rows, const CellBlock& block);

enum class KnownValues
{
    Ends,      // of each branch the first and the last line of the block, by their chainages
    Neighbours // of each branch all lines that are not in the block, also those that are not shown
};
/// Numbers on straight lines between known ones of the same branch, in proportion to the chainage. The first two
/// columns are branch name and chainage. What lies beyond the known ones stays, or goes on along the line of the two
/// nearest ones.
CCellResults Interpolate(const CTableRows& rows, const CellBlock& block, KnownValues known, bool extrapolates);

/// The names that a formula about the cells of the table may have: "value", then one for each column of numbers.
struct FormulaNames
{
    QStringList names;
    std::vector<int> columns; // the column of each; -1 for the cell itself
};
FormulaNames NamesForFormula(const CTableRows& rows);
/// A formula, which outlives it, about the cells of a column.
class CCellFormula
{
public:
    CCellFormula(const CTableRows& rows, const CKsFormula& formula, const FormulaNames& names, int column);
    /// What it makes of the number in the cell.
    void Add(CCellResults& results, int row);

private:
    struct Used
    {
        double* name; // what it stands for
        CShownNumbers numbers;
    };
    const CTableRows* m_rows;
    int m_column;
    const CKsFormula* m_formula;
    std::vector<Used> m_used;
};
/// Each number of the block becomes what the formula makes of it; numbers are in the units shown.
CCellResults Calculate(const CTableRows& rows, const CellBlock& block, const CKsFormula& formula,
                       const FormulaNames& names);
