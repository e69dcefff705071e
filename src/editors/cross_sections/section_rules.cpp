#include "editors/cross_sections/section_rules.h"

#include "ks/units/edit_style.h"

#include <QCoreApplication>

namespace {

struct SectionRules
{
    Q_DECLARE_TR_FUNCTIONS(SectionRules)
};

} // namespace

CSectionFault FindFault(const CCrossSection& section)
{
    if (section.branch.empty())
        return {SectionRules::tr("a cross section needs the name of its branch."), "Branch"};
    if (section.width < 0)
        return {SectionRules::tr("expected a width that is not negative."), "Width"};
    for (std::size_t i = 1; i < section.points.size(); ++i) {
        if (section.points[i].offset < section.points[i - 1].offset)
            return {SectionRules::tr("expected offsets that do not decrease from point to point."), {}, int(i)};
    }
    return {};
}

QString WhyTaken(const CCrossSection& section)
{
    return SectionRules::tr(
               "there is a cross section of branch \"%1\" at chainage %2 m with the topo ID \"%3\" already.")
        .arg(section.Branch(), KsShortestNumber(section.chainage), section.TopoId());
}
