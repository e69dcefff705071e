// What a program has to know of the process that it is, and to ask for.
#pragma once

#include <cstdint>
#include <string>

struct ProcessName
{
    std::string user{}, host{};
    std::int64_t number = 0;
    std::string program{}; // of another process
};
/// Who runs this process and where, as far as the system tells; in UTF-8.
ProcessName ThisProcess();
/// The process of this computer that has locked a file (PlatformFile::Lock), as far as the system tells; otherwise
/// number 0.
ProcessName ProcessLocking(std::uint64_t device, std::uint64_t inode);
/// Whether a process of this computer is surely gone.
bool HasEnded(std::int64_t number);

/// A write beyond the largest size that the user may give files fails from now on as one to a full disk does. Without
/// it the system ends the process, and with it all that is not saved. To be called before any file is written.
void IgnoreFileSizeSignal();

/// What a program of the command line is told and says is UTF-8 from now on: gives back main's arguments so, which
/// stay as long as the process. To be called once, first.
char** SpeakUtf8(int& argc, char** argv);
