// What is selected in a grid, and which lines that means.
#pragma once

#include <QItemSelection>
#include <QObject>
#include <optional>

class QTableView;

/// Which lines Delete means, and where Insert puts a new one.
enum class LineChoice
{
    WholeLines,  // selected by their numbers, not cell by cell, in one range; a new line comes above them, or last
    CurrentLine, // likewise; without such a selection the current line
    LinesOfCells // those of the selected cells; a new line comes below the current one
};

/// Rows count from 0.
class CGridSelection : public QObject
{
public:
    /// A child of the grid, which has its model and its headers already.
    explicit CGridSelection(QTableView& grid);

    void SetChoice(LineChoice choice) { m_choice = choice; }
    /// More than the current cell, in one range.
    std::optional<QItemSelectionRange> Block() const;
    /// The lines that Delete means, whole; `fixedRows` at the top are none.
    std::optional<QItemSelectionRange> Lines(int fixedRows) const;
    /// Whole lines, selected by their numbers.
    bool AreLines() const;
    /// What is selected as it would be in other rows: to go on with lines that have moved.
    struct Shape
    {
        int left = 0, right = 0, row = 0, column = 0; // of the current cell; its row among those selected
        bool isOfLines = false;
    };
    Shape ShapeNow() const;
    void SelectAgain(const Shape& shape, int top, int bottom);
    /// Where a new line goes.
    int PlaceOfNewLine(int fixedRows) const;
    /// Selects whole lines, as clicks on their numbers do.
    void SelectLines(int first, int last);
    /// The end of what is selected at which the current cell is not, from which it grows or shrinks.
    QModelIndex OtherEnd() const;
    /// The selection grows from its other end to a cell, whole lines by whole lines. The table itself would select from
    /// where a key or the mouse went last, which the grid's own moves are not.
    void GrowTo(const QModelIndex& cell);

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    void Select(const QModelIndex& from, const QModelIndex& to);

    QTableView& m_grid;
    LineChoice m_choice = LineChoice::WholeLines;
    bool m_choosingLines = false; // the selection is being made by line numbers
    bool m_linesChosen = false;   // the selection was made so
};
