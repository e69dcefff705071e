#include "peak_memory.h"

#include <cstdlib>
#include <fstream>

#if defined(_WIN32)
#include <windows.h>
// after windows.h
#include <psapi.h>

std::size_t PeakMemory()
{
    PROCESS_MEMORY_COUNTERS counters{};
    return GetProcessMemoryInfo(GetCurrentProcess(), &counters, sizeof counters) ? counters.PeakWorkingSetSize : 0;
}
#else
// Not getrusage: its figure is inherited from the process that started this one.
std::size_t PeakMemory()
{
    std::ifstream status("/proc/self/status");
    for (std::string word; status >> word;) {
        std::size_t kilobytes = 0;
        if (word == "VmHWM:" && status >> kilobytes)
            return kilobytes * 1024;
    }
    return 0;
}
#endif

std::size_t PeakMemoryOf(const std::string& command, const std::string& scratchFile)
{
    std::size_t peak = 0;
    if (std::system((command + " > \"" + scratchFile + "\"").c_str()) == 0)
        std::ifstream(scratchFile) >> peak;
    return peak;
}
