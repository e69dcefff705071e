#include "grid/gen_grid.h"

#include "grid/cell_text.h"
#include "grid/frozen_columns.h"
#include "grid/grid_editors.h"
#include "grid/grid_header.h"
#include "grid/grid_host.h"
#include "grid/grid_input.h"
#include "grid/grid_keys.h"
#include "grid/grid_menus.h"
#include "grid/grid_texts.h"
#include "grid/grid_widths.h"
#include "grid/selection_summary.h"
#include "grid/typing.h"
#include "ks/fc/doc.h"
#include "ks/fc/keep_in_sight.h"
#include "ks/language/language.h"

#include <QAbstractButton>
#include <QApplication>
#include <QContextMenuEvent>
#include <QHeaderView>
#include <QMenu>
#include <QPainter>
#include <algorithm>

CGenGrid::CGenGrid(QWidget* parent)
    : QTableView(parent),
      m_frozen(std::make_unique<CFrozenColumns>(*this)),
      m_model(new CGridModel(this)),
      m_delegate(new CGridDelegate(this)),
      m_widths(new CGridWidths(*this))
{
    setFont(KsLangGetUserFont());
    setModel(m_model);
    setItemDelegate(m_delegate);
    m_header = new CGridHeader(*this);
    setHorizontalHeader(m_header);
    m_selection = new CGridSelection(*this);
    m_input = new CGridInput(*this);
    m_summary = new CSelectionSummary(*this);
    setTabKeyNavigation(false); // the key table moves
    setEditTriggers(DoubleClicked | EditKeyPressed | AnyKeyPressed);
    setSelectionMode(ContiguousSelection);
    setHorizontalScrollMode(ScrollPerPixel);
    setWordWrap(false);
    QSizePolicy policy = sizePolicy();
    policy.setRetainSizeWhenHidden(true); // a hidden grid leaves the rest of the page where it is
    setSizePolicy(policy);
    // A click on a header moves the current cell as one on a cell does; one on the corner selects all.
    QWidget* corner = findChild<QAbstractButton*>(QString(), Qt::FindDirectChildrenOnly);
    for (QWidget* part : {verticalHeader()->viewport(), horizontalHeader()->viewport(), corner})
        part->installEventFilter(this);
    connect(m_model, &CGridModel::CellModified, this, [this] { m_modified = true; });
    // The numbers of a filter are in the unit shown.
    connect(&KsUnits::Instance(), &KsUnits::Changed, this, &CGenGrid::FilterAfresh,
            Qt::QueuedConnection);                           // what was typed in the other unit has been stored
    connect(m_model, &CGridModel::modelReset, this, [this] { // other rows, none of which is current
        m_modified = false;
        m_goneFrom = 0;
        m_currentLine.reset();
    });
    connect(m_model, &CGridModel::layoutChanged, this, [this] {
        m_lastRow = CurrentRow();
        if (m_lastRow > 0)
            NoteLine(m_lastRow - 1);
    });
}

CGenGrid::~CGenGrid()
{
    // An open editor loses the focus while the grid is taken apart; it must not commit to what is left of it.
    if (QWidget* editor = m_delegate->Editor())
        editor->removeEventFilter(m_delegate);
}

// ---- what it shows -----------------------------------------------------------------------------

QString CGenGrid::LineText() const
{
    // As the numbers beside the lines have it: that of the global values is the first one, where there is one.
    const int fixed = m_model->FixedRows(), line = CurrentLine(), column = CurrentColumn() - 1;
    const int lines = std::max(m_model->LineCount(), RowCount() - fixed) + fixed; // with the one that is offered
    QStringList texts;
    if (line > 0 && column >= 0) {
        QString text = GridTexts::tr("Line %1 of %2").arg(line).arg(lines);
        if (m_model->HidesDigits(CurrentRow() - 1, column)) {
            const ColumnSpec& spec = m_model->Column(column);
            const QString number = FullText(spec, m_model->Value(CurrentRow() - 1, column));
            text = GridTexts::tr("Line %1 of %2, %3: %4").arg(line).arg(lines).arg(spec.header(), number);
        }
        texts << text;
    }
    texts << m_model->CountText();
    texts.removeAll(QString());
    return texts.join(QStringLiteral("   "));
}

QString CGenGrid::SelectionText() const
{
    return m_summary->Text();
}

QSize CGenGrid::sizeHint() const
{
    return {m_widths->WidthOfGrid(), QTableView::sizeHint().height()};
}

QSize CGenGrid::minimumSizeHint() const
{
    return {m_widths->LeastWidthOfGrid(), QTableView::minimumSizeHint().height()};
}

void CGenGrid::Refresh()
{
    const int row = CurrentRow(), column = CurrentColumn();
    m_model->Sync();
    FollowLine(row, column);
    m_widths->Update();
    if (!m_model->Shown().IsPlain())
        verticalHeader()->viewport()->update();
}

/// Where lines came or went - with a save, by another editor - the current cell goes with its line. When that is gone
/// no other line takes its place: whoever types on would change one that nobody chose.
void CGenGrid::FollowLine(int row, int column)
{
    const CKsDoc* const document = m_model->Document();
    const bool isReplaced = document && std::exchange(m_contents, document->Contents()) != document->Contents();
    if (!m_currentLine || (row == 0 && !HasLostItsLine()))
        return;
    int now = m_model->RowNamed(*m_currentLine, row - 1) + 1;
    if (now == 0 && isReplaced)
        now = RowLikeCurrent(row);
    if (now > 0) {
        NoteLine(now - 1);
        if (now != CurrentRow())
            SetCurrentCell(now, column);
    } else {
        if (!m_model->Shown().IsFiltered())
            m_currentLine.reset(); // else it may come back into sight
        m_goneFrom = std::max(row, m_goneFrom);
        clearSelection();
        selectionModel()->clearCurrentIndex();
    }
}

void CGenGrid::NoteLine(int row)
{
    constexpr int First = 2; // branch and chainage, where a line is a place
    m_currentLine = m_model->NameOf(row);
    m_currentPlace.clear();
    for (int column = 0; column < std::min(First, ColumnCount()); ++column)
        m_currentPlace.push_back(m_model->Value(row, column));
}

/// Of other content: the line at the place of the one that was current, or else the one that stands where it stood.
int CGenGrid::RowLikeCurrent(int row) const
{
    const auto isLike = [this](int line) {
        for (int column = 0; column < int(m_currentPlace.size()); ++column)
            if (m_model->Value(line - 1, column) != m_currentPlace[std::size_t(column)])
                return false;
        return true;
    };
    if (row > 0 && row <= RowCount() && isLike(row))
        return row;
    for (int line = m_model->FixedRows() + 1; line <= RowCount(); ++line)
        if (isLike(line))
            return line;
    return std::min(row, RowCount());
}

void CGenGrid::ChangeView(const std::function<void(CGridModel& model)>& change)
{
    StoreEditedLine();
    const int row = CurrentRow(), column = CurrentColumn();
    if (row > 0) // the others that are selected would be other lines
        selectionModel()->select(currentIndex(), QItemSelectionModel::ClearAndSelect);
    change(*m_model);
    FollowLine(row, column);
    m_widths->Update();
    verticalHeader()->viewport()->update();
    viewport()->update();
    if (m_host)
        m_host->CellCurrent(*this);
}

void CGenGrid::ShowLine(int number, int column)
{
    const int line = std::max(number, 1) - 1;
    if (m_model->Unhide(std::size_t(line)))
        m_model->Document()->Say(
            GridTexts::tr("Line %1 does not pass the filter; it is shown until the filter changes.").arg(number));
    const bool isThere = m_model->Rows() && std::size_t(line) < m_model->Rows()->Count();
    SetCurrentCell(isThere ? m_model->ShownRow(std::size_t(line)) + 1 : RowCount(), column);
}

void CGenGrid::ShowPlace(int number, int column)
{
    for (int line = std::max(number, 1) - 1; line >= 0; --line)
        if (const int row = m_model->ShownRow(std::size_t(line)); row >= 0)
            return SetCurrentCell(row + 1, column);
    if (RowCount() > 0)
        SetCurrentCell(1, column);
}

void CGenGrid::Reload()
{
    Refresh();
    if (!currentIndex().isValid() && RowCount() > 0 && !HasLostItsLine())
        SetCurrentCell(1, 1);
}

void CGenGrid::paintEvent(QPaintEvent* event)
{
    PaintCells(event->region());
    const bool isFiltered = m_model->Shown().IsFiltered();
    if (RowCount() > 0 || !(MayGrow() || isFiltered) || !isEnabled())
        return;
    QPainter painter(viewport());
    painter.setPen(palette().color(QPalette::Text));
    painter.drawText(viewport()->rect().adjusted(4, 4, -4, -4), Qt::AlignTop | Qt::AlignHCenter | Qt::TextWordWrap,
                     isFiltered ? GridTexts::tr("No line passes the filter.")
                                : GridTexts::tr("No lines. Insert adds one."));
}

void CGenGrid::changeEvent(QEvent* event)
{
    QTableView::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange)
        m_widths->Reset();
    // Texts of entries are others now.
    if (event->type() == QEvent::LanguageChange && m_model->Shown().IsFiltered())
        QMetaObject::invokeMethod(this, &CGenGrid::FilterAfresh, Qt::QueuedConnection);
}

void CGenGrid::FilterAfresh()
{
    if (m_model->Shown().IsFiltered())
        ChangeView([](CGridModel& model) { model.Filter(QStringList(model.Filters())); });
}

// ---- editing -----------------------------------------------------------------------------------

bool CGenGrid::IsEditing() const
{
    return m_delegate->Editor() != nullptr;
}

bool CGenGrid::CommitEditor()
{
    return m_delegate->Commit();
}

bool CGenGrid::MayChange() const
{
    return !m_model->Document() || m_model->Document()->MayChange();
}

bool CGenGrid::edit(const QModelIndex& index, EditTrigger trigger, QEvent* event)
{
    constexpr EditTriggers byUser = DoubleClicked | EditKeyPressed | AnyKeyPressed;
    if (byUser.testFlag(trigger) && index.isValid() && !MayChange())
        return false;
    return QTableView::edit(index, trigger, event);
}

/// Typing edits the cell; what comes here found none to edit. In a locked cell that is told: who types on with Tab
/// would put what follows into the wrong columns.
void CGenGrid::keyboardSearch(const QString& typed)
{
    const QModelIndex cell = currentIndex();
    if (typed.isEmpty() || !typed.front().isPrint() || !cell.isValid() ||
        !m_model->IsLocked(cell.row(), cell.column()) || !MayChange())
        return;
    TellRefusal(*this, GridTexts::tr("The cell is locked."), RefusalDetails(PlaceText(cell), typed, {}, {}));
}

QString CGenGrid::PlaceText(const QModelIndex& cell) const
{
    const QString line = QString::number(m_model->LineNumber(cell.row()));
    return GridTexts::tr("%1, line %2").arg(m_model->Column(cell.column()).header(), line);
}

bool CGenGrid::LeaveField()
{
    return m_host ? m_host->LeaveField() : CommitEditor();
}

void CGenGrid::StoreEditedLine(BlankRule blanks)
{
    if (!std::exchange(m_modified, false))
        return;
    if (blanks == BlankRule::Fill)
        m_model->Store(blanks);
    if (m_host)
        m_host->LineEdited(*this);
}

void CGenGrid::ActOn(int row, int column)
{
    const QModelIndex cell = m_model->index(row - 1, column - 1);
    const ColumnSpec& spec = m_model->Column(cell.column());
    if (!spec.ActsAtOnce() || m_model->IsLocked(cell.row(), cell.column()) || !MayChange())
        return;
    if (spec.Kind() == CellKind::Flag) {
        const bool checked = cell.data(Qt::CheckStateRole).toInt() == Qt::Checked;
        m_model->setData(cell, checked ? QStringLiteral("0") : QStringLiteral("1"), Qt::EditRole);
        StoreEditedLine();
    } else if (m_host) {
        StoreEditedLine();
        m_host->ButtonClicked(*this, row, column);
    }
}

// ---- the current cell --------------------------------------------------------------------------

void CGenGrid::SetCurrentCell(int row, int column)
{
    const QModelIndex index = m_model->index(std::clamp(row, 1, std::max(1, RowCount())) - 1, std::max(1, column) - 1);
    // Not setCurrentIndex, which would extend the selection while the user happens to hold Ctrl or Shift.
    selectionModel()->setCurrentIndex(index, QItemSelectionModel::ClearAndSelect);
    scrollTo(currentIndex()); // a line that was stored meanwhile may have gone to another place
}

void CGenGrid::currentChanged(const QModelIndex& current, const QModelIndex& previous)
{
    QTableView::currentChanged(current, previous); // closes an editor, whose text the cell takes
    if (!m_model->IsSyncing()) {
        if (currentIndex().isValid()) { // storing shows the rows afresh, with this line as the current one
            NoteLine(currentIndex().row());
            m_goneFrom = 0;
        }
        StoreEditedLine();
    }
    if (hasFocus() || isAncestorOf(QApplication::focusWidget()))
        KeepInWindow();
    if (m_host && !m_model->IsSyncing())
        m_host->CellCurrent(*this);
    const int row = CurrentRow();
    if (std::exchange(m_lastRow, row) == row)
        return;
    if (row > m_model->FixedRows() && m_host)
        m_host->LineCurrent(*this);
}

void CGenGrid::focusOutEvent(QFocusEvent* event)
{
    QTableView::focusOutEvent(event);
    // Whatever is edited next reloads the rows, so the line is stored first.
    if (!StaysBeingEdited(event->reason()) && !isAncestorOf(QApplication::focusWidget()))
        StoreEditedLine(BlankRule::Fill);
}

void CGenGrid::focusInEvent(QFocusEvent* event)
{
    QTableView::focusInEvent(event);
    // What takes no keys itself - a header, a scroll bar - passes the focus of a click on to the grid. The keys remain
    // those of the cell that is open.
    if (QWidget* editor = m_delegate->Editor(); editor && state() == EditingState)
        editor->setFocus();
    KeepInWindow();
    if (m_host)
        m_host->CellCurrent(*this);
}

/// A window that is too small for what stands in it scrolls, grid and all: nobody types where it cannot be seen.
void CGenGrid::KeepInWindow()
{
    const QRect cell = visualRect(currentIndex()).intersected(viewport()->rect());
    if (!cell.isEmpty())
        KsKeepInSight(*viewport(), cell);
}

// ---- lines that come and go --------------------------------------------------------------------

int CGenGrid::InsertLine()
{
    const int line = m_model->InsertRow(m_selection->PlaceOfNewLine(m_model->FixedRows())) + 1;
    m_widths->Update();
    clearSelection();
    SetCurrentCell(line, 1);
    return line;
}

bool CGenGrid::DeleteSelectedLines()
{
    const auto lines = m_selection->Lines(m_model->FixedRows());
    if (!lines)
        return false;
    const int row = lines->top(), column = CurrentColumn();
    m_model->RemoveRows(row, lines->height());
    clearSelection();
    SetCurrentCell(row + 1, column);
    return true;
}

// ---- keys and mouse ----------------------------------------------------------------------------

void CGenGrid::keyPressEvent(QKeyEvent* event)
{
    constexpr std::pair<Qt::Key, CursorAction> moves[] = {
        {Qt::Key_Up, MoveUp},         {Qt::Key_Down, MoveDown},         {Qt::Key_Left, MoveLeft},
        {Qt::Key_Right, MoveRight},   {Qt::Key_Home, MoveHome},         {Qt::Key_End, MoveEnd},
        {Qt::Key_PageUp, MovePageUp}, {Qt::Key_PageDown, MovePageDown},
    };
    const auto* move = std::ranges::find(moves, event->key(), [](const auto& each) { return int(each.first); });
    if (move != std::end(moves) && event->modifiers().testFlag(Qt::ShiftModifier) && currentIndex().isValid())
        m_selection->GrowTo(moveCursor(move->second, event->modifiers()));
    else
        QTableView::keyPressEvent(event);
}

/// From a line that is gone the keys go on where it stood: Qt begins at the first one.
QModelIndex CGenGrid::moveCursor(CursorAction action, Qt::KeyboardModifiers held)
{
    if (!HasLostItsLine() || RowCount() == 0)
        return QTableView::moveCursor(action, held);
    const bool isFar = held.testFlag(Qt::ControlModifier);
    if (isFar && action == MoveEnd)
        return m_model->index(RowCount() - 1, ColumnCount() - 1);
    return m_model->index(isFar && action == MoveHome ? 0 : std::min(m_goneFrom, RowCount()) - 1, 0);
}

/// A selection is one block. A click with Ctrl, which adds a line or a cell to it elsewhere, does nothing but say so.
bool CGenGrid::Scatters(const QMouseEvent& click) const
{
    if (!click.modifiers().testFlag(Qt::ControlModifier) || click.modifiers().testFlag(Qt::ShiftModifier) ||
        click.button() != Qt::LeftButton)
        return false;
    if (m_model->Document())
        m_model->Document()->Say(GridTexts::tr("Only what stands together can be selected: click where it begins and, "
                                               "with Shift, where it ends."));
    return true;
}

void CGenGrid::mousePressEvent(QMouseEvent* event)
{
    m_isPressRefused = Scatters(*event) || !LeaveField();
    if (m_isPressRefused)
        return;
    const bool goesOn = event->modifiers().testFlag(Qt::ShiftModifier) && currentIndex().isValid();
    m_pressed = goesOn ? m_selection->OtherEnd() : indexAt(event->position().toPoint());
    QTableView::mousePressEvent(event);
}

void CGenGrid::mouseMoveEvent(QMouseEvent* event)
{
    if (m_isPressRefused && event->buttons() != Qt::NoButton)
        return;
    // What is frozen is no edge at which a drag scrolls sideways.
    setAutoScroll(
        !FrozenPart().adjusted(0, autoScrollMargin(), 0, -autoScrollMargin()).contains(event->position().toPoint()));
    QTableView::mouseMoveEvent(event);
    setAutoScroll(true);
}

void CGenGrid::mouseDoubleClickEvent(QMouseEvent* event)
{
    if (RowCount() == 0 && MayGrow() && !m_model->Shown().IsFiltered())
        return m_input->Run(GridAction::AppendLine);
    // Two clicks with keys between them may be a double click, and the keys have moved on from the cell clicked first.
    const QModelIndex cell = indexAt(event->position().toPoint());
    if (cell.isValid() && cell != currentIndex()) {
        if (!LeaveField())
            return;
        SetCurrentCell(cell.row() + 1, cell.column() + 1);
    }
    QTableView::mouseDoubleClickEvent(event);
}

void CGenGrid::contextMenuEvent(QContextMenuEvent* event)
{
    if (!CommitEditor())
        return;
    const bool isByKey = event->reason() == QContextMenuEvent::Keyboard;
    QMenu menu(this);
    GridMenus::AddForCells(menu, *this);
    menu.exec(isByKey ? viewport()->mapToGlobal(visualRect(currentIndex()).bottomLeft()) : event->globalPos());
}

/// On the number of a line. It is about the lines that are selected, if this is one of them.
void CGenGrid::ShowLineMenu(const QContextMenuEvent& event)
{
    const int row = verticalHeader()->logicalIndexAt(event.pos());
    if (row < 0 || !CommitEditor())
        return;
    const auto block = SelectedBlock();
    if (!block || !m_selection->AreLines() || row < block->top() || row > block->bottom()) {
        SetCurrentCell(row + 1, std::max(CurrentColumn(), 1));
        SelectLines(row + 1, row + 1);
    }
    QMenu menu(this);
    GridMenus::AddForLines(menu, *this);
    menu.exec(event.globalPos());
}

/// Of the headers. Whoever makes a column wider goes on typing in the open cell.
bool CGenGrid::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::ContextMenu && object == verticalHeader()->viewport()) {
        ShowLineMenu(*static_cast<QContextMenuEvent*>(event));
        return true;
    }
    const bool isClick = event->type() == QEvent::MouseButtonPress || event->type() == QEvent::MouseButtonDblClick;
    const bool isBorder = isClick && object == horizontalHeader()->viewport() &&
                          m_header->BorderAt(static_cast<QMouseEvent*>(event)->position().toPoint().x()) >= 0;
    const bool isHeader = object == verticalHeader()->viewport() || object == horizontalHeader()->viewport();
    if (isClick && isHeader && !isBorder && Scatters(*static_cast<QMouseEvent*>(event)))
        return true;
    const bool leaves = isClick && !isBorder && object != viewport();
    return (leaves && !CommitEditor()) || QTableView::eventFilter(object, event);
}
