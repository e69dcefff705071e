// What the editors of a project do for each other, by key and mouse.
#pragma once

class Robot;

/// Goes through the open sample project; its HD document is open.
void DriveProjectJob(Robot& robot);
