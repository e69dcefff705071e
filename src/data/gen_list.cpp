#include "data/gen_list.h"

#include <algorithm>
#include <iterator>

void CGenList::RemoveAll()
{
    m_records.clear();
}

HD_RiverPos& CGenList::AddTail(std::unique_ptr<HD_RiverPos> record)
{
    return *m_records.emplace_back(std::move(record));
}

void CGenList::InsertAt(std::size_t index, std::unique_ptr<HD_RiverPos> record)
{
    m_records.insert(m_records.begin() + std::ptrdiff_t(index), std::move(record));
}

void CGenList::InsertAt(std::size_t index, std::vector<std::unique_ptr<HD_RiverPos>> records)
{
    m_records.insert(m_records.begin() + std::ptrdiff_t(index), std::move_iterator(records.begin()),
                     std::move_iterator(records.end()));
}

std::unique_ptr<HD_RiverPos> CGenList::RemoveAt(std::size_t index)
{
    auto record = std::move(m_records[index]);
    m_records.erase(m_records.begin() + std::ptrdiff_t(index));
    return record;
}

std::vector<std::unique_ptr<HD_RiverPos>> CGenList::RemoveAt(std::size_t index, std::size_t count)
{
    const auto first = m_records.begin() + std::ptrdiff_t(index);
    const auto last = first + std::ptrdiff_t(count);
    std::vector<std::unique_ptr<HD_RiverPos>> removed{std::make_move_iterator(first), std::make_move_iterator(last)};
    m_records.erase(first, last);
    return removed;
}

bool CGenList::RemoveIncompleteLines(bool& asked, const std::function<bool()>& ask)
{
    const auto isBlank = [](const std::unique_ptr<HD_RiverPos>& record) { return record->IsBlank(); };
    if (std::ranges::none_of(m_records, isBlank))
        return true;
    if (!asked && !(ask && ask()))
        return false;
    asked = true;
    std::erase_if(m_records, isBlank);
    return true;
}

template <typename Fits>
HD_RiverPos* CGenList::Find(std::size_t& position, Fits fits)
{
    while (position < m_records.size())
        if (HD_RiverPos& record = *m_records[position++]; fits(record))
            return &record;
    position = End;
    return nullptr;
}

HD_RiverPos* CGenList::FindByChainage(double chainage, std::size_t& position)
{
    return Find(position, [=](const HD_RiverPos& record) { return record.Chainage == chainage; });
}

HD_RiverPos* CGenList::FindByName(std::string_view text, std::size_t& position)
{
    return Find(position, [=](const HD_RiverPos& record) { return record.RiverName.starts_with(text); });
}

void CGenParamListBase::Save(tqlHandle structure, bool) const
{
    tqlAddSection(structure, m_sectionName);
    for (std::size_t index = 0; index < GetCount(); ++index)
        GetAt(index).Save(structure);
    WriteUnknown(structure, m_unknown);
    tqlEndSection(structure);
}

void CGenParamListBase::Load(tqlHandle parent, int number, LoadReport* report)
{
    const tqlHandle section = tqlSectionByNameNum(parent, m_sectionName, number);
    if (!section)
        return;
    if (report)
        report->InSection(m_sectionName);
    const int records = tqlGetNoKeywords(section, RecordKeyword);
    Reserve(GetCount() + std::size_t(records));
    for (int occurrence = 1; occurrence <= records; ++occurrence) {
        auto record = NewRecord();
        const tqlHandle keyword = tqlKeywordByNameNum(section, RecordKeyword, occurrence);
        record->Load(keyword, report);
        AddTail(std::move(record));
    }
    if (tqlGetNoKeywords(section) != records || tqlGetNoSections(section) != 0)
        CollectUnknown(
            section,
            [](std::string_view name, bool isSection) {
                return !isSection && name == RecordKeyword ? Known::Every : Known::No;
            },
            m_unknown, report);
}
