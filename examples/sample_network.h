// The network of the sample model: a meandering main river in two branches, and a tributary that joins where they meet.
#pragma once

#include <string>

/// The text of its file; the same each time. Branches and chainages are those of SampleRiver.
std::string SampleNetworkText();
