// Lines that come, go and change places.
#include "grid/grid_model.h"
#include "grid/grid_texts.h"
#include "grid/row_commands.h"

#include <QScopedValueRollback>
#include <QUndoStack>
#include <algorithm>

int CGridModel::InsertRow(int row)
{
    if (!m_rows || !m_document->MayChange())
        return row;
    Store();
    const int shownAt = std::min(std::max(row, FixedRows()), StoredRows());
    return InsertAt(SourceRow(shownAt), row, shownAt);
}

int CGridModel::InsertBelow(int row)
{
    if (!m_rows || !m_document->MayChange())
        return row;
    Store();
    const int shownAt = std::min(row + 1, StoredRows());
    return InsertAt(PlaceBelow(shownAt - 1), row + 1, shownAt);
}

/// Where the source has to have a line that is shown next below the line of a row. Where hidden lines follow in the
/// file, they stay behind it; where lines are sorted, the next one shown decides.
std::size_t CGridModel::PlaceBelow(int row) const
{
    return m_shown.IsSorted() ? SourceRow(row + 1) : row < 0 ? 0 : SourceRow(row) + 1;
}

int CGridModel::InsertAt(std::size_t at, int row, int shownAt)
{
    auto lines = CTableRows::NewLines(1 + OffersRow(), at);
    const QScopedValueRollback changed(m_changedAt, std::optional(at));
    const std::size_t place = Change(GridTexts::tr("Insertion of lines"), at,
                                     [&] { InsertLines(*m_document, m_rows, at, std::move(lines)); });
    m_document->Say(GridTexts::tr("Line inserted"));
    Sync();
    return ShownRow(place) + row - shownAt; // behind an offered row, if there was one
}

void CGridModel::AppendRow(const QStringList& texts)
{
    if (!m_document->MayChange())
        return;
    Paste(StoredRows(), 0, {texts}, GridTexts::tr("Insertion of lines"));
    m_document->Say(GridTexts::tr("Line inserted"));
}

void CGridModel::RemoveRows(int row, int count)
{
    if (!m_document->MayChange())
        return;
    Store();
    count = std::min(count, StoredRows() - row);
    if (count <= 0)
        return;
    std::vector<std::size_t> lines(static_cast<std::size_t>(count));
    std::ranges::generate(lines, [this, row]() mutable { return SourceRow(row++); });
    std::ranges::sort(lines);
    const QScopedValueRollback changed(m_changedAt, std::optional(lines.front()));
    if (lines.back() - lines.front() + 1 == lines.size())
        DeleteLines(*m_document, m_rows, lines.front(), lines.size());
    else
        RemoveScattered(lines);
    m_document->Say(
        GridTexts::Counted(std::size_t(count), GridTexts::tr("Line deleted"), GridTexts::tr("%1 lines deleted")));
    Sync();
}

/// Lines between which hidden ones stand, or others that are shown elsewhere. They go to the end before they are taken
/// out: one by one it would cost the square of their number.
void CGridModel::RemoveScattered(const std::vector<std::size_t>& lines)
{
    std::vector<std::size_t> order;
    order.reserve(m_rows->Count());
    for (std::size_t row = 0, next = 0; row < m_rows->Count(); ++row) {
        if (next < lines.size() && lines[next] == row)
            ++next;
        else
            order.push_back(row);
    }
    const std::size_t kept = order.size();
    order.insert(order.end(), lines.begin(), lines.end());
    m_changedAt.reset(); // where they stood, nothing that a place tells
    Change(GridTexts::tr("Deletion of lines"), lines.front(), [&] {
        ArrangeLines(*m_document, m_rows, std::move(order), lines.front());
        DeleteLines(*m_document, m_rows, kept, lines.size());
    });
}

int CGridModel::Duplicate(int first, int last)
{
    Store();
    last = std::min(last, StoredRows() - 1);
    if (!m_document->MayChange() || first < FixedRows() || first > last)
        return first;
    std::vector<std::size_t> rows;
    for (int row = first; row <= last; ++row)
        rows.push_back(SourceRow(row));
    const std::size_t at = PlaceBelow(last);
    auto lines = m_rows->Copies(rows);
    if (m_rows->HasRules()) // no two of them may be the same
        m_rows->Fit(*lines, at);
    const QScopedValueRollback changed(m_changedAt, std::optional(at));
    const std::size_t place = Change(GridTexts::tr("Duplication of lines"), at,
                                     [&] { InsertLines(*m_document, m_rows, at, std::move(lines)); });
    m_document->Say(
        GridTexts::Counted(rows.size(), GridTexts::tr("Line duplicated"), GridTexts::tr("%1 lines duplicated")));
    Sync();
    return ShownRow(place);
}

bool CGridModel::MoveRows(int first, int last, int step)
{
    const int neighbour = step < 0 ? first - 1 : last + 1;
    if (!m_document->MayChange() || first < FixedRows() || neighbour < FixedRows() ||
        std::max(last, neighbour) >= StoredRows())
        return false;
    Store();
    const std::size_t from = SourceRow(neighbour), to = SourceRow(step < 0 ? last : first), shown = SourceRow(first);
    MoveLine(*m_document, m_rows, from, to, step < 0 ? shown - 1 : shown + 1);
    Sync();
    return true;
}
