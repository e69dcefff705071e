#include "shell/project_file.h"

#include <QDir>
#include <iterator>

namespace {

constexpr const char *TargetName = "KVR_PROJECT", *MembersName = "Members", *MemberName = "File";

using P = ProjectFile;
constexpr auto members = FieldsOf<P>({Group<&P::members>(MemberName)});
constexpr DeclaredKeyword memberKeywords[] = {{MemberName, members, Presence::EachLine}};
constexpr DeclaredSection sections[] = {
    {.name = MembersName, .kept = Keeps<&P::kept>(), .keywords = memberKeywords, .required = true}};
constexpr DeclaredSection file{
    .name = TargetName, .kept = Keeps<&P::kept>(), .sections = sections, .sectionCount = std::size(sections)};
static_assert(IsOf<P>(file));

} // namespace

KVR_FIELDS(ProjectMember, FileName<&Self::file>(MemberName))

QString ProjectMember::PathIn(const QDir& folder) const
{
    return QDir::cleanPath(folder.absoluteFilePath(QString::fromStdString(file).replace(u'\\', u'/')));
}

const DeclaredSection& DeclaredProjectFile()
{
    return file;
}

tqlHandle MemberKeyword(tqlHandle structure, int number)
{
    const tqlHandle target = tqlTargetByNameNum(structure, TargetName, 1);
    return tqlKeywordByNameNum(tqlSectionByNameNum(target, MembersName, 1), MemberName, number);
}
