// Finds the library that draws plots.
#pragma once

#include "plot/plot.h"

/// Null, with the reason in `reason`, where there is none. It stays loaded.
const PlotLibrary* LoadPlotLibrary(QString& reason);
