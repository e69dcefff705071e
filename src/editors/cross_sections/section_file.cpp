#include "editors/cross_sections/section_file.h"

#include "editors/cross_sections/section_rules.h"
#include "files/declared_section.h"
#include "files/field_io.h"

#include <iterator>
#include <set>

namespace {

using U = UnitGroup;

// What the file holds, with its texts as fields take them.
struct FileSection
{
    std::string branch, topoId;
    CCrossSection section; // all else
};
struct FileSections
{
    std::vector<FileSection> sections;
    UnknownNodes kept, keptTargets;
};

// The names of the file.
constexpr const char *SectionName = "CrossSection", *ProfileName = "Profile";
constexpr const char *BranchKeyword = "Branch", *TopoIdKeyword = "TopoID", *WidthKeyword = "Width";
constexpr const char* PointKeyword = "Point";
constexpr const char* NoBranch = "BRANCH"; // of a section whose branch the file does not name

using F = FileSection;
using C = CCrossSection;
constexpr auto branch = FieldsOf<F>({Text<&F::branch>("Branch")});
constexpr auto topoId = FieldsOf<F>({Text<&F::topoId>("TopoID")});
constexpr auto chainage = FieldsOf<F>({Number<&F::section, &C::chainage>("Chainage", U::Chainage)});
constexpr auto radius = FieldsOf<F>({Number<&F::section, &C::radius>("Radius", U::Radius).MayBeUnknown()});
constexpr auto width = FieldsOf<F>({Number<&F::section, &C::width>("Width", U::Width).MayBeUnknown()});
constexpr auto points = FieldsOf<F>({Group<&F::section, &C::points>("Point")});
constexpr DeclaredKeyword sectionKeywords[] = {{BranchKeyword, branch, Presence::Optional}, // a rule asks for it
                                               {TopoIdKeyword, topoId, Presence::Optional},
                                               {"Chainage", chainage},
                                               {"Radius", radius, Presence::Optional},
                                               {WidthKeyword, width, Presence::Optional}};
constexpr DeclaredKeyword profileKeywords[] = {{PointKeyword, points}};
constexpr DeclaredSection sectionSections[] = {
    {.name = ProfileName, .kept = Keeps<&F::section, &C::keptProfile>(), .keywords = profileKeywords}};

constexpr Field each = SectionGroup<&FileSections::sections>(SectionName);
constexpr DeclaredSection targetSections[] = {{.name = SectionName,
                                               .kept = Keeps<&F::section, &C::kept>(),
                                               .keywords = sectionKeywords,
                                               .sections = sectionSections,
                                               .sectionCount = std::size(sectionSections),
                                               .each = &each}};
constexpr DeclaredFile file{{.name = "KVR_CROSS_SECTIONS",
                             .kept = Keeps<&FileSections::kept>(),
                             .sections = targetSections,
                             .sectionCount = std::size(targetSections)},
                            Keeps<&FileSections::keptTargets>()};

/// What a section has to fulfil beside its declaration: it is made to, and that is reported.
void Mend(FileSection& read, tqlHandle node, LoadReport& report)
{
    CCrossSection& section = read.section;
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
            ReportRule(report, node, WidthKeyword, 1, ParamsText(width, &read), rule);
            break;
        default:
            read.branch = NoBranch;
            section.branch = QString::fromStdString(read.branch);
            ReportRule(report, node, BranchKeyword, 1, ParamsText(branch, &read), rule);
        }
    }
}

using Keys = std::set<decltype(CCrossSection().Key())>;

/// A section at the place of another is told apart by its topo ID.
void MendKey(FileSection& read, const Keys& taken, tqlHandle node, LoadReport& report)
{
    CCrossSection& section = read.section;
    CCrossSection same = section;
    same.points.clear();
    for (int number = 2; taken.contains(section.Key()); ++number)
        section.topoId = same.topoId + QStringLiteral("-%1").arg(number);
    read.topoId = section.topoId.toStdString();
    ReportRule(report, node, TopoIdKeyword, 1, ParamsText(topoId, &read),
               [same] { return WhyTaken(same).toStdString(); });
}

} // namespace

KVR_FIELDS(CSectionPoint,
           Number<&Self::offset>("offset", U::Width),
           Number<&Self::level>("level", U::WaterLevel))

CCrossSections LoadCrossSections(tqlHandle structure, LoadReport& report)
{
    FileSections read;
    ReadDeclared(structure, file, &read, report);
    const tqlHandle target = tqlTargetByNameNum(structure, file.target.name, 1);
    const auto nodeOf = [&](const FileSection& each) {
        return tqlSectionByNameNum(target, SectionName, int(&each - read.sections.data()) + 1);
    };
    Keys all, met;
    for (FileSection& each : read.sections) {
        each.section.branch = QString::fromStdString(each.branch);
        each.section.topoId = QString::fromStdString(each.topoId);
        Mend(each, nodeOf(each), report);
        all.insert(each.section.Key());
    }
    CCrossSections sections{{}, std::move(read.kept), std::move(read.keptTargets)};
    for (FileSection& each : read.sections) {
        if (!met.insert(each.section.Key()).second) {
            MendKey(each, all, nodeOf(each), report);
            all.insert(each.section.Key());
        }
        sections.sections.push_back(std::move(each.section));
    }
    sections.SortByPlace();
    return sections;
}

Result<void> SaveCrossSections(const CCrossSections& sections, const std::string& path)
{
    FileSections written{{}, sections.kept, sections.keptTargets};
    for (const CCrossSection& section : sections.sections)
        written.sections.push_back({section.branch.toStdString(), section.topoId.toStdString(), section});
    return SaveDeclared(path, file, &written);
}
