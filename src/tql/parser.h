// From text to tree, one pass.
#pragma once

#include "tql/node.h"

namespace tql {

inline constexpr std::size_t MaxDepth = 128;                        // sections inside one another, the target included
inline constexpr std::size_t MaxLineLength = std::size_t{16} << 20; // bytes, without the line end

/// Parses `structure.text`; false, with `structure.error` filled and the tree half built, at the first error.
bool Parse(Structure& structure, const std::string& file);

/// Whether `params` could stand behind "name =" as one line.
bool IsParamList(std::string_view params);

} // namespace tql
