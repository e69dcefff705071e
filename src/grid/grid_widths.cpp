#include "grid/grid_widths.h"

#include "grid/gen_grid.h"
#include "grid/line_header.h"

#include <QHeaderView>
#include <QScopedValueRollback>
#include <QStyle>
#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>

namespace {

constexpr int NumberColumnWidth = 40;
// Pixels of the font that the columns' widths are meant for: its height, and the mean width of the Latin letters.
constexpr double OriginalFontHeight = 13, OriginalLetterWidth = 6;
constexpr int RowsAtStart = 30, RowsForRoom = 4000; // whose texts are measured, at even distances through the table
constexpr int Margin = 16;                          // pixels beside a text
constexpr int MostOfAWindow = 320;                  // pixels that a long name may take
constexpr int MostBesideOthers = 480;               // pixels of columns that a table may claim from others
constexpr int LeastOfAWindow = 120;                 // pixels that stay for the columns, which can be scrolled to

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
    grid.viewport()->installEventFilter(this);
    connect(&KsUnits::Instance(), &KsUnits::DigitsChanged, this, [this] {
        if (KsUnits::Instance().AllDigits() || m_areChosen)
            MakeRoom();
        else
            Reset(); // what all digits needed is given back
    });
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
    const auto count = std::size_t(m_grid.ColumnCount());
    const bool areNew = m_columns.size() != count;
    if (areNew)
        m_room = -1;
    if (m_columns.size() > count)
        m_columns.resize(count, {});
    while (m_columns.size() < count) {
        const auto column = int(m_columns.size());
        const int width = int(m_grid.Model()->Column(column).width * m_letters.scale);
        m_columns.push_back({.usual = WidthOfTexts(column, RowsAtStart, width)});
        SetWidth(column, m_columns.back().usual);
    }
    MakeRoomForMarks();
    Arrange();
    if (areNew)
        m_grid.updateGeometry(); // somebody may have asked before
}

/// Where the columns do not fit beside each other they give up what neither their headers nor their texts need, each in
/// proportion, until they do or have nothing left to give.
void CGridWidths::Arrange()
{
    const int room = m_grid.viewport()->width();
    if (m_areChosen || m_columns.empty() || m_room == room || !m_grid.isVisible())
        return;
    m_room = room;
    int missing = -room, spare = 0;
    for (const Column& column : m_columns)
        missing += column.usual;
    for (std::size_t i = 0; missing > 0 && i < m_columns.size(); ++i)
        spare += m_columns[i].usual - Least(i);
    const double share = spare > 0 ? std::clamp(missing / double(spare), 0.0, 1.0) : 0.0;
    for (std::size_t i = 0; i < m_columns.size(); ++i) {
        const Column& column = m_columns[i];
        const int given = missing > 0 ? int(std::ceil((column.usual - column.least) * share)) : 0;
        SetWidth(int(i), column.usual - given);
    }
    MakeRoomForMarks();
}

/// Nobody has chosen it, even where a click on a header was the reason.
void CGridWidths::SetWidth(int column, int width)
{
    const QScopedValueRollback arranging(m_isArranging, true);
    m_grid.setColumnWidth(column, width);
}

int CGridWidths::Least(std::size_t i)
{
    Column& column = m_columns[i];
    if (column.least == 0)
        column.least = std::min(column.usual, WidthOfTexts(int(i), RowsForRoom, 2 * Margin));
    return column.least;
}

bool CGridWidths::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::Resize || event->type() == QEvent::Show)
        Arrange();
    return QObject::eventFilter(object, event);
}

void CGridWidths::KeepGridAsWide()
{
    m_isAsWide = true;
    connect(m_grid.horizontalHeader(), &QHeaderView::sectionResized, this, &CGridWidths::FitGrid);
    connect(m_grid.horizontalHeader(), &QHeaderView::sectionCountChanged, this, &CGridWidths::FitGrid);
    FitGrid();
}

void CGridWidths::KeepColumns(bool keep)
{
    if (std::exchange(m_keepsColumns, keep) != keep)
        m_grid.updateGeometry();
}

int CGridWidths::BesideColumns() const
{
    return m_grid.verticalHeader()->width() + m_grid.style()->pixelMetric(QStyle::PM_ScrollBarExtent) +
           2 * m_grid.frameWidth();
}

int CGridWidths::WidthOfGrid() const
{
    int columns = m_areChosen ? m_grid.horizontalHeader()->length() : 0;
    for (std::size_t i = 0; !m_areChosen && i < m_columns.size(); ++i)
        columns += m_columns[i].usual;
    return columns + BesideColumns();
}

int CGridWidths::LeastWidthOfGrid()
{
    const int most = m_keepsColumns ? MostBesideOthers : m_isAsWide ? MostOfAWindow : LeastOfAWindow;
    int columns = 0;
    for (std::size_t i = 0; columns < most && i < m_columns.size(); ++i)
        columns += Least(i);
    return std::min(columns, most) + BesideColumns();
}

void CGridWidths::FitGrid()
{
    m_grid.setMaximumWidth(std::min(WidthOfGrid(), MostOfAWindow + BesideColumns()));
    m_grid.updateGeometry();
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
            SetWidth(key.column, text + 2 * mark);
    }
}

void CGridWidths::Reset()
{
    m_letters = Letters(m_grid.font());
    if (m_columns.empty())
        return UpdateRowNumbers(); // the rows are not there yet
    m_columns.clear();
    Update();
}

void CGridWidths::MakeRoom()
{
    for (int column = 0; column < std::min(int(m_columns.size()), m_grid.ColumnCount()); ++column)
        Widen(column, WidthOfTexts(column, RowsForRoom, m_grid.columnWidth(column)));
}

void CGridWidths::Widen(int column, int width)
{
    Column& its = m_columns[std::size_t(column)];
    its.usual = std::max(its.usual, width);
    its.least = 0;
    SetWidth(column, width);
}

void CGridWidths::Choose(const QVariantList& widths)
{
    constexpr int least = 16, most = 2000; // pixels, whatever stands in settings
    Update();
    for (int column = 0; column < std::min(int(widths.size()), m_grid.ColumnCount()); ++column)
        SetWidth(column, std::clamp(widths[column].toInt(), least, most));
    m_areChosen = true;
}

void CGridWidths::Fit(int column)
{
    m_areChosen = true;
    SetWidth(column, WidthOfTexts(column, RowsForRoom, 2 * Margin));
    MakeRoomForMarks();
}

void CGridWidths::MakeRoomFor(const QModelIndex& cell)
{
    const QString text = m_grid.TextAt(cell.row() + 1, cell.column() + 1);
    const int width = m_grid.columnWidth(cell.column());
    if (cell.column() < int(m_columns.size()) && m_letters.Bound(text) > width - Margin)
        Widen(cell.column(),
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
