// What a structure holds, for what must hold of it.
#pragma once

#include "tql/tql.h"

#include <cstdint>
#include <vector>

/// Names and values of everything below a node, in order, as hashes: a fuzzer asks for them thousands of times a
/// second. `emptyToo`: also keywords of no parameter or of an empty text.
std::vector<std::uint64_t> WordsOf(tqlHandle node, bool emptyToo = true);
