#include "grid/grid_header.h"

#include "grid/filter_fields.h"
#include "grid/gen_grid.h"
#include "grid/grid_menus.h"
#include "grid/grid_widths.h"
#include "grid/lines_view.h"

#include <QContextMenuEvent>
#include <QGuiApplication>
#include <QLabel>
#include <QMenu>
#include <QScrollBar>
#include <QStyle>
#include <algorithm>

CGridHeader::CGridHeader(CGenGrid& grid)
    : QHeaderView(Qt::Horizontal, &grid),
      m_grid(grid),
      m_fields(new CFilterFields(grid, *this)),
      m_count(new QLabel(&grid))
{
    setSectionsClickable(true);
    setHighlightSections(false);
    m_count->hide();
    m_count->setObjectName(QStringLiteral("shownLines"));
    connect(this, &QHeaderView::sectionDoubleClicked, this,
            [this](int column) { LinesView::SortByClick(m_grid, column); });
    connect(this, &QHeaderView::sectionResized, m_fields, &CFilterFields::Place);
    connect(this, &QHeaderView::sectionResized, this, [this] {
        if (QGuiApplication::mouseButtons().testFlag(Qt::LeftButton)) // by the user, not to make room
            m_grid.Widths().SetChosen();
    });
    connect(grid.horizontalScrollBar(), &QScrollBar::valueChanged, m_fields, &CFilterFields::Place);
    connect(grid.horizontalScrollBar(), &QScrollBar::rangeChanged, this, &CGridHeader::ShowCount);
    connect(grid.Model(), &CGridModel::ViewChanged, this, [this] {
        if (!m_fields->AreShown() && m_grid.Model()->Shown().IsFiltered())
            m_fields->Enter(-1);
        m_fields->ShowTexts();
        ShowCount();
        viewport()->update();
    });
    connect(grid.Model(), &QAbstractItemModel::dataChanged, this, &CGridHeader::ShowCount);
}

QSize CGridHeader::sizeHint() const
{
    const QSize headers = QHeaderView::sizeHint();
    return {headers.width(), headers.height() + m_fields->Height()};
}

/// It shows nothing of what is selected, and asks for each column that it paints whether all of its cells are, one by
/// one: its own selection, in which nothing is, answers at once.
void CGridHeader::setSelectionModel(QItemSelectionModel* selection)
{
    if (!selectionModel() || selectionModel()->model() != selection->model())
        QHeaderView::setSelectionModel(selection);
}

void CGridHeader::initStyleOptionForIndex(QStyleOptionHeader* option, int column) const
{
    QHeaderView::initStyleOptionForIndex(option, column);
    option->text = m_grid.Model()->Column(column).HeaderLines().join(u'\n');
    const auto& keys = m_grid.Model()->SortedBy();
    const auto key = std::ranges::find(keys, column, &SortKey::column);
    if (key != keys.end())
        option->sortIndicator = key->descending ? QStyleOptionHeader::SortUp : QStyleOptionHeader::SortDown;
}

/// Room for all lines.
QSize CGridHeader::sectionSizeFromContents(int column) const
{
    QSize size = QHeaderView::sectionSizeFromContents(column);
    size.rheight() += int(m_grid.Model()->Column(column).HeaderLines().size() - 1) * fontMetrics().lineSpacing();
    return size;
}

void CGridHeader::paintSection(QPainter* painter, const QRect& rect, int column) const
{
    QHeaderView::paintSection(painter, rect.adjusted(0, 0, 0, -m_fields->Height()), column);
}

void CGridHeader::contextMenuEvent(QContextMenuEvent* event)
{
    const int column = logicalIndexAt(event->pos());
    if (column < 0 || !m_grid.CommitEditor())
        return;
    QMenu menu(&m_grid);
    GridMenus::AddForColumn(menu, m_grid, column);
    menu.exec(event->globalPos());
}

void CGridHeader::ShowCount()
{
    const QString text = m_grid.Model()->CountText();
    QScrollBar& bar = *m_grid.horizontalScrollBar();
    bar.setVisible(text.isEmpty() || bar.minimum() < bar.maximum()); // nobody moves one that has nowhere to go
    m_count->setText(text);
    if (m_count->isVisibleTo(&m_grid) == !text.isEmpty())
        return;
    if (!text.isEmpty()) {
        QFont font = m_grid.font(); // that fits beside a scroll bar
        font.setPixelSize(std::min(m_grid.fontMetrics().ascent(),
                                   style()->pixelMetric(QStyle::PM_ScrollBarExtent, nullptr, &m_grid) - 4));
        m_count->setFont(font);
        m_grid.addScrollBarWidget(m_count, Qt::AlignLeft);
    }
    m_count->setVisible(!text.isEmpty());
    m_grid.setHorizontalScrollBarPolicy(text.isEmpty() ? Qt::ScrollBarAsNeeded : Qt::ScrollBarAlwaysOn);
}

void CGridHeader::resizeEvent(QResizeEvent* event)
{
    QHeaderView::resizeEvent(event);
    m_fields->Place();
}

void CGridHeader::changeEvent(QEvent* event)
{
    QHeaderView::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        m_fields->ShowTexts();
        ShowCount();
    }
}
