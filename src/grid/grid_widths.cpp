#include "grid/grid_widths.h"

#include "grid/gen_grid.h"
#include "grid/line_header.h"

#include <QHeaderView>
#include <QStyle>
#include <algorithm>
#include <limits>

namespace {

constexpr int NumberColumnWidth = 40;
// Pixels of the font that the columns' widths are meant for: its height, and the mean width of the Latin letters.
constexpr double OriginalFontHeight = 13, OriginalLetterWidth = 6;
constexpr int RowsAtStart = 30, RowsForRoom = 4000; // whose texts are measured, at even distances through the table
constexpr int Margin = 16;                          // pixels beside a text
constexpr int MostOfAWindow = 320;                  // pixels that a long name may take

double FontScale(const QFontMetrics& font)
{
    const QString letters = QStringLiteral("ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz");
    const double letterWidth = double(font.horizontalAdvance(letters)) / double(letters.size());
    return std::max({1.0, font.height() / OriginalFontHeight, letterWidth / OriginalLetterWidth});
}

} // namespace

CGridWidths::Letters::Letters(const QFont& of) : font(of), scale(FontScale(QFontMetrics(of)))
{
    advances.fill(-1);
}

/// Not less than what the text needs, and found much sooner: what its letters take one by one.
double CGridWidths::Letters::Bound(const QString& text)
{
    double width = 0;
    for (const QChar letter : text) {
        if (letter.unicode() >= advances.size())
            return std::numeric_limits<double>::infinity();
        double& advance = advances[letter.unicode()];
        if (advance < 0)
            advance = font.horizontalAdvance(letter);
        width += advance;
    }
    return width;
}

CGridWidths::CGridWidths(CGenGrid& grid) : QObject(&grid), m_grid(grid), m_letters(grid.font())
{
    grid.setVerticalHeader(new CLineHeader(*grid.Model(), &grid));
    grid.verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    grid.verticalHeader()->setHighlightSections(false);
    grid.verticalHeader()->setDefaultAlignment(Qt::AlignRight | Qt::AlignVCenter);
    UpdateRowNumbers();
    connect(&KsUnits::Instance(), &KsUnits::DigitsChanged, this, &CGridWidths::MakeRoom);
    connect(grid.Model(), &CGridModel::CellModified, this, &CGridWidths::MakeRoomFor);
    connect(
        &KsUnits::Instance(), &KsUnits::Changed, this,
        [this] {
            if (KsUnits::Instance().AllDigits())
                MakeRoom();
        },
        Qt::QueuedConnection); // when the view shows the new unit
}

void CGridWidths::UpdateRowNumbers()
{
    QHeaderView& numbers = *m_grid.verticalHeader();
    const QFontMetrics font = m_grid.fontMetrics();
    const int height = font.height() + 8;
    if (numbers.defaultSectionSize() != height) // setting it visits every row
        numbers.setDefaultSectionSize(height);
    const int lines = m_grid.Model()->LineNumber(m_grid.RowCount()) - 1;
    const int longest = font.horizontalAdvance(QString::number(std::max(lines, 100))) + 12;
    const int width = std::max(int(NumberColumnWidth * m_letters.scale), longest);
    if (numbers.width() != width)
        numbers.setFixedWidth(width);
}

void CGridWidths::Update()
{
    UpdateRowNumbers();
    for (int column = std::min(m_columnsSet, m_grid.ColumnCount()); column < m_grid.ColumnCount(); ++column) {
        const int width = int(m_grid.Model()->Column(column).width * m_letters.scale);
        m_grid.setColumnWidth(column, WidthOfTexts(column, RowsAtStart, width));
    }
    m_columnsSet = m_grid.ColumnCount();
    MakeRoomForMarks();
}

/// The mark of a sorted column stands beside the header's text.
void CGridWidths::MakeRoomForMarks()
{
    const int mark = m_grid.style()->pixelMetric(QStyle::PM_HeaderMarkSize) + Margin;
    for (const SortKey& key : m_grid.Model()->SortedBy()) {
        const ColumnSpec& column = m_grid.Model()->Column(key.column);
        int text = 0;
        for (const QString& line : column.HeaderLines())
            text = std::max(text, m_grid.fontMetrics().horizontalAdvance(line));
        if (m_grid.columnWidth(key.column) < text + 2 * mark)
            m_grid.setColumnWidth(key.column, text + 2 * mark);
    }
}

void CGridWidths::Reset()
{
    m_letters = Letters(m_grid.font());
    if (std::exchange(m_columnsSet, 0) > 0) // not before the rows are there
        Update();
    else
        UpdateRowNumbers();
}

void CGridWidths::MakeRoom()
{
    for (int column = 0; column < std::min(m_columnsSet, m_grid.ColumnCount()); ++column)
        m_grid.setColumnWidth(column, WidthOfTexts(column, RowsForRoom, m_grid.columnWidth(column)));
}

void CGridWidths::Choose(const QVariantList& widths)
{
    constexpr int least = 16, most = 2000; // pixels, whatever stands in settings
    Update();
    for (int column = 0; column < std::min(int(widths.size()), m_grid.ColumnCount()); ++column)
        m_grid.setColumnWidth(column, std::clamp(widths[column].toInt(), least, most));
    m_areChosen = true;
}

void CGridWidths::Fit(int column)
{
    m_grid.setColumnWidth(column, WidthOfTexts(column, RowsForRoom, 2 * Margin));
    MakeRoomForMarks();
}

void CGridWidths::MakeRoomFor(const QModelIndex& cell)
{
    const QString text = m_grid.TextAt(cell.row() + 1, cell.column() + 1);
    const int width = m_grid.columnWidth(cell.column());
    if (cell.column() < m_columnsSet && m_letters.Bound(text) > width - Margin)
        m_grid.setColumnWidth(
            cell.column(),
            std::max(width, std::min(m_grid.fontMetrics().horizontalAdvance(text) + Margin, MostOfAWindow)));
}

/// At least `least`, and what the header and the texts need: of `most` rows of the whole table, and of those in sight.
/// Only a text that is as long as any before is measured, and only where its letters might need more than there is.
int CGridWidths::WidthOfTexts(int column, int most, int least)
{
    const QFontMetrics font = m_grid.fontMetrics();
    int width = std::min(least, MostOfAWindow) - Margin;
    const auto make = [&](const QString& text) {
        if (m_letters.Bound(text) > width)
            width = std::max(width, font.horizontalAdvance(text));
    };
    for (const QString& line : m_grid.Model()->Column(column).HeaderLines())
        make(line);
    qsizetype longest = 0;
    const auto measure = [&](int row) {
        const QString text = m_grid.TextAt(row, column + 1);
        if (text.size() < longest)
            return;
        longest = text.size();
        make(text);
    };
    const int rows = m_grid.RowCount(), step = std::max(1, rows / most);
    for (int row = 1; row <= rows; row += step)
        measure(row);
    const int inSight = std::max(1, m_grid.rowAt(0) + 1);
    for (int row = inSight; step > 1 && row < std::min(rows, inSight + RowsAtStart); ++row)
        measure(row);
    return std::max(least, std::min(width + Margin, MostOfAWindow));
}
