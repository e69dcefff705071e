#include "files/platform_process.h"

#include <cerrno>
#include <csignal>
#include <pwd.h>
#include <unistd.h>

ProcessName ThisProcess()
{
    ProcessName process{.number = ::getpid()};
    char buffer[4096];
    passwd entry{}, *found = nullptr;
    if (::getpwuid_r(::geteuid(), &entry, buffer, sizeof buffer, &found) == 0 && found)
        process.user = found->pw_name;
    else
        process.user = std::to_string(::geteuid());
    if (::gethostname(buffer, sizeof buffer - 1) == 0)
        process.host = buffer;
    return process;
}

bool HasEnded(std::int64_t number)
{
    return number > 0 && ::kill(pid_t(number), 0) == -1 && errno == ESRCH;
}

void IgnoreFileSizeSignal()
{
#ifdef SIGXFSZ
    // A handler, for what is ignored would be so in programs that this one starts.
    struct sigaction action = {};
    action.sa_handler = [](int) {};
    action.sa_flags = SA_RESTART;
    ::sigaction(SIGXFSZ, &action, nullptr);
#endif
}
