// Where in the text of a file a problem of its content is.
#pragma once

#include "data/hd_parameters.h"
#include "rules/problem.h"

/// The structure is what the parameters were read from. Of what is missing in the file, the place of what should hold
/// it.
TqlPosition PositionOf(const ProblemPlace& place, const HD_Parameters& parameters, tqlHandle structure);
/// The record that a place is about.
const HD_RiverPos& RecordAt(const ProblemPlace& place, const HD_Parameters& parameters);
