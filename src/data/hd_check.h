// What is not in order in an HD parameter file that parses.
#pragma once

#include "tql/tql.h"

#include <cstddef>
#include <string>
#include <vector>

struct Finding
{
    std::size_t line = 0, column = 0; // from 1
    std::string text;
    bool losesContent = false; // reading does not keep what stands there, so rewriting the file would lose it
};

/// Walks a loaded file along the tables of sections, keywords and fields. In file order.
std::vector<Finding> CheckHDStructure(tqlHandle structure);
