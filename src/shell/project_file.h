// Project files (.kvrp): which files belong together.
#pragma once

#include "files/declared_section.h"

#include <QString>
#include <string>
#include <vector>

class QDir;

struct ProjectMember
{
    std::string file; // as it stands in the project file

    static FieldList DeclaredFields();
    /// The absolute path, whichever platform wrote the name.
    QString PathIn(const QDir& folder) const;
};

struct ProjectFile
{
    std::vector<ProjectMember> members;
    KeptContent kept;
};

const DeclaredSection& DeclaredProjectFile();
/// Where the members' keywords stand, by number.
tqlHandle MemberKeyword(tqlHandle structure, int number);
