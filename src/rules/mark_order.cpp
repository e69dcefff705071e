#include "rules/mark_order.h"

#include "files/declare_field.h"

int CMarkOrder::Order(const HDWLMark& record, std::size_t mark)
{
    const double level = record.MarkLevels[mark], next = record.MarkLevels[mark + 1];
    if (level == NotGiven || next == NotGiven)
        return 0;
    return (level < next) - (level > next);
}

void CMarkOrder::Count(const HDWLMark& record)
{
    for (std::size_t mark = 0; mark + 1 < std::min(record.MarkLevels.size(), m_titles.size()); ++mark) {
        const int order = Order(record, mark);
        m_pairs[mark].rising += order > 0;
        m_pairs[mark].falling += order < 0;
    }
}

void CMarkOrder::Check(const HDWLMark& record, ProblemPlace place, CProblems& problems) const
{
    constexpr std::size_t often = 9; // to one
    place.field = record.Fields().front().group->elements().data();
    for (std::size_t mark = 0; mark + 1 < std::min(record.MarkLevels.size(), m_titles.size()); ++mark) {
        const auto& [rising, falling] = m_pairs[mark];
        const int order = Order(record, mark);
        if (!(order > 0 && falling >= often * rising) && !(order < 0 && rising >= often * falling))
            continue;
        place.element = mark;
        problems.Add({RuleId::MarksSwapped,
                      place,
                      {m_titles[mark], Amount{record.MarkLevels[mark], UnitGroup::WaterLevel}, m_titles[mark + 1],
                       Amount{record.MarkLevels[mark + 1], UnitGroup::WaterLevel}}});
    }
}
