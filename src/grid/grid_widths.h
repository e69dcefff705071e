// How wide the columns of a grid and its row numbers are.
#pragma once

#include <QFontMetricsF>
#include <QObject>
#include <QVariantList>
#include <array>
#include <vector>

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
    void SetChosen() { m_areChosen = m_areChosen || !m_isArranging; }
    /// The widths that he has chosen, one a column.
    void Choose(const QVariantList& widths);
    /// A column becomes as wide as its header and its texts need, be it wider or narrower.
    void Fit(int column);
    void MakeRoomForMarks();
    /// Likewise for the text of one cell.
    void MakeRoomFor(const QModelIndex& cell);
    /// From now on the grid wants to be as wide as its columns, and no wider: it stands beside others, and what it left
    /// empty would be missing there.
    void KeepGridAsWide();
    /// Whether the grid wants its columns in sight rather than having something beside it.
    void KeepColumns(bool keep);
    /// What the grid needs to show all of its columns, and the bar that scrolls its lines.
    int WidthOfGrid() const;
    /// What it needs when its columns have given all that they can. The last of many have to be scrolled to.
    int LeastWidthOfGrid();

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

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
    void Widen(int column, int width);
    void SetWidth(int column, int width);
    int Least(std::size_t column);
    int BesideColumns() const;
    void Arrange();
    void FitGrid();

    CGenGrid& m_grid;
    Letters m_letters;
    bool m_areChosen = false, m_isArranging = false, m_isAsWide = false, m_keepsColumns = false;
    struct Column
    {
        int usual;     // where there is room
        int least = 0; // what its header and its texts need; 0 until somebody has asked
    };
    std::vector<Column> m_columns; // those that have got their first width
    int m_room = -1;               // for which they were arranged
};
