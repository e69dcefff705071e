#include "editors/cross_sections/section_file.h"

#include "editors/cross_sections/section_rules.h"
#include "ks/fc/parameter_file.h"

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
constexpr const char *BranchKeyword = "Branch", *WidthKeyword = "Width", *PointKeyword = "Point";

using F = FileSection;
using C = CCrossSection;
constexpr auto branch = FieldsOf<F>({Text<&F::branch>("Branch")});
constexpr auto topoId = FieldsOf<F>({Text<&F::topoId>("TopoID")});
constexpr auto chainage = FieldsOf<F>({Number<&F::section, &C::chainage>("Chainage", U::Chainage)});
constexpr auto radius = FieldsOf<F>({Number<&F::section, &C::radius>("Radius", U::Radius).MayBeUnknown()});
constexpr auto width = FieldsOf<F>({Number<&F::section, &C::width>("Width", U::Width).MayBeUnknown()});
constexpr auto points = FieldsOf<F>({Group<&F::section, &C::points>("Point")});
constexpr DeclaredKeyword sectionKeywords[] = {{BranchKeyword, branch, Presence::Optional}, // a rule asks for it
                                               {"TopoID", topoId, Presence::Optional},
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

/// What is wrong stands in this line.
tqlHandle FaultyNode(tqlHandle node, const CSectionFault& fault)
{
    switch (fault.field) {
    case CSectionFault::Point:
        return tqlKeywordByNameNum(tqlSectionByNameNum(node, ProfileName, 1), PointKeyword, fault.point + 1);
    case CSectionFault::Width:
        return CKsParameterFile::PlaceOf(node, WidthKeyword);
    default:
        return CKsParameterFile::PlaceOf(node, BranchKeyword);
    }
}

} // namespace

FieldList CSectionPoint::DeclaredFields()
{
    using P = CSectionPoint;
    static constexpr auto fields =
        FieldsOf<P>({Number<&P::offset>("offset", U::Width), Number<&P::level>("level", U::WaterLevel)});
    return fields;
}

QString ReadCrossSections(const QString& path, CCrossSections& sections)
{
    FileSections read;
    CKsParameterFile source(path, file, &read);
    CCrossSections taken;
    std::set<decltype(CCrossSection().Key())> keys;
    for (std::size_t i = 0; i < read.sections.size() && source.Error().isEmpty(); ++i) {
        CCrossSection section = std::move(read.sections[i].section);
        section.branch = QString::fromStdString(read.sections[i].branch);
        section.topoId = QString::fromStdString(read.sections[i].topoId);
        const tqlHandle node = tqlSectionByNameNum(source.Target(), SectionName, int(i) + 1);
        if (const CSectionFault fault = FindFault(section); fault.field != CSectionFault::Nothing)
            source.Fail(FaultyNode(node, fault), fault.text);
        else if (!keys.insert(section.Key()).second)
            source.Fail(node, WhyTaken(section));
        taken.sections.push_back(std::move(section));
    }
    if (!source.Error().isEmpty())
        return source.Error();
    taken.kept = std::move(read.kept);
    taken.keptTargets = std::move(read.keptTargets);
    taken.SortByPlace();
    sections = std::move(taken);
    return {};
}

QString WriteCrossSections(const QString& path, const CCrossSections& sections)
{
    FileSections written{{}, sections.kept, sections.keptTargets};
    for (const CCrossSection& section : sections.sections)
        written.sections.push_back({section.branch.toStdString(), section.topoId.toStdString(), section});
    return KsWriteParameterFile(path, file, &written);
}
