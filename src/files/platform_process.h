// What a program has to know of the process that it is, and to ask for.
#pragma once

#include <cstdint>
#include <string>

struct ProcessName
{
    std::string user{}, host{};
    std::int64_t number = 0;
};
/// Who runs this process and where, as far as the system tells; in UTF-8.
ProcessName ThisProcess();
/// Whether a process of this computer is surely gone.
bool HasEnded(std::int64_t number);

/// A write beyond the largest size that the user may give files fails from now on as one to a full disk does. Without
/// it the system ends the process, and with it all that is not saved. To be called before any file is written.
void IgnoreFileSizeSignal();
