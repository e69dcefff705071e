#include "files/platform_process.h"

#include "base/utf8_path.h"

#include <string>
#include <vector>

#define WIN32_LEAN_AND_MEAN
#ifndef NOMINMAX
#define NOMINMAX
#endif
#include <windows.h>
// It needs what windows.h declares.
#include <shellapi.h>

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

char** SpeakUtf8(int& argc, char** argv)
{
    ::SetConsoleOutputCP(CP_UTF8);
    int count = 0;
    wchar_t** const wide = ::CommandLineToArgvW(::GetCommandLineW(), &count);
    if (!wide)
        return argv;
    static std::vector<std::string> texts;
    static std::vector<char*> pointers;
    for (int i = 0; i < count; ++i)
        texts.push_back(Utf8FromPath(std::filesystem::path(wide[i])));
    ::LocalFree(wide);
    for (std::string& text : texts)
        pointers.push_back(text.data());
    pointers.push_back(nullptr);
    argc = count;
    return pointers.data();
}
