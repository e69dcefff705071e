// The cross sections of the sample model.
#pragma once

#include <string>

/// The text of their file; the same each time. They stand at every third location of SampleRiver's initial conditions
/// and at both ends of each branch; radius and width are those of the sample network there.
std::string SampleSectionsText();
