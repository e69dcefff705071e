#include "rules/list_check.h"

#include "files/field_io.h"

#include <algorithm>

namespace {

const Field& NameField()
{
    return LocationFields()[0];
}
const Field& ChainageField()
{
    return LocationFields()[1];
}

} // namespace

CListCheck::CListCheck(const CGenParamListBase& list, ProblemPlace place, bool firstMayBeBlank,
                       const HD_Parameters& parameters, CBranchNumbers& branches)
    : m_list(list),
      m_place(place),
      m_firstMayBeBlank(firstMayBeBlank),
      m_branches(branches),
      m_values(place.section, list.Fields(), parameters.Global),
      m_rules(LineRulesOf(place.section)),
      m_count(list.GetCount()),
      m_locations(m_count)
{
    for (const Field& field : list.Fields())
        if (field.along == Along::ReachEnd)
            m_reachEnd = &field;
    if (&list == &parameters.WaterLevelMarkList)
        m_marks.emplace(parameters.Global.MarkTitles);
}

ProblemPlace CListCheck::At(std::size_t line, const Field* field) const
{
    ProblemPlace place = m_place;
    place.line = line;
    place.field = field;
    return place;
}

bool CListCheck::Step(std::size_t lines, CProblems& problems)
{
    const std::size_t count = std::min(m_count, m_list.GetCount());
    if (m_next < count) {
        for (const std::size_t end = std::min(m_next + lines, count); m_next < end; ++m_next)
            CheckLine(m_next, problems);
        return true;
    }
    if (m_marks && m_nextMark < count) {
        for (const std::size_t end = std::min(m_nextMark + lines, count); m_nextMark < end; ++m_nextMark)
            m_marks->Check(static_cast<const HDWLMark&>(m_list.GetAt(m_nextMark)), At(m_nextMark), problems);
        return true;
    }
    return m_reaches.Compare(lines, m_place, problems);
}

void CListCheck::CheckLine(std::size_t line, CProblems& problems)
{
    const HD_RiverPos& record = m_list.GetAt(line);
    m_values.Check(&record, At(line), problems);
    if (m_rules)
        m_rules(record, At(line), problems);
    if (m_marks)
        m_marks->Count(static_cast<const HDWLMark&>(record));
    if (IsIncomplete(record, line, problems))
        return;
    const std::uint32_t branch = m_branches.NumberOf(record.RiverName);
    CheckBranch(record, branch, line, problems);
    if (m_reachEnd)
        CheckReach(record, branch, line, problems);
    else
        CheckRepeated(record, branch, line, problems);
}

bool CListCheck::IsIncomplete(const HD_RiverPos& record, std::size_t line, CProblems& problems)
{
    if (!record.IsBlank())
        return false;
    if (line > 0 || !m_firstMayBeBlank) {
        if (record.RiverName.empty())
            problems.Add({RuleId::NoBranch, At(line, &NameField())});
        else
            problems.Add({RuleId::NoChainage, At(line, &ChainageField())});
    }
    return true;
}

void CListCheck::CheckBranch(const HD_RiverPos& record, std::uint32_t branch, std::size_t line, CProblems& problems)
{
    if (!m_branches.IsRiverKnown())
        return;
    const RiverBranch* const found = m_branches.Branch(branch);
    if (!found) {
        problems.Add({RuleId::UnknownBranch, At(line, &NameField()), {record.RiverName}});
        return;
    }
    constexpr double tolerance = 0.001; // m: chainages of networks are sums of lengths
    const auto check = [&](const Field& field, double chainage) {
        if (chainage != NotGiven && (chainage < found->first - tolerance || chainage > found->last + tolerance))
            problems.Add({RuleId::BeyondBranch,
                          At(line, &field),
                          {Amount{chainage, UnitGroup::Chainage}, found->name,
                           Amount{found->first, UnitGroup::Chainage}, Amount{found->last, UnitGroup::Chainage}}});
    };
    check(ChainageField(), record.Chainage);
    if (m_reachEnd)
        check(*m_reachEnd, m_reachEnd->In<double>(static_cast<const void*>(&record)));
}

void CListCheck::CheckReach(const HD_RiverPos& record, std::uint32_t branch, std::size_t line, CProblems& problems)
{
    const double end = m_reachEnd->In<double>(static_cast<const void*>(&record));
    const ProblemPlace place = At(line, m_reachEnd);
    if (end == NotGiven) {
        problems.Add({RuleId::ReachWithoutEnd, place});
        return;
    }
    if (end == record.Chainage) {
        problems.Add({RuleId::ReachWithoutLength, place});
        return;
    }
    const RiverBranch* const found = m_branches.Branch(branch);
    if ((end > record.Chainage) != (!found || found->downstream))
        problems.Add({RuleId::ReachBackwards,
                      place,
                      {Amount{end, UnitGroup::Chainage}, Amount{record.Chainage, UnitGroup::Chainage}}});
    m_reaches.Add(branch, record.Chainage, end, line);
}

void CListCheck::CheckRepeated(const HD_RiverPos& record, std::uint32_t branch, std::size_t line, CProblems& problems)
{
    const std::size_t first = m_locations.Add(branch, record.Chainage, line);
    if (first == line)
        return;
    const HD_RiverPos& other = m_list.GetAt(first);
    const bool isSame =
        SameFields(record.Fields(), static_cast<const void*>(&record), static_cast<const void*>(&other)) &&
        record.Extra.IsEmpty() && other.Extra.IsEmpty();
    problems.Add(
        {isSame ? RuleId::SameLine : RuleId::SameLocation, At(line, &ChainageField()), {Amount{double(first + 1)}}});
}
