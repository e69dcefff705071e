#include "grid/gen_grid.h"

#include "ks/language/language.h"
#include "document/document.h"
#include "grid/cell_text.h"
#include "grid/grid_editors.h"
#include "grid/grid_keys.h"
#include "pages/framework/page.h"
#include "res/strings.h"

#include <QContextMenuEvent>
#include <QHeaderView>
#include <QMenu>
#include <QPainter>
#include <QScopedValueRollback>
#include <QScrollBar>
#include <QUndoStack>
#include <algorithm>

namespace {

constexpr int NumberColumnWidth = 40;
// Pixels of the font that the columns' widths are meant for: its height, and the mean width of the Latin letters.
constexpr int RowsMeasured = 30;   // for the first widths of the columns; the user may change them
constexpr int MostOfAWindow = 320; // pixels that a long name may take at the start
constexpr double OriginalFontHeight = 13, OriginalLetterWidth = 6;

/// The row numbers. They are as wide as the grid says: measuring texts of many rows, as the base does whenever the
/// table is laid out, would cost more than all the rest of showing it.
class RowNumbers : public QHeaderView
{
public:
    explicit RowNumbers(QWidget* parent) : QHeaderView(Qt::Vertical, parent) { setSectionsClickable(true); }
    QSize sizeHint() const override { return {minimumWidth(), QHeaderView::minimumSizeHint().height()}; }
};

double FontScale(const QWidget& widget)
{
    const QFontMetrics font = widget.fontMetrics();
    const QString letters = QStringLiteral("ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz");
    const double letterWidth = double(font.horizontalAdvance(letters)) / double(letters.size());
    return std::max({1.0, font.height() / OriginalFontHeight, letterWidth / OriginalLetterWidth});
}

} // namespace

CGenGrid::CGenGrid(QWidget* parent)
    : QTableView(parent), m_model(new CGridModel(this)), m_delegate(new CGridDelegate(this))
{
    setFont(KsLangGetUserFont());
    setModel(m_model);
    setItemDelegate(m_delegate);
    setTabKeyNavigation(false); // the key table moves
    setEditTriggers(DoubleClicked | EditKeyPressed | AnyKeyPressed);
    setSelectionMode(ContiguousSelection);
    setHorizontalScrollMode(ScrollPerPixel);
    setWordWrap(false);
    QSizePolicy policy = sizePolicy();
    policy.setRetainSizeWhenHidden(true); // a hidden grid leaves the rest of the page where it is
    setSizePolicy(policy);
    setVerticalHeader(new RowNumbers(this));
    verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    verticalHeader()->setHighlightSections(false);
    verticalHeader()->setDefaultAlignment(Qt::AlignRight | Qt::AlignVCenter);
    UpdateRowHeader();
    horizontalHeader()->setHighlightSections(false);
    // A click on a header moves the current cell as one on a cell does.
    for (QWidget* part : {verticalHeader()->viewport(), horizontalHeader()->viewport()})
        part->installEventFilter(this);
    connect(selectionModel(), &QItemSelectionModel::selectionChanged, this,
            [this] { m_linesChosen = m_choosingLines; });
    connect(m_model, &CGridModel::CellModified, this, &CGenGrid::CellModified);
    connect(&KsUnits::Instance(), &KsUnits::DigitsChanged, this, &CGenGrid::MakeRoomForDigits);
    connect(
        &KsUnits::Instance(), &KsUnits::Changed, this,
        [this] {
            if (KsUnits::Instance().AllDigits())
                MakeRoomForDigits();
        },
        Qt::QueuedConnection); // when the view shows the new unit
}

CGenGrid::~CGenGrid()
{
    // An open editor loses the focus while the grid is taken apart; it must not commit to what is left of it.
    if (QWidget* editor = m_delegate->Editor())
        editor->removeEventFilter(m_delegate);
}

void CGenGrid::SetOwnerPage(CGenPropertyPage* page)
{
    m_page = page;
    page->SetGrid(this);
}

void CGenGrid::SetPartOfPage(CGenPropertyPage* page)
{
    m_page = page;
    page->AddPartGrid(this);
}

bool CGenGrid::IsLocationGrid() const
{
    return !m_page || m_page->GetGrid() == this;
}

IPageHost* CGenGrid::Host() const
{
    return m_page ? m_page->GetHost() : nullptr;
}

QStringList CGenGrid::BranchNames() const
{
    return Host() ? Host()->BranchNames() : QStringList();
}

QString CGenGrid::TextAt(int row, int column) const
{
    return m_model->index(row - 1, column - 1).data().toString();
}

QString CGenGrid::LineText() const
{
    const int fixed = m_model->FixedRows(), line = CurrentRow() - fixed, column = CurrentColumn() - 1;
    if (line <= 0 || column < 0)
        return {};
    if (!m_model->HidesDigits(CurrentRow() - 1, column))
        return LoadString(Str::LineOfLines).arg(line).arg(RowCount() - fixed);
    const ColumnSpec& spec = m_model->Columns()[std::size_t(column)];
    const QString number = FullText(spec, m_model->Value(CurrentRow() - 1, column));
    return LoadString(Str::LineOfLinesValue).arg(line).arg(RowCount() - fixed).arg(spec.header(), number);
}

void CGenGrid::UpdateRowHeader()
{
    const int height = fontMetrics().height() + 8;
    if (verticalHeader()->defaultSectionSize() != height) // setting it visits every row
        verticalHeader()->setDefaultSectionSize(height);
    const int numbers = fontMetrics().horizontalAdvance(QString::number(std::max(RowCount(), 100))) + 12;
    const int width = std::max(int(NumberColumnWidth * FontScale(*this)), numbers);
    if (verticalHeader()->width() != width)
        verticalHeader()->setFixedWidth(width);
}

void CGenGrid::SetColumnWidths(int first)
{
    m_widthsSet = ColumnCount();
    for (int column = first; column < ColumnCount(); ++column) {
        const ColumnSpec& spec = m_model->Columns()[std::size_t(column)];
        setColumnWidth(column, std::max(int(spec.width * FontScale(*this)), WidthOfTexts(column, 0)));
    }
}

/// What the header and the texts of some rows need.
int CGenGrid::WidthOfTexts(int column, int firstRow) const
{
    int text = fontMetrics().horizontalAdvance(m_model->Columns()[std::size_t(column)].header());
    for (int row = firstRow; row < std::min(RowCount(), firstRow + RowsMeasured); ++row)
        text = std::max(text, fontMetrics().horizontalAdvance(TextAt(row + 1, column + 1)));
    return std::min(text + 16, MostOfAWindow);
}

/// All digits are of no use when the column elides them; what the user has made wider stays.
void CGenGrid::MakeRoomForDigits()
{
    for (int column = 0; column < m_widthsSet; ++column)
        setColumnWidth(column, std::max(columnWidth(column), WidthOfTexts(column, std::max(0, rowAt(0)))));
}

void CGenGrid::Reload()
{
    m_model->Sync();
    UpdateRowHeader();
    SetColumnWidths(std::min(m_widthsSet, ColumnCount()));
    if (!currentIndex().isValid() && RowCount() > 0)
        SetCurrentCell(1, 1);
}

void CGenGrid::SetCurrentCell(int row, int column)
{
    const QModelIndex index = m_model->index(std::clamp(row, 1, std::max(1, RowCount())) - 1, std::max(1, column) - 1);
    // Not setCurrentIndex, which would extend the selection while the user happens to hold Ctrl or Shift.
    selectionModel()->setCurrentIndex(index, QItemSelectionModel::ClearAndSelect);
    scrollTo(index);
}

// ---- editing -----------------------------------------------------------------------------------

bool CGenGrid::CommitEditor()
{
    return m_delegate->Commit();
}

void CGenGrid::CellModified(int row, int column)
{
    m_modifiedColumn = m_modified ? std::min(m_modifiedColumn, column) : column;
    m_modified = true;
    if (m_page)
        m_page->OnGridCellModified(row, column);
}

void CGenGrid::StoreEditedLine(BlankRule blanks)
{
    if (!m_modified)
        return;
    m_modified = false;
    if (blanks == BlankRule::Fill)
        m_model->Store(blanks);
    if (auto* host = Host()) {
        const int column = m_locationOnAnyColumn ? 1 : m_modifiedColumn;
        host->EditedLineChanged(IsLocationGrid() ? column : 0);
    } else if (m_page) {
        m_page->StoreToDocument();
        m_page->LoadFromDocument(m_page->GetDocument());
    }
}

void CGenGrid::currentChanged(const QModelIndex& current, const QModelIndex& previous)
{
    QTableView::currentChanged(current, previous); // closes an editor, whose text the cell takes
    if (!m_model->IsSyncing())
        StoreEditedLine();
    m_lastColumn = current.column() + 1;
    if (Host() && !m_model->IsSyncing())
        Host()->CurrentCellChanged();
    const int row = current.row() + 1;
    if (row == m_lastRow)
        return;
    m_lastRow = row;
    if (row > m_model->FixedRows() && Host() && IsLocationGrid())
        Host()->CurrentLocationChanged();
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
    if (Host())
        Host()->CurrentCellChanged();
}

void CGenGrid::mousePressEvent(QMouseEvent* event)
{
    if (m_page ? m_page->LeaveField() : CommitEditor())
        QTableView::mousePressEvent(event);
}

void CGenGrid::mouseDoubleClickEvent(QMouseEvent* event)
{
    if (RowCount() == 0 && m_model->Rows())
        return Run(GridAction::AppendLine);
    // Two clicks with keys between them may be a double click, and the keys have moved on from the cell clicked first.
    const QModelIndex cell = indexAt(event->position().toPoint());
    if (cell.isValid() && cell != currentIndex()) {
        if (m_page ? !m_page->LeaveField() : !CommitEditor())
            return;
        SetCurrentCell(cell.row() + 1, cell.column() + 1);
    }
    QTableView::mouseDoubleClickEvent(event);
}

void CGenGrid::paintEvent(QPaintEvent* event)
{
    QTableView::paintEvent(event);
    if (RowCount() > 0 || !m_model->Rows() || !isEnabled())
        return;
    QPainter painter(viewport());
    painter.setPen(palette().color(QPalette::PlaceholderText));
    painter.drawText(viewport()->rect().adjusted(4, 4, -4, -4), Qt::AlignTop | Qt::AlignHCenter | Qt::TextWordWrap,
                     LoadString(Str::EmptyTable));
}

bool CGenGrid::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::MouseButtonPress && object != viewport() && !CommitEditor())
        return true;
    if (object == verticalHeader()->viewport()) {
        if (event->type() == QEvent::MouseButtonPress)
            m_choosingLines = m_linesChosen = true;
        else if (event->type() == QEvent::MouseButtonRelease)
            m_choosingLines = false;
    }
    return QTableView::eventFilter(object, event);
}

void CGenGrid::SelectLines(int first, int last)
{
    const QScopedValueRollback choosing(m_choosingLines, true);
    const QItemSelection lines(m_model->index(first - 1, 0), m_model->index(last - 1, ColumnCount() - 1));
    selectionModel()->select(lines, QItemSelectionModel::ClearAndSelect);
    m_linesChosen = true;
}

void CGenGrid::selectAll()
{
    const QScopedValueRollback choosing(m_choosingLines, true);
    QTableView::selectAll();
    m_linesChosen = true;
}

void CGenGrid::changeEvent(QEvent* event)
{
    QTableView::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange) {
        UpdateRowHeader();
        if (m_widthsSet > 0) // not before the rows are there
            SetColumnWidths(0);
    }
}

// ---- keys --------------------------------------------------------------------------------------

bool CGenGrid::event(QEvent* event)
{
    // The grid's own keys come before menu shortcuts of the same name.
    if (event->type() == QEvent::ShortcutOverride && FindGridKey(*static_cast<QKeyEvent*>(event))) {
        event->accept();
        return true;
    }
    // Tab is a cell move here, which QWidget would take for a change of focus.
    if (event->type() == QEvent::KeyPress) {
        if (const GridKey* key = FindGridKey(*static_cast<QKeyEvent*>(event))) {
            Run(key->action);
            event->accept();
            return true;
        }
    }
    return QTableView::event(event);
}

void CGenGrid::Run(GridAction action)
{
    switch (action) {
    case GridAction::NextCell:
        return NextCell();
    case GridAction::PreviousCell:
        return PreviousCell();
    case GridAction::AppendLine:
        return AppendLine();
    case GridAction::CopyAndAppend:
        Copy();
        return AppendLine();
    case GridAction::PasteAndAppend:
        if (!CanPaste() || Paste())
            AppendLine();
        return;
    case GridAction::DeleteLine:
        return Execute(Command::DeleteLine);
    case GridAction::Copy:
        return Copy();
    case GridAction::Paste:
        Paste();
        return;
    case GridAction::SearchAgain:
        return Execute(Command::SearchAgain);
    case GridAction::Search:
        return Execute(Command::Search);
    case GridAction::SelectLine:
        return SelectLines(CurrentRow(), CurrentRow());
    case GridAction::Undo:
    case GridAction::Redo:
        if (m_page)
            m_page->UndoRedo(action == GridAction::Undo);
        return;
    }
}

void CGenGrid::Execute(int command)
{
    StoreEditedLine();
    if (auto* host = Host())
        host->Execute(command);
    else if (m_page && command == Command::DeleteLine)
        m_page->DeleteLines();
    else if (m_page && command == Command::InsertLine)
        m_page->AppendLine();
}

void CGenGrid::NextCell()
{
    if (CurrentColumn() < ColumnCount())
        return SetCurrentCell(CurrentRow(), CurrentColumn() + 1);
    if (CurrentRow() < RowCount())
        return SetCurrentCell(CurrentRow() + 1, 1);
    AppendLine();
}

void CGenGrid::PreviousCell()
{
    if (CurrentColumn() > 1)
        SetCurrentCell(CurrentRow(), CurrentColumn() - 1);
    else if (CurrentRow() > 1)
        SetCurrentCell(CurrentRow() - 1, ColumnCount());
    else
        focusPreviousChild(); // the way out of the grid by keyboard
}

void CGenGrid::AppendLine()
{
    StoreEditedLine();
    if (m_appendThroughPage && m_page)
        m_page->AppendLine();
    else
        Execute(Command::InsertLine);
}

void CGenGrid::contextMenuEvent(QContextMenuEvent* event)
{
    if (!CommitEditor())
        return;
    QMenu menu(this);
    const auto add = [&](GridAction action, bool enabled) {
        const auto keys = GridKeys();
        const auto key = std::find_if(keys.begin(), keys.end(), [&](const GridKey& k) { return k.action == action; });
        menu.addAction(LoadString(key->description), QKeySequence(QKeyCombination(key->held, key->key)), this,
                       [this, action] { Run(action); })
            ->setEnabled(enabled);
    };
    add(GridAction::AppendLine, true);
    add(GridAction::DeleteLine, LinesToDelete().has_value());
    menu.addSeparator();
    add(GridAction::Copy, CanCopy());
    add(GridAction::Paste, CanPaste());
    if (IsLocationGrid()) {
        menu.addSeparator();
        add(GridAction::Search, true);
    }
    menu.exec(event->globalPos());
}

// ---- lines -------------------------------------------------------------------------------------

std::optional<QItemSelectionRange> CGenGrid::SelectedBlock() const
{
    const QItemSelection selection = selectionModel()->selection();
    if (selection.size() != 1)
        return std::nullopt;
    const QItemSelectionRange range = selection.front();
    // The current cell is always selected; alone it is no selection.
    if (range.width() == 1 && range.height() == 1)
        return std::nullopt;
    return range;
}

int CGenGrid::InsertLine()
{
    const auto selected = SelectedBlock();
    const int row = selected ? std::max(selected->top(), m_model->FixedRows()) : RowCount();
    m_model->InsertRows(row);
    UpdateRowHeader();
    clearSelection();
    SetCurrentCell(row + 1, 1);
    return row + 1;
}

/// Lines of the table among the selected ones.
std::optional<QItemSelectionRange> CGenGrid::LinesToDelete() const
{
    auto lines = SelectedBlock();
    const bool isCurrentMeant = m_deletesCurrentLine && !(lines && lines->width() == ColumnCount());
    if (isCurrentMeant && currentIndex().isValid())
        lines.emplace(currentIndex().siblingAtColumn(0), currentIndex().siblingAtColumn(ColumnCount() - 1));
    else if (!m_linesChosen)
        return std::nullopt;
    if (!lines || lines->width() != ColumnCount() || lines->bottom() < m_model->FixedRows())
        return std::nullopt;
    const int top = std::max(lines->top(), m_model->FixedRows());
    return QItemSelectionRange(m_model->index(top, 0), lines->bottomRight());
}

bool CGenGrid::DeleteSelectedLines()
{
    const auto lines = LinesToDelete();
    if (!lines)
        return false;
    const int row = lines->top(), column = CurrentColumn();
    m_model->RemoveRows(row, lines->height());
    clearSelection();
    SetCurrentCell(row + 1, column);
    return true;
}

void CGenGrid::ActOn(int row, int column)
{
    const QModelIndex cell = m_model->index(row - 1, column - 1);
    const ColumnSpec& spec = m_model->Columns()[std::size_t(cell.column())];
    if (!spec.ActsAtOnce() || m_model->IsLocked(cell.row(), cell.column()))
        return;
    if (spec.Kind() == CellKind::Flag) {
        const bool checked = cell.data(Qt::CheckStateRole).toInt() == Qt::Checked;
        m_model->setData(cell, checked ? QStringLiteral("0") : QStringLiteral("1"), Qt::EditRole);
        StoreEditedLine();
    } else if (m_page) {
        StoreEditedLine();
        m_page->OnGridButtonClicked(*this, row, column);
    }
}

void CGenGrid::GotoLine(int row)
{
    SetCurrentCell(row, columnAt(0) + 1);
}
