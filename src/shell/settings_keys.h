// The keys of the user's settings (QSettings), in one place.
#pragma once

namespace Settings {
inline constexpr char Geometry[] = "window/geometry";
inline constexpr char State[] = "window/state";
inline constexpr char Tabs[] = "window/tabs";
inline constexpr char HiddenBars[] = "window/hiddenToolBars";
inline constexpr char RecentFiles[] = "files/recent";
inline constexpr char LastFolder[] = "files/folder";
inline constexpr char OneProgram[] = "files/oneProgram";
inline constexpr char UsCustomary[] = "units/usCustomary";
inline constexpr char AllDigits[] = "numbers/allDigits";
inline constexpr char Language[] = "language";
inline constexpr char Appearance[] = "window/appearance";
inline constexpr char TriedLibraries[] = "plugins/tried";
} // namespace Settings
