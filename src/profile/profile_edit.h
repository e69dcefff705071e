// What the user does to the points of a profile, as steps to undo of the tables that they come from: the same steps
// that a grid makes.
#pragma once

#include "profile/profile_content.h"

/// The value of the point becomes another, in the unit shown.
void SetProfileValue(const Profile& profile, const PlotPoint& point, double value);
/// The line of the point moves along the branch.
void MoveProfileLine(const Profile& profile, const PlotPoint& point, double chainage);
/// A new line with this value in the column that the curve shows, behind the line before it on the branch; its other
/// numbers are interpolated between the lines before and behind it. Returns its
/// place in the file; nothing when there could be none (the user has been told).
std::optional<std::size_t> AddProfileLine(const Profile& profile, int track, int curve, double chainage, double value);
void RemoveProfileLine(const Profile& profile, const PlotPoint& point);
