#include "rules/hd_check.h"

#include "rules/global_check.h"

CHDCheck::CHDCheck(const HD_Parameters& parameters, const CRiver* river, std::string path)
    : m_parameters(parameters), m_path(std::move(path)), m_branches(river)
{
}

bool CHDCheck::Step(std::size_t lines)
{
    if (!m_isBegun) {
        CheckGlobals(m_parameters.Global, m_path, m_found);
        m_isBegun = true;
        return true;
    }
    if (m_list && m_list->Step(lines, m_found))
        return true;
    if (m_list)
        m_found.SortFrom(m_before);
    return NextList();
}

bool CHDCheck::NextList()
{
    m_list.reset();
    for (; m_entry < HDLists().size(); ++m_entry, m_set = 0) {
        const CListSection& section = HDLists()[m_entry].constList(m_parameters);
        if (m_set == section.ListCount())
            continue;
        const ProblemPlace place{.section = HDLists()[m_entry].section, .set = m_set};
        // The first line of a set does not count as a location: a set with that one only is not kept.
        m_list =
            std::make_unique<CListCheck>(section.ListAt(m_set), place, section.HasSets(), m_parameters, m_branches);
        m_before = m_found.ListedCount();
        ++m_set;
        return true;
    }
    return false;
}
