#include "editors/cross_sections/commands.h"

#include <algorithm>

void CSectionCommand::redo()
{
    m_document.Changed(Apply(m_document.m_sections.sections));
}

void CSectionCommand::undo()
{
    m_document.Changed(Revert(m_document.m_sections.sections));
}

int CReplaceSection::Apply(Sections& sections)
{
    std::swap(sections[std::size_t(m_index)], m_other);
    return m_index;
}

int CInsertSection::Apply(Sections& sections)
{
    sections.insert(sections.begin() + m_index, std::move(m_section));
    return m_index;
}

int CInsertSection::Revert(Sections& sections)
{
    m_section = std::move(sections[std::size_t(m_index)]);
    sections.erase(sections.begin() + m_index);
    return std::max(m_index - 1, 0);
}

CRemoveSections::CRemoveSections(CCrossSectionDoc& document, std::vector<int> indexes, const QString& text)
    : CSectionCommand(document, text), m_indexes(std::move(indexes))
{
    std::sort(m_indexes.begin(), m_indexes.end());
}

int CRemoveSections::Apply(Sections& sections)
{
    Sections left;
    left.reserve(sections.size() - m_indexes.size());
    for (std::size_t i = 0; i < sections.size(); ++i) {
        const bool removed = std::binary_search(m_indexes.begin(), m_indexes.end(), static_cast<int>(i));
        (removed ? m_removed : left).push_back(std::move(sections[i]));
    }
    sections = std::move(left);
    return m_indexes.front();
}

int CRemoveSections::Revert(Sections& sections)
{
    Sections all;
    all.reserve(sections.size() + m_removed.size());
    std::size_t kept = 0, back = 0;
    while (kept + back < sections.size() + m_removed.size()) {
        const bool removed = back < m_indexes.size() && m_indexes[back] == static_cast<int>(kept + back);
        all.push_back(std::move(removed ? m_removed[back] : sections[kept]));
        ++(removed ? back : kept);
    }
    sections = std::move(all);
    m_removed.clear();
    return m_indexes.front();
}
