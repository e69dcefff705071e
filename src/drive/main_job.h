// The program's main job, from an opened sample file to the file read again.
#pragma once

#include <QString>

class Robot;

/// Edits the initial conditions of the open sample document and saves it; `file` is its path.
void DriveMainJob(Robot& robot, const QString& file);
