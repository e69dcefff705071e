// Keeping project files true when an editor gave a member's extension another spelling.
#pragma once

#include <QString>

class CProjects;

/// A file has got the second path for its first. When they differ in the case of the extension only, the entries for
/// it, in whatever case they are spelt, have the new extension from now on, in the file of every open project. Only
/// those letters of the file change: everything else in it, and about it, stays. The user is told of a project file
/// that cannot be changed; its members are found in whatever case they are spelt.
void RespellMember(const CProjects& projects, const QString& oldPath, const QString& newPath);
