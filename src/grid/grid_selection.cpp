#include "grid/grid_selection.h"

#include <QHeaderView>
#include <QMouseEvent>
#include <QScopedValueRollback>
#include <QTableView>
#include <algorithm>

CGridSelection::CGridSelection(QTableView& grid) : QObject(&grid), m_grid(grid)
{
    grid.verticalHeader()->viewport()->installEventFilter(this);
    connect(grid.selectionModel(), &QItemSelectionModel::selectionChanged, this,
            [this] { m_linesChosen = m_choosingLines; });
}

bool CGridSelection::eventFilter(QObject* object, QEvent* event)
{
    const bool isPress = event->type() == QEvent::MouseButtonPress || event->type() == QEvent::MouseButtonDblClick;
    if (isPress && static_cast<const QMouseEvent*>(event)->button() == Qt::LeftButton) // another one selects nothing
        m_choosingLines = m_linesChosen = true;
    else if (event->type() == QEvent::MouseButtonRelease)
        m_choosingLines = false;
    return QObject::eventFilter(object, event);
}

void CGridSelection::Select(const QModelIndex& from, const QModelIndex& to)
{
    m_grid.selectionModel()->select({from, to}, QItemSelectionModel::ClearAndSelect);
}

void CGridSelection::SelectLines(int first, int last)
{
    const QScopedValueRollback choosing(m_choosingLines, true);
    Select(m_grid.model()->index(first, 0), m_grid.model()->index(last, m_grid.model()->columnCount() - 1));
    m_linesChosen = true;
}

QModelIndex CGridSelection::OtherEnd() const
{
    const QModelIndex current = m_grid.currentIndex();
    const QItemSelectionRange selected = Block().value_or(QItemSelectionRange(current));
    const int row = current.row() == selected.top() ? selected.bottom() : selected.top();
    const int column = current.column() == selected.left() ? selected.right() : selected.left();
    return m_grid.model()->index(row, column);
}

void CGridSelection::GrowTo(const QModelIndex& cell)
{
    const QScopedValueRollback choosing(m_choosingLines, m_linesChosen);
    const QModelIndex other = OtherEnd();
    const auto corner = [&](auto end) {
        return m_grid.model()->index(end(other.row(), cell.row()), end(other.column(), cell.column()));
    };
    m_grid.selectionModel()->setCurrentIndex(cell, QItemSelectionModel::NoUpdate);
    Select(corner([](int a, int b) { return std::min(a, b); }), corner([](int a, int b) { return std::max(a, b); }));
}

bool CGridSelection::AreLines() const
{
    const auto lines = Block();
    return m_linesChosen && lines && lines->width() == m_grid.model()->columnCount();
}

CGridSelection::Shape CGridSelection::ShapeNow() const
{
    const QModelIndex current = m_grid.currentIndex();
    const QItemSelectionRange selected = Block().value_or(QItemSelectionRange(current));
    return {selected.left(), selected.right(), current.row() - selected.top(), current.column(), m_linesChosen};
}

void CGridSelection::SelectAgain(const Shape& shape, int top, int bottom)
{
    const QScopedValueRollback choosing(m_choosingLines, shape.isOfLines);
    const QAbstractItemModel& model = *m_grid.model();
    m_grid.selectionModel()->setCurrentIndex(
        model.index(std::clamp(top + shape.row, top, bottom), std::max(shape.column, 0)),
        QItemSelectionModel::NoUpdate);
    Select(model.index(top, shape.left), model.index(bottom, shape.right));
    m_grid.scrollTo(model.index(bottom, shape.column));
    m_grid.scrollTo(model.index(top, shape.column));
    m_grid.scrollTo(m_grid.currentIndex());
    m_linesChosen = shape.isOfLines;
}

std::optional<QItemSelectionRange> CGridSelection::Block() const
{
    const QItemSelection selection = m_grid.selectionModel()->selection();
    // The current cell is always selected; alone it is no selection.
    if (selection.size() != 1 || (selection.front().width() == 1 && selection.front().height() == 1))
        return std::nullopt;
    return selection.front();
}

std::optional<QItemSelectionRange> CGridSelection::Lines(int fixedRows) const
{
    const int columns = m_grid.model()->columnCount();
    auto lines = Block();
    const bool isWhole = lines && lines->width() == columns;
    const bool ofCells = m_choice == LineChoice::LinesOfCells;
    if ((m_choice == LineChoice::CurrentLine && !isWhole) || (ofCells && !lines))
        lines.emplace(m_grid.currentIndex());
    else if (!ofCells && (!m_linesChosen || !isWhole))
        return std::nullopt;
    if (!lines->isValid() || lines->bottom() < fixedRows)
        return std::nullopt;
    return QItemSelectionRange(m_grid.model()->index(std::max(lines->top(), fixedRows), 0),
                               m_grid.model()->index(lines->bottom(), columns - 1));
}

int CGridSelection::PlaceOfNewLine(int fixedRows) const
{
    const int last = m_grid.model()->rowCount();
    if (m_choice == LineChoice::LinesOfCells)
        return m_grid.currentIndex().isValid() ? m_grid.currentIndex().row() + 1 : last;
    const auto selected = Block();
    return selected ? std::max(selected->top(), fixedRows) : last;
}
