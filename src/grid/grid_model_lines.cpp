// Lines that come, go and change places.
#include "grid/grid_model.h"

#include "grid/cell_text.h"
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
    const std::size_t at = SourceRow(shownAt);
    auto lines = CTableRows::NewLines(1 + OffersRow(), at);
    if (const QString fault = WhyNotBetween(at, *lines); !fault.isEmpty()) {
        m_document->Say(GridTexts::tr("No line was inserted. %1").arg(fault));
        return row;
    }
    const std::size_t place = PutLines(GridTexts::tr("Insertion of lines"), at, std::move(lines));
    m_document->Say(GridTexts::tr("Line inserted"));
    return ShownRow(place) + row - shownAt; // behind an offered row, if there was one
}

std::size_t CGridModel::PutLines(const QString& step, std::size_t at, std::unique_ptr<IRowBlock> lines)
{
    const QScopedValueRollback changed(m_changedAt, std::optional(at));
    const std::size_t place = Change(step, at, [&] { InsertLines(*m_document, m_rows, at, std::move(lines)); });
    Sync();
    return place;
}

/// Below a row of the source, and also in a table that is sorted shown there: users look for them where they were.
std::size_t CGridModel::PutBelow(const QString& step, std::size_t row, std::unique_ptr<IRowBlock> lines)
{
    const std::size_t count = lines->Count(), place = PutLines(step, row + 1, std::move(lines));
    if (m_shown.IsSorted()) {
        m_shown.PlaceBehind(row, place, count);
        Sync();
    }
    return place;
}

int CGridModel::InsertRowBelow(int row)
{
    if (m_shown.IsPlain() || row >= StoredRows())
        return InsertRow(row + 1);
    if (!m_document->MayChange())
        return row;
    Store();
    const std::size_t above = SourceRow(row);
    const std::size_t place = PutBelow(GridTexts::tr("Insertion of lines"), above, CTableRows::NewLines(1, above + 1));
    m_document->Say(GridTexts::tr("Line inserted"));
    return ShownRow(place);
}

std::pair<int, QString> CGridModel::DuplicateRows(int row, int count)
{
    if (!m_document->MayChange())
        return {-1, {}};
    Store();
    const std::vector<std::size_t> lines = SourceRows(row, count);
    auto copies = m_rows->Copies(lines);
    const std::size_t above = lines.back(), at = above + 1;
    if (m_rows->HasRules() && !WhyNotBetween(at, *copies).isEmpty())
        m_rows->Fit(*copies, at);
    if (const QString fault = WhyNotBetween(at, *copies); !fault.isEmpty())
        return {-1, fault};
    const std::size_t place = PutBelow(GridTexts::tr("Duplication of lines"), above, std::move(copies));
    m_document->Say(
        GridTexts::Counted(lines.size(), GridTexts::tr("Line duplicated"), GridTexts::tr("%1 lines duplicated")));
    return {ShownRow(place), {}};
}

QString CGridModel::MoveRows(int row, int count, bool up)
{
    if (!m_document->MayChange())
        return {};
    Store();
    const int other = up ? row - 1 : row + count; // goes to the other side of them
    const std::size_t from = SourceRow(other), to = SourceRow(up ? row + count - 1 : row), first = SourceRow(row);
    if (const QString fault = WhyNotMoved(from, to); !fault.isEmpty())
        return fault;
    Change(count == 1 ? GridTexts::tr("Move of a line") : GridTexts::tr("Move of lines"), first,
           [&] { MoveLine(*m_document, m_rows, from, to, first, up ? first - 1 : first + 1); });
    Sync();
    m_document->Say(
        GridTexts::Counted(std::size_t(count), GridTexts::tr("Line moved"), GridTexts::tr("%1 lines moved")));
    return {};
}

void CGridModel::AppendRow(const QStringList& texts)
{
    if (!m_document->MayChange())
        return;
    Store();
    PastedCells cells{{m_rows->Count()}, {}};
    for (int column = 0; column < texts.size(); ++column)
        cells.columns.emplace_back(column).values.Add(Resolved(column, ReadCell(Column(column), texts[column]).value));
    Paste(cells, GridTexts::tr("Insertion of lines"));
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
    std::vector<std::size_t> lines = SourceRows(row, count);
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
