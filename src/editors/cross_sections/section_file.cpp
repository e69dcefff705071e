#include "editors/cross_sections/section_file.h"

#include "editors/cross_sections/section_rules.h"
#include "files/declared_section.h"
#include "files/field_io.h"

#include <QCoreApplication>
#include <iterator>
#include <map>
#include <set>

namespace {

using U = UnitGroup;

// The names of the file.
constexpr const char *SectionName = "CrossSection", *ProfileName = "Profile";
constexpr const char *BranchKeyword = "Branch", *TopoIdKeyword = "TopoID", *WidthKeyword = "Width";
constexpr const char* PointKeyword = "Point";
constexpr const char* NoBranch = "BRANCH"; // of a section whose branch the file does not name

using C = CCrossSection;
using S = CCrossSections;
constexpr auto sectionFields = FieldsOf<C>(
    {Text<&C::branch>(BranchKeyword).Title(QT_TRANSLATE_NOOP("SectionTables", "Branch")),
     Text<&C::topoId>(TopoIdKeyword).Title(QT_TRANSLATE_NOOP("SectionTables", "Topo ID")),
     Number<&C::chainage>("Chainage", U::Chainage).Title(QT_TRANSLATE_NOOP("SectionTables", "Chainage")),
     Number<&C::radius>("Radius", U::Radius).MayBeUnknown().Title(QT_TRANSLATE_NOOP("SectionTables", "Radius")),
     Number<&C::width>("Width", U::Width).MayBeUnknown().Range(0).Title(QT_TRANSLATE_NOOP("SectionTables", "Width"))});
constexpr FieldList FieldAt(std::size_t index)
{
    return FieldList(sectionFields).subspan(index, 1);
}
constexpr auto points = FieldsOf<C>({Group<&C::points>("Point")});
constexpr DeclaredKeyword sectionKeywords[] = {{BranchKeyword, FieldAt(0), Presence::Optional}, // a rule asks for it
                                               {TopoIdKeyword, FieldAt(1), Presence::Optional},
                                               {"Chainage", FieldAt(2)},
                                               {"Radius", FieldAt(3), Presence::Optional},
                                               {WidthKeyword, FieldAt(4), Presence::Optional}};
constexpr DeclaredKeyword profileKeywords[] = {{PointKeyword, points, Presence::EachLine}};
constexpr DeclaredSection sectionSections[] = {
    {.name = ProfileName, .kept = Keeps<&C::kept>(), .keywords = profileKeywords}};

constexpr Field each = SectionGroup<&S::sections>(SectionName);
constexpr DeclaredSection targetSections[] = {{.name = SectionName,
                                               .kept = Keeps<&C::kept>(),
                                               .keywords = sectionKeywords,
                                               .sections = sectionSections,
                                               .sectionCount = std::size(sectionSections),
                                               .each = &each}};
constexpr DeclaredSection file{.name = "KVR_CROSS_SECTIONS",
                               .kept = Keeps<&S::kept>(),
                               .sections = targetSections,
                               .sectionCount = std::size(targetSections)};
static_assert(IsOf<S>(file));

/// What a section has to fulfil beside its declaration: it is made to, and that is reported.
void Mend(CCrossSection& section, tqlHandle node, LoadReport& report)
{
    for (CSectionFault fault; (fault = FindFault(section)).field != CSectionFault::Nothing;) {
        const auto rule = [field = fault.field] { return SectionRule(field).toStdString(); };
        switch (fault.field) {
        case CSectionFault::Point: {
            CSectionPoint& point = section.points[std::size_t(fault.point)];
            point.offset = section.points[std::size_t(fault.point) - 1].offset;
            ReportRule(report, tqlSectionByNameNum(node, ProfileName, 1), PointKeyword, fault.point + 1,
                       ParamsText(CSectionPoint::DeclaredFields(), &point), rule);
            break;
        }
        case CSectionFault::Width:
            section.width = KsUnset;
            ReportRule(report, node, WidthKeyword, 1, ParamsText(FieldAt(4), &section), rule);
            break;
        default:
            section.branch = NoBranch;
            ReportRule(report, node, BranchKeyword, 1, ParamsText(FieldAt(0), &section), rule);
        }
    }
}

using Key = decltype(CCrossSection().Key());
using Keys = std::set<Key>;
using Numbers = std::map<Key, int>; // the last one that was tried, by the key that is taken: many may share it

/// A section at the place of another is told apart by its topo ID.
void MendKey(CCrossSection& section, const Keys& taken, Numbers& numbers, tqlHandle node, LoadReport& report)
{
    CCrossSection same = section;
    same.points.clear();
    int& number = numbers.try_emplace(section.Key(), 1).first->second;
    do
        section.topoId = same.topoId + '-' + std::to_string(++number);
    while (taken.contains(section.Key()));
    ReportRule(report, node, TopoIdKeyword, 1, ParamsText(FieldAt(1), &section),
               [same] { return WhyTaken(same).toStdString(); });
}

} // namespace

FieldList CCrossSection::DeclaredFields()
{
    return sectionFields;
}

KVR_FIELDS(CSectionPoint, Number<&Self::offset>("offset", U::Width).Title(QT_TRANSLATE_NOOP("SectionTables", "Offset")),
           Number<&Self::level>("level", U::WaterLevel).Title(QT_TRANSLATE_NOOP("SectionTables", "Bed level")))

CCrossSections LoadCrossSections(tqlHandle structure, LoadReport& report)
{
    CCrossSections read;
    ReadDeclaredFile(structure, file, &read, report);
    const tqlHandle target = tqlTargetByNameNum(structure, file.name, 1);
    const auto nodeOf = [&](const CCrossSection& each) {
        return tqlSectionByNameNum(target, SectionName, int(&each - read.sections.data()) + 1);
    };
    Keys all, met;
    Numbers numbers;
    for (CCrossSection& each : read.sections) {
        Mend(each, nodeOf(each), report);
        all.insert(each.Key());
    }
    for (CCrossSection& each : read.sections) {
        if (!met.insert(each.Key()).second) {
            MendKey(each, all, numbers, nodeOf(each), report);
            all.insert(each.Key());
        }
    }
    read.SortByPlace();
    return read;
}

const DeclaredSection& DeclaredSectionFile()
{
    return file;
}
