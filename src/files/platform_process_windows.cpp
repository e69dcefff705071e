#include "files/platform_process.h"

#include "base/utf8_path.h"

#define WIN32_LEAN_AND_MEAN
#define NOMINMAX
#include <windows.h>

ProcessName ThisProcess()
{
    ProcessName process{.number = std::int64_t(::GetCurrentProcessId())};
    wchar_t name[256];
    DWORD length = DWORD(std::size(name));
    if (::GetComputerNameW(name, &length))
        process.host = Utf8FromPath(std::filesystem::path(name));
    length = ::GetEnvironmentVariableW(L"USERNAME", name, DWORD(std::size(name)));
    if (length > 0 && length < std::size(name))
        process.user = Utf8FromPath(std::filesystem::path(name));
    return process;
}

ProcessName ProcessLocking(std::uint64_t, std::uint64_t)
{
    return {};
}

bool HasEnded(std::int64_t)
{
    return false; // what holds a lock here lives: there are no copies of processes
}

void IgnoreFileSizeSignal() {}
