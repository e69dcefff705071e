// How wide the columns of a grid and its row numbers are.
#pragma once

#include <QObject>

class CGenGrid;

class CGridWidths : public QObject
{
public:
    /// A child of the grid.
    explicit CGridWidths(CGenGrid& grid);

    /// Row numbers for as many rows as there are; first widths for columns that have come since.
    void Update();
    /// All columns as wide as at the start: the font is another.
    void Reset();
    /// Makes columns wider that their texts do not fit into; what the user has made wider stays.
    void MakeRoom();

private:
    void UpdateRowNumbers();
    int WidthOfTexts(int column, int most) const;

    CGenGrid& m_grid;
    int m_columnsSet = 0; // from then on their widths are the user's
};
