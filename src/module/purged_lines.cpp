#include "module/purged_lines.h"

#include "module/document.h"
#include "res/strings.h"

CPurgedLines::CPurgedLines(CKavo0_hdDoc& document) : m_document(document)
{
    setText(LoadString(Str::UndoPurge));
}

void CPurgedLines::Apply()
{
    PurgeLists();
    PurgeRows();
    m_applied = true;
}

void CPurgedLines::PurgeRows()
{
    m_rows.clear();
    for (const auto& cleaned : m_document.CleanedRows()) {
        for (std::size_t index = cleaned.rows->Count(); index-- > 0;) {
            if (cleaned.isIncomplete(cleaned.rows->At(index)))
                m_rows.push_back({cleaned.rows, index, cleaned.rows->Take(index, 1)});
        }
    }
}

void CPurgedLines::PurgeLists()
{
    m_lists.clear();
    for (const ListEntry& entry : HDLists()) {
        if (!entry.purgedAtSave)
            continue;
        CGenList& list = *entry.list(m_document.Parameters());
        List purged{&list, {}};
        bool any = false;
        for (std::size_t i = 0; i < list.GetCount() && !any; ++i)
            any = list.GetAt(i).IsBlank();
        if (!any)
            continue;
        auto records = list.RemoveAt(0, list.GetCount());
        std::vector<std::unique_ptr<HD_RiverPos>> kept;
        kept.reserve(records.size());
        for (std::size_t i = 0; i < records.size(); ++i) {
            if (records[i]->IsBlank())
                purged.lines.push_back({i, std::move(records[i])});
            else
                kept.push_back(std::move(records[i]));
        }
        list.InsertAt(0, std::move(kept));
        m_lists.push_back(std::move(purged));
    }
}

void CPurgedLines::Revert()
{
    m_document.RemovePlaceholders(); // an emptied list may show one by now
    for (List& purged : m_lists) {
        auto kept = purged.list->RemoveAt(0, purged.list->GetCount());
        std::vector<std::unique_ptr<HD_RiverPos>> all;
        all.reserve(kept.size() + purged.lines.size());
        auto next = kept.begin();
        for (Line& line : purged.lines) {
            while (all.size() < line.index && next != kept.end())
                all.push_back(std::move(*next++));
            all.push_back(std::move(line.record));
        }
        std::move(next, kept.end(), std::back_inserter(all));
        purged.list->InsertAt(0, std::move(all));
    }
    for (auto taken = m_rows.rbegin(); taken != m_rows.rend(); ++taken)
        taken->source->Put(taken->index, std::move(taken->row));
    m_applied = false;
}

void CPurgedLines::undo()
{
    Revert();
    m_document.UpdateAll(nullptr, Hint::Reload, nullptr);
}

void CPurgedLines::redo()
{
    if (m_applied)
        return;
    Apply();
    m_document.UpdateAll(nullptr, Hint::Reload, nullptr);
}
