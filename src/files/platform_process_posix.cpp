#include "files/platform_process.h"

#include <cerrno>
#include <csignal>
#include <cstdio>
#include <fstream>
#include <pwd.h>
#include <sstream>
#include <sys/stat.h>
#include <unistd.h>
#ifdef __linux__
#include <sys/sysmacros.h>
#endif

static std::string UserName(uid_t user)
{
    char buffer[4096];
    passwd entry{}, *found = nullptr;
    const bool isKnown = ::getpwuid_r(user, &entry, buffer, sizeof buffer, &found) == 0 && found;
    return isKnown ? found->pw_name : std::to_string(user);
}

ProcessName ThisProcess()
{
    ProcessName process{.user = UserName(::geteuid()), .number = ::getpid()};
    char host[256] = {};
    if (::gethostname(host, sizeof host - 1) == 0)
        process.host = host;
    return process;
}

ProcessName ProcessLocking(std::uint64_t device, std::uint64_t inode)
{
#ifdef __linux__
    char place[64];
    std::snprintf(place, sizeof place, "%02x:%02x:%llu", major(device), minor(device),
                  static_cast<unsigned long long>(inode));
    std::ifstream locks("/proc/locks"); // "1: FLOCK  ADVISORY  WRITE 4711 fe:00:10954157 0 EOF"
    for (std::string line; std::getline(locks, line);) {
        std::istringstream words(line);
        std::string id, kind, manner, access, number, where;
        words >> id >> kind >> manner >> access >> number >> where;
        struct stat status;
        const std::string folder = "/proc/" + number;
        if (kind != "FLOCK" || where != place || ::stat(folder.c_str(), &status) == -1)
            continue;
        ProcessName process{.user = UserName(status.st_uid), .host = ThisProcess().host};
        std::istringstream(number) >> process.number;
        std::ifstream name(folder + "/comm");
        std::getline(name, process.program);
        return process;
    }
#else
    (void)device, (void)inode;
#endif
    return {};
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

char** SpeakUtf8(int&, char** argv)
{
    return argv; // it is what the user's terminal and file names are in
}
