// Keeping a project file true when an editor gave a member's extension another spelling.
#pragma once

#include <QString>

/// When both paths differ in the case of the extension only, the project file's entries for the first name the second
/// from now on. Only those letters of the file change: everything else in it, and about it, stays. A project file that
/// may not be written is left; its members are found in whatever case they are spelt.
void RespellMember(const QString& projectPath, const QString& oldPath, const QString& newPath);
