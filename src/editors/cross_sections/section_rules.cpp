#include "editors/cross_sections/section_rules.h"

#include "files/declare_field.h"
#include "ks/units/edit_style.h"

#include <QCoreApplication>
#include <algorithm>
#include <functional>

namespace {

struct SectionRules
{
    Q_DECLARE_TR_FUNCTIONS(SectionRules)
};

} // namespace

QString SectionRule(CSectionFault::Field field)
{
    switch (field) {
    case CSectionFault::Branch:
        return SectionRules::tr("a cross section needs the name of its branch.");
    case CSectionFault::Width:
        return SectionRules::tr("expected a width that is not negative.");
    case CSectionFault::Point:
        return SectionRules::tr("expected offsets that do not decrease from point to point.");
    default:
        return {};
    }
}

CSectionFault FindFault(const CCrossSection& section)
{
    const auto fault = [](CSectionFault::Field field, int point = -1) {
        return CSectionFault{field, point, SectionRule(field)};
    };
    if (section.branch.empty())
        return fault(CSectionFault::Branch);
    static const Field& width = FieldOf(&CCrossSection::width);
    if (!width.bounds.Allow(section.width))
        return fault(CSectionFault::Width);
    const auto& points = section.points;
    const auto falls = std::ranges::adjacent_find(points, std::greater(), &CSectionPoint::offset);
    return falls == points.end() ? CSectionFault() : fault(CSectionFault::Point, int(falls - points.begin()) + 1);
}

QString WhyTaken(const CCrossSection& section)
{
    return SectionRules::tr(
               "there is a cross section of branch \"%1\" at chainage %2 m with the topo ID \"%3\" already.")
        .arg(section.Branch(), KsShortestNumber(section.chainage), section.TopoId());
}
