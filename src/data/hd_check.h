// What is not in order in an HD parameter file that parses.
#pragma once

#include "files/finding.h"

/// Reads a loaded file and says where it departs from the tables of sections, keywords and fields. In file order.
std::vector<Finding> CheckHDStructure(tqlHandle structure);
