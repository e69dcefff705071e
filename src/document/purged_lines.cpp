#include "document/purged_lines.h"

#include "grid/line_origin.h"
#include "grid/row_commands.h"
#include "res/strings.h"

#include <QStringList>
#include <algorithm>

namespace {

using Places = std::vector<std::size_t>; // ascending, with the lines that are taken out

/// Which lines are taken out, for as long as somebody has to know.
class CPurge : public KsLineChange
{
public:
    struct List
    {
        const CGenList* list;
        Places rows;
    };
    struct Table
    {
        std::shared_ptr<IRowSource> source;
        Places rows;
    };

    void TakeBack(KsTracedLine& line, bool forward) const override
    {
        for (const List& list : lists) {
            const auto before = [&](std::size_t row) { return Before(list.rows, row, forward); };
            if (line.data == list.list)
                CarryBack(line, line.place, 0, before);
            else if (line.list == list.list)
                CarryBack(line, line.placeInList, 0, before);
        }
        for (const Table& table : tables)
            CarryBack(line, *table.source, [&](std::size_t row) { return Before(table.rows, row, forward); });
    }

    std::vector<List> lists;
    std::vector<Table> tables;

private:
    static std::optional<std::size_t> Before(const Places& purged, std::size_t row, bool out)
    {
        if (!out) {
            const auto place = std::ranges::lower_bound(purged, row);
            return place != purged.end() && *place == row ? std::nullopt
                                                          : std::optional(row - std::size_t(place - purged.begin()));
        }
        // Behind as many as stood above it: of these each has no more lines that stayed above it than the line has.
        std::size_t low = 0, high = purged.size();
        while (low < high) {
            const std::size_t middle = (low + high) / 2;
            purged[middle] - middle <= row ? low = middle + 1 : high = middle;
        }
        return row + low;
    }
};

} // namespace

CPurgedLines::CPurgedLines(CKavo0_hdDoc& document) : CDocumentCommand(document, LoadString(Str::UndoPurge))
{
    for (const ListEntry& entry : HDLists()) {
        if (!entry.purgedAtSave)
            continue;
        CListSection& section = entry.list(document.Parameters());
        for (std::size_t i = 0; i < section.ListCount(); ++i) {
            Lines lines{&section.ListAt(i), {}, {}, {}};
            for (std::size_t row = 0; row < lines.list->GetCount(); ++row)
                if (lines.list->GetAt(row).IsBlank())
                    lines.rows.push_back(row);
            if (!lines.rows.empty())
                m_lists.push_back(std::move(lines));
        }
    }
    for (const auto& shown : document.RowsShown()) {
        Rows table{shown.rows, {}, {}, shown.oneDropped, shown.manyDropped};
        for (std::size_t row = 0; shown.isIncomplete && row < shown.rows->Count(); ++row)
            if (shown.isIncomplete(shown.rows->At(row)))
                table.rows.push_back(row);
        if (!table.rows.empty())
            m_tables.push_back(std::move(table));
    }
    auto change = std::make_shared<CPurge>();
    for (const Lines& lines : m_lists)
        change->lists.push_back({lines.list, lines.rows});
    for (const Rows& table : m_tables)
        change->tables.push_back({table.source, table.rows});
    m_change = std::move(change);
}

QString CPurgedLines::Summary() const
{
    std::size_t count = 0;
    for (const Lines& lines : m_lists)
        count += lines.rows.size();
    QStringList parts;
    if (count > 0)
        parts << LoadCounted(count, Str::DroppedLine, Str::DroppedLines);
    for (const Rows& table : m_tables)
        parts << LoadCounted(table.rows.size(), table.oneDropped, table.manyDropped);
    return parts.join(LoadString(Str::DroppedSeparator));
}

/// Either all of them are taken out or, when memory ends, none.
void CPurgedLines::TakeOut(Lines& lines)
{
    auto& all = lines.room;
    std::vector<std::unique_ptr<HD_RiverPos>> kept;
    kept.reserve(lines.list->GetCount() - lines.rows.size());
    lines.records.reserve(lines.rows.size());
    lines.list->Swap(all);
    auto next = lines.rows.begin();
    for (std::size_t row = 0; row < all.size(); ++row) {
        const bool goes = next != lines.rows.end() && *next == row;
        next += goes;
        (goes ? lines.records : kept).push_back(std::move(all[row]));
    }
    all.clear();
    lines.list->Swap(kept);
}

void CPurgedLines::PutBack(Lines& lines)
{
    if (lines.records.empty())
        return; // memory ended before they were taken out
    std::vector<std::unique_ptr<HD_RiverPos>> kept;
    auto& all = lines.room;
    all.reserve(lines.list->GetCount() + lines.rows.size());
    lines.list->Swap(kept);
    auto next = kept.begin();
    for (std::size_t i = 0; i < lines.rows.size(); ++i) {
        while (all.size() < lines.rows[i])
            all.push_back(std::move(*next++));
        all.push_back(std::move(lines.records[i]));
    }
    std::move(next, kept.end(), std::back_inserter(all));
    lines.records.clear();
    lines.list->Swap(all);
    all.clear();
}

void CPurgedLines::TakeOut()
{
    m_isOut = true;
    for (Lines& lines : m_lists)
        TakeOut(lines);
    for (Rows& table : m_tables) {
        table.taken.reserve(table.rows.size());
        for (auto row = table.rows.rbegin(); row != table.rows.rend(); ++row)
            table.taken.push_back(table.source->Take(*row, 1));
    }
}

void CPurgedLines::PutBack()
{
    m_isOut = false;
    for (Lines& lines : m_lists)
        PutBack(lines);
    for (Rows& table : m_tables)
        for (auto row = table.rows.end() - std::ptrdiff_t(table.taken.size()); row != table.rows.end(); ++row) {
            table.source->Put(*row, std::move(table.taken.back()));
            table.taken.pop_back();
        }
}

ChangePlace CPurgedLines::Apply()
{
    if (!m_isOut) // the save itself has done it before
        TakeOut();
    return Place();
}

ChangePlace CPurgedLines::Revert()
{
    PutBack();
    return Place();
}

/// The first of the lines, or where it was.
ChangePlace CPurgedLines::Place() const
{
    if (m_lists.empty())
        return PlaceOf(*m_tables.front().source, m_tables.front().rows.front(), 1);
    const Lines& first = m_lists.front();
    return {first.list, int(first.rows.front()) + 1, 1, first.list, int(first.rows.front()) + 1};
}
