#include "editors/cross_sections/section_file.h"

#include "editors/cross_sections/section_rules.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <cmath>
#include <set>

namespace {

struct SectionFile
{
    Q_DECLARE_TR_FUNCTIONS(SectionFile)
};

// Names of the file.
constexpr const char* Target = "KVR_CROSS_SECTIONS";
constexpr const char* Section = "CrossSection";
constexpr const char* Branch = "Branch";
constexpr const char* TopoId = "TopoID";
constexpr const char* Chainage = "Chainage";
constexpr const char* Radius = "Radius";
constexpr const char* Width = "Width";
constexpr const char* Profile = "Profile";
constexpr const char* Point = "Point";

/// Reads sections until something is wrong, and then says what.
class CReader
{
public:
    explicit CReader(const QString& path) : m_path(path) {}
    const QString& Error() const { return m_error; }

    void ReadTarget(tqlHandle target, CCrossSections& read)
    {
        read.kept = KeepUnknown(target, {Section});
        for (int i = 1, count = tqlGetNoSections(target); i <= count && m_error.isEmpty(); ++i) {
            const tqlHandle node = tqlSectionByNum(target, i);
            if (tqlName(node) != Section)
                continue;
            CCrossSection section = ReadSection(node);
            if (m_error.isEmpty() && !m_keys.insert(section.Key()).second)
                Fail(node, WhyTaken(section));
            read.sections.push_back(std::move(section));
        }
    }

private:
    void Fail(tqlHandle node, const QString& what)
    {
        if (m_error.isEmpty())
            m_error = CParameterFile::ErrorAt(m_path, node, what);
    }

    CCrossSection ReadSection(tqlHandle node)
    {
        CCrossSection section;
        RefuseSecond(node);
        section.branch = ReadText(node, Branch);
        section.topoId = ReadText(node, TopoId);
        if (tqlGetNoKeywords(node, Chainage) == 0)
            Fail(node, SectionFile::tr("expected the chainage, Chainage = a number."));
        for (const auto& [name, value] : {std::pair(Chainage, &section.chainage), std::pair(Radius, &section.radius),
                                          std::pair(Width, &section.width)}) {
            if (tqlGetNoKeywords(node, name))
                ReadNumbers(node, name, 1, {value}, value != &section.chainage);
        }
        ReadPoints(tqlSectionByNameNum(node, Profile, 1), section);
        if (const CSectionFault fault = FindFault(section); fault.field != CSectionFault::Nothing)
            Fail(FaultyNode(node, fault), fault.text);
        section.kept = KeepUnknown(node, {Branch, TopoId, Chainage, Radius, Width, Profile});
        return section;
    }

    /// A value said twice would be lost when the file is saved.
    void RefuseSecond(tqlHandle node)
    {
        for (const char* name : {Branch, TopoId, Chainage, Radius, Width}) {
            if (const tqlHandle second = tqlKeywordByNameNum(node, name, 2))
                Fail(second, SectionFile::tr("expected only one %1 in a cross section.").arg(QLatin1String(name)));
        }
        if (const tqlHandle second = tqlSectionByNameNum(node, Profile, 2))
            Fail(second, SectionFile::tr("expected only one %1 in a cross section.").arg(QLatin1String(Profile)));
    }

    void ReadPoints(tqlHandle profile, CCrossSection& section)
    {
        for (int i = 1, count = tqlGetNoKeywords(profile, Point); i <= count && m_error.isEmpty(); ++i) {
            CSectionPoint point;
            ReadNumbers(profile, Point, i, {&point.offset, &point.level}, false);
            section.points.push_back(point);
        }
        if (profile)
            section.keptProfile = KeepUnknown(profile, {Point});
    }

    /// What is wrong stands in this line.
    static tqlHandle FaultyNode(tqlHandle node, const CSectionFault& fault)
    {
        tqlHandle line = nullptr;
        if (fault.field == CSectionFault::Point)
            line = tqlKeywordByNameNum(tqlSectionByNameNum(node, Profile, 1), Point, fault.point + 1);
        else if (fault.field == CSectionFault::Width)
            line = tqlKeywordByNameNum(node, Width, 1);
        else if (fault.field == CSectionFault::Branch)
            line = tqlKeywordByNameNum(node, Branch, 1);
        return line ? line : node;
    }

    /// Empty when the keyword is missing.
    QString ReadText(tqlHandle node, const char* name)
    {
        std::string text;
        if (tqlGetNoKeywords(node, name) && !tqlGetParam(node, name, &text))
            Fail(tqlKeywordByNameNum(node, name, 1),
                 SectionFile::tr("expected a text, %1 = \"...\".").arg(QLatin1String(name)));
        return QString::fromStdString(text);
    }

    /// All parameters of a keyword, each a number, or "nan" where `unset` is allowed.
    void ReadNumbers(tqlHandle node, const char* name, int number, const std::vector<double*>& values, bool unset)
    {
        const tqlHandle keyword = tqlKeywordByNameNum(node, name, number);
        tqlHandle param = tqlParamByNum(keyword, 1);
        bool good = tqlGetNoParams(keyword) == static_cast<int>(values.size());
        for (std::size_t i = 0; good && i < values.size(); ++i)
            good = tqlTake(&param, values[i]) && (std::isfinite(*values[i]) || (unset && std::isnan(*values[i])));
        if (!good)
            Fail(keyword, values.size() == 1
                              ? SectionFile::tr("expected a number after \"%1 =\".").arg(QLatin1String(name))
                              : SectionFile::tr("expected an offset and a bed level, two numbers, after \"%1 =\".")
                                    .arg(QLatin1String(name)));
    }

    QString m_path, m_error;
    std::set<decltype(CCrossSection().Key())> m_keys;
};

void WriteSection(tqlHandle file, const CCrossSection& section)
{
    tqlAddSection(file, Section);
    tqlPutParam(file, Branch, std::string_view(section.branch.toStdString()));
    tqlPutParam(file, TopoId, std::string_view(section.topoId.toStdString()));
    tqlPutParam(file, Chainage, section.chainage);
    tqlPutParam(file, Radius, section.radius);
    tqlPutParam(file, Width, section.width);
    tqlAddSection(file, Profile);
    for (const CSectionPoint& point : section.points) {
        tqlAddKeyword(file, Point);
        tqlAddDouble(file, point.offset);
        tqlAddDouble(file, point.level);
    }
    WriteKept(file, section.keptProfile);
    tqlEndSection(file);
    WriteKept(file, section.kept);
    tqlEndSection(file);
}

} // namespace

QString ReadCrossSections(const QString& path, CCrossSections& sections)
{
    const CParameterFile file(tqlLoadFile(path.toStdString()));
    if (const QString error = file.SyntaxError(); !error.isEmpty())
        return error;
    const tqlHandle target = tqlTargetByNameNum(file.Get(), Target, 1);
    if (!target)
        return SectionFile::tr("%1 holds no cross sections: it has no section [%2].")
            .arg(QFileInfo(path).fileName(), QLatin1String(Target));
    CCrossSections read;
    CReader reader(path);
    reader.ReadTarget(target, read);
    if (!reader.Error().isEmpty())
        return reader.Error();
    bool own = true; // the first target of the name has the sections
    for (int i = 1, count = tqlGetNoSections(file.Get()); i <= count; ++i) {
        const tqlHandle other = tqlSectionByNum(file.Get(), i);
        if (tqlName(other) != Target || !std::exchange(own, false))
            read.keptTargets.push_back(KeepUnknown(other, {}));
    }
    read.SortByPlace();
    sections = std::move(read);
    return {};
}

QString WriteCrossSections(const QString& path, const CCrossSections& sections)
{
    const CParameterFile file(tqlCreate());
    tqlAddTarget(file.Get(), Target);
    for (const CCrossSection& section : sections.sections)
        WriteSection(file.Get(), section);
    WriteKept(file.Get(), sections.kept);
    tqlEndSection(file.Get());
    for (const CKeptSection& target : sections.keptTargets) {
        tqlAddTarget(file.Get(), target.name);
        WriteKept(file.Get(), target);
        tqlEndSection(file.Get());
    }
    return WriteParameterFile(path, file.Get());
}
