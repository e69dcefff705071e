// The columns that say which line it is (ColumnSpec::namesLine): they stay at the left while a table scrolls sideways.
#pragma once

#include <QRect>

class CGenGrid;
class QPainter;
class QStyleOptionViewItem;

/// The base lays all columns out side by side, moves them as far as the table is scrolled, and knows nothing of this. A
/// frozen column is seen where it is while nothing is scrolled; the others go below it.
class CFrozenColumns
{
public:
    explicit CFrozenColumns(const CGenGrid& grid) : m_grid(grid) {}

    /// How many columns are seen elsewhere than the base has them: those at the left that name the line, when the table
    /// is scrolled and they leave the others half of it.
    int Count() const { return Width() > 0 ? Named() : 0; }
    /// What they take of the table, in pixels.
    int Width() const { return IsScrolled() ? Needed() : 0; }
    /// What they take as soon as the table is scrolled.
    int Needed() const;
    /// Where the base has what is seen at `x`.
    int LaidOut(int x) const { return x < Width() ? x - Offset() : x; }
    QPoint LaidOut(const QPoint& point) const { return {LaidOut(point.x()), point.y()}; }
    /// Where a column is seen, be it below the frozen ones.
    int Left(int column) const;
    /// What is seen of a cell that the base has at `laidOut`. One that is covered is left of the table.
    QRect Seen(const QRect& laidOut, int column) const;
    /// How far the table has to be scrolled for a column to be in sight; as far as it is where that is so.
    int ScrolledFor(int column) const;
    /// The cells of lines that reach into `dirty`, in the manner of the base. `option`: what all cells have in common.
    void PaintCells(QPainter& painter, QStyleOptionViewItem option, const QRect& dirty) const;
    /// The line that tells the frozen part from what goes below it.
    void PaintEdge(QPainter& painter, int height) const;

private:
    bool IsScrolled() const { return Offset() > 0; }
    int Offset() const;
    int Named() const;

    const CGenGrid& m_grid;
};
