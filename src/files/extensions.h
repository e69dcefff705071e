// The extensions of the product's files.
#pragma once

inline constexpr char HDExtension[] = ".hdkv";
inline constexpr char SavedHDExtension[] = ".HDKV"; // what a save calls them
inline constexpr char NetworkExtension[] = ".kvnw";
inline constexpr char CrossSectionExtension[] = ".kvxs";
inline constexpr char ProjectExtension[] = ".kvrp";
