// The sample model: a main river in two branches with a tributary between them. Names and numbers are invented, but of
// a size that a modeller believes.
#pragma once

#include "data/hd_parameters.h"

/// Every list and every sub-section filled; the same content each time.
HD_Parameters SampleRiver();

/// The sample with `count` initial conditions instead of its own, along branches as long as that takes.
HD_Parameters LongRiver(std::size_t count);
