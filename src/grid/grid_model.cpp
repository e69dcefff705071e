#include "grid/grid_model.h"

#include "grid/cell_text.h"
#include "grid/grid_texts.h"
#include "grid/row_commands.h"
#include "grid/tool_tip.h"

#include <QGuiApplication>
#include <QPalette>
#include <QScopedValueRollback>
#include <QUndoStack>
#include <algorithm>
#include <cstdlib>
#include <utility>

namespace {

/// That of a button, or the text's color laid thinly over a cell where a palette has next to the same for both.
QBrush LockedBackground()
{
    constexpr int least = 14; // difference of lightness that one still sees
    const QPalette palette = QGuiApplication::palette();
    const QColor cell = palette.color(QPalette::Base), button = palette.color(QPalette::Button);
    if (std::abs(button.lightness() - cell.lightness()) >= least)
        return palette.brush(QPalette::Button);
    const QColor text = palette.color(QPalette::Text);
    const auto mixed = [](int of, int with) { return (7 * of + with) / 8; };
    return QColor(mixed(cell.red(), text.red()), mixed(cell.green(), text.green()), mixed(cell.blue(), text.blue()));
}

} // namespace

namespace {

QString AsSentence(QString text)
{
    if (!text.isEmpty())
        text.front() = text.front().toUpper();
    return text;
}

/// A theme may have a color for such texts that nobody sees.
QBrush PaleText()
{
    QColor color = QGuiApplication::palette().color(QPalette::Text);
    color.setAlphaF(0.6F);
    return color;
}

} // namespace

// ---- what views see ----------------------------------------------------------------------------

void CGridModel::AddColumn(ColumnSpec column)
{
    beginInsertColumns({}, columnCount(), columnCount());
    m_columns.push_back(std::move(column));
    m_offered.reset();
    endInsertColumns();
}

void CGridModel::RemoveColumnsFrom(int count)
{
    if (count >= columnCount())
        return;
    beginRemoveColumns({}, count, columnCount() - 1);
    m_columns.resize(std::size_t(count));
    endRemoveColumns();
    std::erase_if(m_sortedBy, [count](const SortKey& key) { return key.column >= count; });
    m_filters = m_filters.first(std::min(m_filters.size(), qsizetype(count)));
    if (m_shown.IsPlain())
        return;
    ApplySort();
    ApplyFilters();
    Sync();
    emit ViewChanged();
}

void CGridModel::SetSource(CKsDoc& document, std::shared_ptr<IRowSource> rows)
{
    beginResetModel();
    m_document = &document;
    m_rows = std::move(rows);
    m_pending.clear();
    m_offered.reset();
    m_shown.Clear();
    m_sortedBy.clear();
    m_filters.clear();
    m_contents = document.Contents();
    m_saved.SetDocument(document);
    m_rowCount = ShownRows();
    endResetModel();
    emit ViewChanged();
}

void CGridModel::Sync()
{
    if (!m_rows || m_syncing)
        return;
    const QScopedValueRollback syncing(m_syncing, true);
    m_offered.reset(); // what fills a new line may have changed
    PruneOverlay();
    // Other content: places say nothing of which line is which.
    if (std::exchange(m_contents, m_document->Contents()) != m_document->Contents() && !m_rows->KeysLast()) {
        ApplySort();
        ApplyFilters();
    }
    FollowSource();
    // Views keep their current cell, selection and scroll position by row number, so only the length matters to them.
    const int count = ShownRows();
    if (count > m_rowCount) {
        beginInsertRows({}, m_rowCount, count - 1);
        m_rowCount = count;
        endInsertRows();
    } else if (count < m_rowCount) {
        beginRemoveRows({}, count, m_rowCount - 1);
        m_rowCount = count;
        endRemoveRows();
    }
    if (m_columns.empty())
        return;
    if (m_rowCount > 0)
        emit dataChanged(index(0, 0), index(m_rowCount - 1, columnCount() - 1));
    // Painting headers costs as much as painting lines do, and they hardly ever change.
    QStringList headers;
    for (const ColumnSpec& column : m_columns)
        headers << column.header() + u'\n' + column.UnitLine();
    if (std::exchange(m_headers, headers) != headers)
        emit headerDataChanged(Qt::Horizontal, 0, columnCount() - 1);
}

int CGridModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_columns.size());
}

QVariant CGridModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid() || !IsRow(index.row()))
        return {};
    const ColumnSpec& column = Column(index.column());
    const auto value = [&] { return Value(index.row(), index.column()); };
    switch (role) {
    case Qt::DisplayRole:
        return ShownText(column, value());
    case Qt::EditRole:
    case Qt::AccessibleTextRole:
        return EditText(column, value());
    case Qt::TextAlignmentRole:
        return int(Qt::AlignVCenter | (column.IsNumeric() ? Qt::AlignRight : Qt::AlignLeft));
    case Qt::CheckStateRole:
        if (column.Kind() != CellKind::Flag)
            return {};
        return value() == CellValue(std::int32_t(0)) ? Qt::Unchecked : Qt::Checked;
    case Qt::ToolTipRole:
        return CellDetails(index.row(), index.column());
    case Qt::AccessibleDescriptionRole:
        return m_saved.CellText(index.row(), index.column());
    case Qt::ForegroundRole: // what is no line's own stands back
        return IsGlobalValue(index.row(), index.column()) ? QVariant(PaleText()) : QVariant();
    case Qt::BackgroundRole:
        return IsLocked(index.row(), index.column()) ? QVariant(LockedBackground()) : QVariant();
    default:
        return {};
    }
}

QVariant CGridModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation == Qt::Vertical)
        return LineNumberData(section, role);
    if (section < 0 || section >= columnCount())
        return {};
    if (role == Qt::DisplayRole)
        return Column(section).header();
    return role == Qt::ToolTipRole ? HeaderToolTip(section) : QVariant();
}

/// The whole value, and what there is to say of it.
QString CGridModel::CellDetails(int row, int column) const
{
    QStringList lines{CellToolTip(Column(column), Value(row, column))};
    if (IsGlobalValue(row, column))
        lines << GridTexts::tr("The global value");
    lines << AsSentence(m_saved.CellText(row, column));
    lines.removeAll(QString());
    return lines.join(u'\n');
}

void CGridModel::SetNotes(LineNotes notes)
{
    if (notes.empty() && m_notes.empty())
        return;
    m_notes = std::move(notes);
    emit NotesChanged();
}

const LineNote* CGridModel::NoteOf(int row) const
{
    if (m_notes.empty() || row >= StoredRows())
        return nullptr;
    const auto note = m_notes.find(SourceRow(row));
    return note == m_notes.end() ? nullptr : &note->second;
}

QString CGridModel::WithNote(int row, const QString& text) const
{
    const LineNote* const note = NoteOf(row);
    QStringList lines = note ? note->texts : QStringList();
    for (QString& line : lines)
        line = AsSentence(line);
    lines << text;
    lines.removeAll(QString());
    return lines.join(u'\n');
}

QVariant CGridModel::LineNumberData(int row, int role) const
{
    switch (role) {
    case Qt::DisplayRole:
        return LineNumber(row);
    case Qt::ToolTipRole:
        return WithNote(row, m_saved.LineDetails(row));
    case Qt::AccessibleDescriptionRole:
        return WithNote(row, m_saved.LineText(row));
    default:
        return {};
    }
}

/// What the column means, the unit and the range of its cells, what new lines hold, and how the file calls it.
QString CGridModel::HeaderToolTip(int column) const
{
    const ColumnSpec& spec = Column(column);
    QStringList lines{spec.hint ? spec.hint() : QString(), spec.ToolTip(),
                      RangeLine(spec.bounds, spec.style, spec.UnitSymbol())};
    const bool isFixed = spec.Kind() != CellKind::DateTime && spec.Kind() != CellKind::Button; // a date is that of now
    if (const CellValue value = Rows() && isFixed ? DefaultOf(spec) : CellValue(); !IsEmptyCell(spec, value))
        lines << (spec.fill ? GridTexts::tr("New lines: %1, the global value") : GridTexts::tr("New lines: %1"))
                     .arg(FullText(spec, value));
    return ToolTipText(lines << NameInFileLine(spec.name));
}

Qt::ItemFlags CGridModel::flags(const QModelIndex& index) const
{
    const auto flags = QAbstractTableModel::flags(index);
    if (!index.isValid() || !IsRow(index.row()) || m_document->IsReadOnly() || IsLocked(index.row(), index.column()))
        return flags;
    return Column(index.column()).ActsAtOnce() ? flags : flags | Qt::ItemIsEditable;
}

bool CGridModel::setData(const QModelIndex& index, const QVariant& value, int role)
{
    if (!index.isValid() || role != Qt::EditRole || !IsRow(index.row()))
        return false;
    const QString text = value.toString();
    if (!Refusal(index.row(), index.column(), text).isEmpty())
        return false;
    const ColumnSpec& column = Column(index.column());
    if (text == EditText(column, Value(index.row(), index.column())))
        return true;
    m_pending[{NameOf(index.row()), index.column()}] = {ReadCell(column, text).value, SourceRow(index.row())};
    emit dataChanged(index, index);
    emit CellModified(index);
    return true;
}

// ---- order and filter --------------------------------------------------------------------------

void CGridModel::SortBy(std::vector<SortKey> keys)
{
    Store();
    m_sortedBy = std::move(keys);
    ApplySort();
    Sync();
    emit ViewChanged();
}

void CGridModel::Filter(const QStringList& texts)
{
    Store();
    m_filters = texts;
    ApplyFilters();
    Sync();
    emit ViewChanged();
}

void CGridModel::ShowAfresh()
{
    Store();
    ApplySort();
    ApplyFilters();
    Sync();
    emit ViewChanged();
}

bool CGridModel::Unhide(std::size_t sourceRow)
{
    if (!m_rows || sourceRow >= m_rows->Count() || ShownRow(sourceRow) >= 0)
        return false;
    m_shown.Show(sourceRow);
    Sync();
    emit ViewChanged();
    return true;
}

std::size_t CGridModel::KeepOrder(int row)
{
    const std::size_t shown = SourceRow(std::max(row, 0));
    if (!m_shown.IsSorted() || m_shown.Order().empty() || !m_document->MayChange())
        return shown;
    const std::size_t line = std::min(shown, m_shown.Order().size() - 1); // none may be in sight
    Store();
    std::vector<std::size_t> order(m_shown.Order().begin(), m_shown.Order().end());
    const auto place = std::size_t(std::ranges::find(order, line) - order.begin());
    if (!std::ranges::is_sorted(order))
        Change(GridTexts::tr("Sorting of lines"), 0,
               [&] { ArrangeLines(*m_document, m_rows, std::move(order), line); });
    m_sortedBy.clear();
    if (m_rows->KeysLast())
        ApplySort(); // the lines that are hidden stay so
    else
        ShowAfresh();
    Sync();
    emit ViewChanged();
    return place;
}

// ---- steps -------------------------------------------------------------------------------------

/// Makes what is one step of the user's; then the rows of the source stand in their order. Returns where that at `row`
/// is.
std::size_t CGridModel::Change(const QString& step, std::size_t row, const std::function<void()>& make)
{
    m_document->UndoStack().beginMacro(step);
    make();
    row = Arrange(row);
    m_document->UndoStack().endMacro();
    return row;
}

/// The current cell and the selection go with their lines.
std::size_t CGridModel::Arrange(std::size_t row)
{
    const auto order = m_rows->Order();
    if (order.empty())
        return row;
    Sync();
    const QScopedValueRollback syncing(m_syncing, true);
    emit layoutAboutToBeChanged({}, VerticalSortHint);
    ArrangeLines(*m_document, m_rows, order, row);
    const auto placeOf = [&order](std::size_t was) {
        return std::size_t(std::find(order.begin(), order.end(), was) - order.begin());
    };
    const QModelIndexList before = persistentIndexList();
    QModelIndexList after;
    for (const QModelIndex& cell : before)
        after << index(int(placeOf(std::size_t(cell.row()))), cell.column());
    changePersistentIndexList(before, after);
    emit layoutChanged({}, VerticalSortHint);
    return placeOf(row);
}

bool CGridModel::Store(BlankRule rule)
{
    if (m_pending.empty())
        return false;
    if (!m_document->MayChange()) {
        m_pending.clear();
        return false;
    }
    const Overlay typed = std::exchange(m_pending, {});
    const bool rows = StoreRows(typed, rule);
    return StoreOffered(typed, rule) || rows;
}

/// The offered row enters the source, unless what was typed is what it shows anyway.
bool CGridModel::StoreOffered(const Overlay& typed, BlankRule rule)
{
    const auto first = typed.lower_bound({OfferedKey, 0});
    if (first == typed.end() || !OffersRow())
        return false;
    void* row = RowObject(StoredRows());
    bool changed = false;
    for (auto cell = first; cell != typed.end(); ++cell) {
        const CellAccess& access = *Column(cell->first.second).access;
        const CellValue value = Resolved(cell->first.second, cell->second.value, rule);
        if (SameCell(access.get(row), value))
            continue;
        access.set(row, value);
        changed = true;
    }
    if (!changed)
        return false;
    const QScopedValueRollback place(m_changedAt, std::optional(m_rows->Count()));
    InsertLines(*m_document, m_rows, m_rows->Count(), std::move(m_offered), GridTexts::tr("Change of cells"));
    Sync();
    return true;
}

bool CGridModel::StoreRows(const Overlay& typed, BlankRule rule)
{
    CCellChanges changes;
    std::size_t place = 0;
    for (const auto& [cell, what] : typed) {
        const auto& [row, column] = cell;
        if (row == OfferedKey)
            continue;
        const auto& access = Column(column).access;
        CellValue before = access->get(m_rows->Object(row)), after = Resolved(column, what.value, rule);
        if (SameCell(before, after))
            continue;
        if (changes.IsEmpty())
            place = what.row;
        changes.Add(row, column + 1, access, std::move(before), std::move(after));
    }
    if (changes.IsEmpty())
        return false;
    Change(GridTexts::tr("Change of cells"), place, [&] { SetCells(*m_document, m_rows, std::move(changes), place); });
    return true;
}

void CGridModel::Paste(const PastedCells& cells, const QString& step)
{
    if (!m_document->MayChange() || cells.rows.empty())
        return;
    Store();
    const std::size_t end = m_rows->Count(), bottom = std::ranges::max(cells.rows);
    auto added = bottom >= end ? NewLines(int(bottom - end + 1)) : nullptr;
    CCellChanges changes;
    for (const auto& [column, values, left] : cells.columns) {
        const auto& access = Column(column).access;
        for (std::size_t i = 0; i < cells.rows.size(); ++i) {
            if (!left.empty() && left[i])
                continue;
            const std::size_t row = cells.rows[i];
            CellValue after = values[i];
            if (row >= end) {
                access->set(added->At(row - end), after);
                continue;
            }
            CellValue before = access->get(m_rows->At(row));
            if (!SameCell(before, after))
                changes.Add(m_rows->KeyAt(row), column + 1, access, std::move(before), std::move(after));
        }
    }
    if (changes.IsEmpty() && !added)
        return;
    const std::size_t first = std::min(cells.rows.front(), end);
    const QScopedValueRollback changed(m_changedAt, std::optional(end));
    Change(step, first, [&] {
        if (!changes.IsEmpty())
            SetCells(*m_document, m_rows, std::move(changes), first);
        if (added)
            InsertLines(*m_document, m_rows, end, std::move(added));
    });
    Sync();
}

void CGridModel::ChangeCells(const QString& step, int row, CCellChanges changes)
{
    if (changes.IsEmpty() || !m_document->MayChange())
        return;
    const std::size_t first = SourceRow(row);
    Change(step, first, [&] { SetCells(*m_document, m_rows, std::move(changes), first); });
    Sync();
}
