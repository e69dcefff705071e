// The most memory a program ever occupied, measured in a process of its own.
#pragma once

#include <cstddef>
#include <string>

/// Largest resident size of this process so far, in bytes; 0 where the system does not tell.
std::size_t PeakMemory();

/// Runs `command`, which prints PeakMemory() as its only output, and returns that number.
std::size_t PeakMemoryOf(const std::string& command, const std::string& scratchFile);
