#include "editors/cross_sections/section_file.h"

#include "editors/cross_sections/section_rules.h"
#include "ks/fc/parameter_file.h"

#include <QCoreApplication>
#include <iterator>
#include <set>

namespace {

using U = UnitGroup;

// The names of the file.
constexpr const char *SectionName = "CrossSection", *ProfileName = "Profile", *PointKeyword = "Point";

using C = CCrossSection;
using S = CCrossSections;
constexpr auto sectionFields = FieldsOf<C>(
    {Text<&C::branch>("Branch").Title(QT_TRANSLATE_NOOP("SectionTables", "Branch")),
     Text<&C::topoId>("TopoID").Title(QT_TRANSLATE_NOOP("SectionTables", "Topo ID")),
     Number<&C::chainage>("Chainage", U::Chainage).Title(QT_TRANSLATE_NOOP("SectionTables", "Chainage")),
     Number<&C::radius>("Radius", U::Radius).MayBeUnknown().Title(QT_TRANSLATE_NOOP("SectionTables", "Radius")),
     Number<&C::width>("Width", U::Width).MayBeUnknown().Range(0).Title(QT_TRANSLATE_NOOP("SectionTables", "Width"))});
constexpr FieldList FieldOf(std::size_t index)
{
    return FieldList(sectionFields).subspan(index, 1);
}
constexpr auto points = FieldsOf<C>({Group<&C::points>("Point")});
constexpr DeclaredKeyword sectionKeywords[] = {{"Branch", FieldOf(0), Presence::Optional}, // a rule asks for it
                                               {"TopoID", FieldOf(1), Presence::Optional},
                                               {"Chainage", FieldOf(2)},
                                               {"Radius", FieldOf(3), Presence::Optional},
                                               {"Width", FieldOf(4), Presence::Optional}};
constexpr DeclaredKeyword profileKeywords[] = {{PointKeyword, points}};
constexpr DeclaredSection sectionSections[] = {
    {.name = ProfileName, .kept = Keeps<&C::keptProfile>(), .keywords = profileKeywords}};

constexpr Field each = SectionGroup<&S::sections>(SectionName);
constexpr DeclaredSection targetSections[] = {{.name = SectionName,
                                               .kept = Keeps<&C::kept>(),
                                               .keywords = sectionKeywords,
                                               .sections = sectionSections,
                                               .sectionCount = std::size(sectionSections),
                                               .each = &each}};
constexpr DeclaredFile file{{.name = "KVR_CROSS_SECTIONS",
                             .kept = Keeps<&S::kept>(),
                             .sections = targetSections,
                             .sectionCount = std::size(targetSections)},
                            Keeps<&S::keptTargets>()};

/// What is wrong stands in this line.
tqlHandle FaultyNode(tqlHandle node, const CSectionFault& fault)
{
    return fault.point < 0
               ? CKsParameterFile::PlaceOf(node, fault.keyword)
               : tqlKeywordByNameNum(tqlSectionByNameNum(node, ProfileName, 1), PointKeyword, fault.point + 1);
}

} // namespace

FieldList CCrossSection::DeclaredFields()
{
    return sectionFields;
}

FieldList CSectionPoint::DeclaredFields()
{
    using P = CSectionPoint;
    static constexpr auto fields =
        FieldsOf<P>({Number<&P::offset>("offset", U::Width).Title(QT_TRANSLATE_NOOP("SectionTables", "Offset")),
                     Number<&P::level>("level", U::WaterLevel).Title(QT_TRANSLATE_NOOP("SectionTables", "Bed level"))});
    return fields;
}

QString ReadCrossSections(const QString& path, CCrossSections& sections)
{
    CCrossSections read;
    CKsParameterFile source(path, file, &read);
    std::set<decltype(CCrossSection().Key())> keys;
    for (int i = 0; i < int(read.sections.size()) && source.Error().isEmpty(); ++i) {
        const CCrossSection& section = read.sections[std::size_t(i)];
        const tqlHandle node = tqlSectionByNameNum(source.Target(), SectionName, i + 1);
        if (const CSectionFault fault = FindFault(section); !fault.text.isEmpty())
            source.Fail(FaultyNode(node, fault), fault.text);
        else if (!keys.insert(section.Key()).second)
            source.Fail(node, WhyTaken(section));
    }
    if (!source.Error().isEmpty())
        return source.Error();
    read.SortByPlace();
    sections = std::move(read);
    return {};
}

QString WriteCrossSections(const QString& path, const CCrossSections& sections)
{
    return KsWriteParameterFile(path, file, &sections);
}
