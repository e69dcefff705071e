// From text to tree, one pass.
#pragma once

#include "tql/node.h"

namespace tql {

inline constexpr std::size_t MaxDepth = 128;                        // sections inside one another, the target included
inline constexpr std::size_t MaxLineLength = std::size_t{16} << 20; // bytes, without the line end

inline constexpr std::uint64_t MaxFileSize = (std::uint64_t{2} << 30) - 1; // bytes

/// What every file that this library writes begins with; a line end follows.
inline constexpr std::string_view FirstLine = "// KVR parameter file 1";

/// Parses `structure.text`; false, with `structure.error` filled and the tree half built, at the first error.
bool Parse(Structure& structure, const std::string& file);

/// Whether `params` could stand behind "name =" as one line.
bool IsParamList(std::string_view params);

} // namespace tql
