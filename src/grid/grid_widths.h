// How wide the columns of a grid and its row numbers are.
#pragma once

#include <QFontMetricsF>
#include <QObject>
#include <QVariantList>
#include <array>

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
    /// Whether the user has made a column wider or narrower.
    bool AreChosen() const { return m_areChosen; }
    void SetChosen() { m_areChosen = true; }
    /// The widths that he has chosen, one a column.
    void Choose(const QVariantList& widths);
    /// A column becomes as wide as its header and its texts need, be it wider or narrower.
    void Fit(int column);
    void MakeRoomForMarks();
    /// Likewise for the text of one cell.
    void MakeRoomFor(const QModelIndex& cell);

private:
    /// Of the grid's font.
    struct Letters
    {
        explicit Letters(const QFont& of);
        double Bound(const QString& text);

        QFontMetricsF font;
        double scale;                     // times the font that the columns' widths are meant for
        std::array<double, 128> advances; // of the Latin ones; negative until it is asked for
    };

    void UpdateRowNumbers();
    int WidthOfTexts(int column, int most, int least);

    CGenGrid& m_grid;
    Letters m_letters;
    bool m_areChosen = false;
    int m_columnsSet = 0; // from then on their widths are the user's
};
