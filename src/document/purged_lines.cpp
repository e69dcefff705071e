#include "document/purged_lines.h"

#include "grid/row_commands.h"
#include "res/strings.h"

#include <QStringList>

CPurgedLines::CPurgedLines(CKavo0_hdDoc& document) : CDocumentCommand(document, LoadString(Str::UndoPurge))
{
    for (const ListEntry& entry : HDLists()) {
        if (!entry.purgedAtSave)
            continue;
        CListSection& section = entry.list(document.Parameters());
        for (std::size_t i = 0; i < section.ListCount(); ++i) {
            Lines lines{&section.ListAt(i), {}, {}};
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

void CPurgedLines::TakeOut(Lines& lines)
{
    auto all = lines.list->RemoveAt(0, lines.list->GetCount());
    std::vector<std::unique_ptr<HD_RiverPos>> kept;
    kept.reserve(all.size() - lines.rows.size());
    auto next = lines.rows.begin();
    for (std::size_t row = 0; row < all.size(); ++row) {
        const bool goes = next != lines.rows.end() && *next == row;
        next += goes;
        (goes ? lines.records : kept).push_back(std::move(all[row]));
    }
    lines.list->InsertAt(0, std::move(kept));
}

void CPurgedLines::PutBack(Lines& lines)
{
    auto kept = lines.list->RemoveAt(0, lines.list->GetCount());
    std::vector<std::unique_ptr<HD_RiverPos>> all;
    all.reserve(kept.size() + lines.rows.size());
    auto next = kept.begin();
    for (std::size_t i = 0; i < lines.rows.size(); ++i) {
        while (all.size() < lines.rows[i])
            all.push_back(std::move(*next++));
        all.push_back(std::move(lines.records[i]));
    }
    std::move(next, kept.end(), std::back_inserter(all));
    lines.records.clear();
    lines.list->InsertAt(0, std::move(all));
}

void CPurgedLines::TakeOut()
{
    m_isOut = true;
    for (Lines& lines : m_lists)
        TakeOut(lines);
    for (Rows& table : m_tables)
        for (auto row = table.rows.rbegin(); row != table.rows.rend(); ++row)
            table.taken.push_back(table.source->Take(*row, 1));
}

void CPurgedLines::PutBack()
{
    m_isOut = false;
    for (Lines& lines : m_lists)
        PutBack(lines);
    for (Rows& table : m_tables)
        for (const std::size_t row : table.rows) {
            table.source->Put(row, std::move(table.taken.back()));
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
