// What holds for files of every kind.
#pragma once

#include "base/result.h"
#include "files/finding.h"

#include <functional>
#include <string>

/// Reads a loaded file, and gives back the text that a save would write.
using RoundTrip = std::function<Result<std::string>(tqlHandle structure, LoadReport& report)>;
std::string CheckFile(const std::string& text, const RoundTrip& trip);
