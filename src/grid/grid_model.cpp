#include "grid/grid_model.h"

#include "grid/cell_text.h"
#include "grid/grid_texts.h"
#include "grid/row_commands.h"

#include <QGuiApplication>
#include <QPalette>
#include <QScopedValueRollback>
#include <QUndoStack>
#include <algorithm>
#include <bit>
#include <utility>

namespace {

/// Equal to the last bit; numbers that are none are equal to themselves.
bool Same(const CellValue& a, const CellValue& b)
{
    const auto* x = std::get_if<double>(&a);
    const auto* y = std::get_if<double>(&b);
    return x && y ? std::bit_cast<std::uint64_t>(*x) == std::bit_cast<std::uint64_t>(*y) : a == b;
}

constexpr RowKey OfferedKey = RowKey(-1); // no place and no address

} // namespace

CGridModel::CGridModel(QObject* parent) : QAbstractTableModel(parent) {}

void CGridModel::AddColumn(ColumnSpec column)
{
    const int at = int(m_columns.size());
    beginInsertColumns({}, at, at);
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
}

void CGridModel::SetSource(CKsDoc& document, std::shared_ptr<IRowSource> rows)
{
    beginResetModel();
    m_document = &document;
    m_rows = std::move(rows);
    m_pending.clear();
    m_offered.reset();
    m_rowCount = ShownRows();
    m_revision = m_rows ? m_rows->Revision() : 0;
    endResetModel();
}

void CGridModel::Sync()
{
    if (!m_rows || m_syncing)
        return;
    const QScopedValueRollback syncing(m_syncing, true);
    m_offered.reset(); // what fills a new line may have changed
    if (m_revision != m_rows->Revision()) {
        m_revision = m_rows->Revision();
        PruneOverlay();
    }
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
    if (m_rowCount > 0 && !m_columns.empty())
        emit dataChanged(index(0, 0), index(m_rowCount - 1, int(m_columns.size()) - 1));
    if (!m_columns.empty())
        emit headerDataChanged(Qt::Horizontal, 0, int(m_columns.size()) - 1);
}

void CGridModel::PruneOverlay()
{
    for (auto cell = m_pending.begin(); cell != m_pending.end();) {
        cell = IsGone(cell->first, cell->second.row) ? m_pending.erase(cell) : std::next(cell);
    }
}

bool CGridModel::IsGone(const CellKey& cell, std::size_t row) const
{
    return cell.first == OfferedKey ? !OffersRow() : m_rows->RowOf(cell.first, row) == m_rows->Count();
}

void* CGridModel::RowObject(int row) const
{
    if (!IsOffered(row))
        return m_rows->At(std::size_t(row));
    if (!m_offered)
        m_offered = NewLines(1, StoredRows());
    return m_offered->At(0);
}

RowKey CGridModel::KeyOf(int row) const
{
    return IsOffered(row) ? OfferedKey : m_rows->KeyAt(std::size_t(row));
}

int CGridModel::RowNamed(RowKey name, int row) const
{
    const std::size_t found = m_rows && name != OfferedKey ? m_rows->RowOf(name, std::size_t(std::max(row, 0)))
                                                           : std::size_t(StoredRows());
    if (found < std::size_t(StoredRows()))
        return int(found);
    if (name == OfferedKey && IsRow(row))
        return row; // it has become a line
    return OffersRow() ? StoredRows() : -1;
}

int CGridModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : m_rowCount;
}

int CGridModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_columns.size());
}

CellValue CGridModel::Value(int row, int column) const
{
    if (!m_pending.empty()) {
        const auto typed = m_pending.find({KeyOf(row), column});
        if (typed != m_pending.end())
            return typed->second.value;
    }
    return m_columns[std::size_t(column)].access->get(RowObject(row));
}

bool CGridModel::IsLocked(int row, int column) const
{
    const ColumnSpec& spec = m_columns[std::size_t(column)];
    if (!spec.locked)
        return false;
    const RowKey key = KeyOf(row);
    const auto typed = m_pending.lower_bound({key, 0});
    const bool edited = typed != m_pending.end() && typed->first.first == key;
    if (!edited || row < FixedRows())
        return spec.locked(RowObject(row));
    // A lock follows the cells as the user sees them.
    const auto shown = m_rows->NewRows(1);
    CopyRow(row, shown->At(0));
    return spec.locked(shown->At(0));
}

bool CGridModel::HidesDigits(int row, int column) const
{
    const ColumnSpec& spec = m_columns[std::size_t(column)];
    if (spec.Kind() != CellKind::Number || !IsRow(row))
        return false;
    const CellValue value = Value(row, column);
    return ::HidesDigits(spec, value, ShownText(spec, value));
}

QVariant CGridModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid() || !IsRow(index.row()))
        return {};
    const ColumnSpec& column = m_columns[std::size_t(index.column())];
    switch (role) {
    case Qt::DisplayRole:
        return ShownText(column, Value(index.row(), index.column()));
    case Qt::EditRole:
        return EditText(column, Value(index.row(), index.column()));
    case Qt::TextAlignmentRole:
        return int(Qt::AlignVCenter | (column.IsRightAligned() ? Qt::AlignRight : Qt::AlignLeft));
    case Qt::CheckStateRole:
        if (column.Kind() != CellKind::Flag)
            return {};
        return Value(index.row(), index.column()) == CellValue(std::int32_t(0)) ? Qt::Unchecked : Qt::Checked;
    case Qt::AccessibleTextRole:
        return EditText(column, Value(index.row(), index.column()));
    case Qt::ToolTipRole:
        return CellToolTip(column, Value(index.row(), index.column()));
    case Qt::BackgroundRole:
        return IsLocked(index.row(), index.column()) ? QVariant(QGuiApplication::palette().brush(QPalette::Button))
                                                     : QVariant();
    default:
        return {};
    }
}

QVariant CGridModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation == Qt::Vertical)
        return role == Qt::DisplayRole ? QVariant(section + 1) : QVariant();
    if (section < 0 || section >= columnCount())
        return {};
    const ColumnSpec& column = m_columns[std::size_t(section)];
    if (role == Qt::DisplayRole)
        return column.header();
    if (role == Qt::ToolTipRole)
        return column.ToolTip(true);
    return {};
}

Qt::ItemFlags CGridModel::flags(const QModelIndex& index) const
{
    const auto flags = QAbstractTableModel::flags(index);
    if (!index.isValid() || !IsRow(index.row()) || IsLocked(index.row(), index.column()))
        return flags;
    return m_columns[std::size_t(index.column())].ActsAtOnce() ? flags : flags | Qt::ItemIsEditable;
}

QString CGridModel::Refusal(int row, int column, const QString& text, bool isAlone) const
{
    const ColumnSpec& spec = m_columns[std::size_t(column)];
    if (IsRow(row)) {
        if (text == EditText(spec, Value(row, column)))
            return {}; // a stored number may be one that nobody could type
        if (IsLocked(row, column))
            return GridTexts::tr("The cell is locked.");
    }
    const QString refusal = ReadCell(spec, text).refusal;
    if (!refusal.isEmpty() || !isAlone)
        return refusal;
    const auto fault = Fault(row, column, {{text}});
    return fault ? fault->text : QString();
}

std::optional<IRowSource::Fault> CGridModel::Fault(int row, int column, const std::vector<QStringList>& texts) const
{
    if (!m_rows || !m_rows->HasRules())
        return std::nullopt;
    const int last = StoredRows(), added = std::max(0, row + int(texts.size()) - last);
    const auto rows = m_rows->NewRows(texts.size());
    const auto lines = NewLines(added, last);
    for (int r = 0; r < int(texts.size()); ++r) {
        void* object = row + r < last ? rows->At(std::size_t(r)) : lines->At(std::size_t(row + r - last));
        if (row + r < last)
            CopyRow(row + r, object);
        for (int c = 0; c < texts[std::size_t(r)].size(); ++c) {
            const ColumnSpec& spec = m_columns[std::size_t(column + c)];
            const CellValue value = ReadCell(spec, texts[std::size_t(r)][c]).value;
            spec.access->set(object, Resolved(column + c, value, BlankRule::Zero));
        }
        for (const ColumnSpec& each : m_columns) // a new line is made in one piece
            if (row + r >= last)
                each.access->set(rows->At(std::size_t(r)), each.access->get(object));
    }
    return m_rows->FindFault(std::size_t(row), *rows);
}

bool CGridModel::setData(const QModelIndex& index, const QVariant& value, int role)
{
    if (!index.isValid() || role != Qt::EditRole || !IsRow(index.row()))
        return false;
    const QString text = value.toString();
    if (!Refusal(index.row(), index.column(), text).isEmpty())
        return false;
    const ColumnSpec& column = m_columns[std::size_t(index.column())];
    if (text == EditText(column, Value(index.row(), index.column())))
        return true;
    m_pending[{KeyOf(index.row()), index.column()}] = {ReadCell(column, text).value, std::size_t(index.row())};
    emit dataChanged(index, index);
    emit CellModified(index.row() + 1, index.column() + 1);
    return true;
}

CellValue CGridModel::Resolved(int column, const CellValue& value, BlankRule rule) const
{
    const ColumnSpec& spec = m_columns[std::size_t(column)];
    if (!std::holds_alternative<std::monostate>(value))
        return value;
    return rule == BlankRule::Fill && spec.fill ? spec.FillValue() : spec.EmptyValue();
}

void CGridModel::CopyRow(int row, void* target) const
{
    for (int column = 0; column < columnCount(); ++column)
        m_columns[std::size_t(column)].access->set(target, Resolved(column, Value(row, column), BlankRule::Zero));
}

/// Pushes what is one step of the user's; then the rows stand in their order. Returns where the line at `row` is.
template <typename Push>
int CGridModel::Change(const QString& step, int row, Push push)
{
    QUndoStack& undo = m_document->UndoStack();
    undo.beginMacro(step);
    push(undo);
    row = Arrange(row);
    undo.endMacro();
    return row;
}

/// The current cell and the selection go with their lines.
int CGridModel::Arrange(int row)
{
    const auto order = m_rows->Order();
    if (order.empty())
        return row;
    Sync();
    const QScopedValueRollback syncing(m_syncing, true);
    emit layoutAboutToBeChanged({}, VerticalSortHint);
    m_document->UndoStack().push(new CArrangeLines(*m_document, m_rows, order, std::size_t(row)));
    const auto placeOf = [&order](int was) {
        return int(std::find(order.begin(), order.end(), std::size_t(was)) - order.begin());
    };
    const QModelIndexList before = persistentIndexList();
    QModelIndexList after;
    for (const QModelIndex& cell : before)
        after << index(placeOf(cell.row()), cell.column());
    changePersistentIndexList(before, after);
    emit layoutChanged({}, VerticalSortHint);
    return placeOf(row);
}

bool CGridModel::Store(BlankRule rule)
{
    if (m_pending.empty())
        return false;
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
        const int column = cell->first.second;
        const CellAccess& access = *m_columns[std::size_t(column)].access;
        const CellValue value = Resolved(column, cell->second.value, rule);
        if (Same(access.get(row), value))
            continue;
        access.set(row, value);
        changed = true;
    }
    if (!changed)
        return false;
    m_document->UndoStack().push(new CInsertLines(*m_document, m_rows, std::size_t(StoredRows()), std::move(m_offered),
                                                  GridTexts::tr("Change of cells")));
    Sync();
    return true;
}

bool CGridModel::StoreRows(const Overlay& overlay, BlankRule rule)
{
    std::vector<CellChange> changes;
    std::size_t place = 0;
    for (const auto& [cell, typed] : overlay) {
        const auto& [row, column] = cell;
        if (row == OfferedKey)
            continue;
        const auto& access = m_columns[std::size_t(column)].access;
        CellValue before = access->get(m_rows->Object(row));
        CellValue after = Resolved(column, typed.value, rule);
        if (Same(before, after))
            continue;
        if (changes.empty())
            place = typed.row;
        changes.push_back({row, column + 1, access, std::move(before), std::move(after)});
    }
    if (changes.empty())
        return false;
    const auto set = [&](QUndoStack& undo) {
        undo.push(new CSetCells(*m_document, m_rows, std::move(changes), place));
    };
    if (m_rows->IsOrdered())
        Change(GridTexts::tr("Change of cells"), int(place), set);
    else
        set(m_document->UndoStack());
    return true;
}

void CGridModel::Paste(int row, int column, const std::vector<QStringList>& texts, const QString& step)
{
    Store();
    const int last = StoredRows();
    row = std::min(row, last);
    std::vector<CellChange> changes;
    auto added = row + int(texts.size()) > last ? NewLines(row + int(texts.size()) - last) : nullptr;
    for (int r = 0; r < int(texts.size()); ++r) {
        for (int c = 0; c < texts[std::size_t(r)].size(); ++c) {
            const ColumnSpec& spec = m_columns[std::size_t(column + c)];
            const QString& text = texts[std::size_t(r)][c];
            const auto after = [&] { return Resolved(column + c, ReadCell(spec, text).value, BlankRule::Zero); };
            if (row + r >= last) {
                spec.access->set(added->At(std::size_t(row + r - last)), after());
                continue;
            }
            CellValue before = Value(row + r, column + c);
            if (text != EditText(spec, before))
                changes.push_back({m_rows->KeyAt(std::size_t(row + r)), column + c + 1, spec.access, before, after()});
        }
    }
    if (changes.empty() && !added)
        return;
    Change(step, row, [&](QUndoStack& undo) {
        if (!changes.empty())
            undo.push(new CSetCells(*m_document, m_rows, std::move(changes), std::size_t(row)));
        if (added)
            undo.push(new CInsertLines(*m_document, m_rows, std::size_t(last), std::move(added)));
    });
    Sync();
}

std::unique_ptr<IRowBlock> CGridModel::NewLines(int count, int at) const
{
    auto lines = m_rows->NewRows(std::size_t(count));
    m_rows->Fit(*lines, std::size_t(at));
    for (const ColumnSpec& column : m_columns) {
        const CellValue value = column.NewLineValue();
        for (std::size_t i = 0; i < lines->Count() && !std::holds_alternative<std::monostate>(value); ++i)
            column.access->set(lines->At(i), value);
    }
    return lines;
}

int CGridModel::InsertRow(int row)
{
    if (!m_rows)
        return row;
    Store();
    const int at = std::min(std::max(row, FixedRows()), StoredRows());
    auto lines = NewLines(1 + OffersRow(), at);
    const auto insert = [&](QUndoStack& undo) {
        undo.push(new CInsertLines(*m_document, m_rows, std::size_t(at), std::move(lines)));
    };
    if (m_rows->IsOrdered())
        row = Change(GridTexts::tr("Insertion of lines"), at, insert);
    else
        insert(m_document->UndoStack());
    m_document->Say(GridTexts::tr("Line inserted"));
    Sync();
    return row;
}

void CGridModel::AppendRow(const QStringList& texts)
{
    Paste(StoredRows(), 0, {texts}, GridTexts::tr("Insertion of lines"));
    m_document->Say(GridTexts::tr("Line inserted"));
}

void CGridModel::RemoveRows(int row, int count)
{
    Store();
    count = std::min(count, StoredRows() - row);
    if (count <= 0)
        return;
    m_document->UndoStack().push(new CDeleteLines(*m_document, m_rows, std::size_t(row), std::size_t(count)));
    m_document->Say(GridTexts::Counted(std::size_t(count), GridTexts::tr("Line deleted"),
                                       GridTexts::tr("%1 lines deleted")));
    Sync();
}
