#include "files/process_copy.h"

#include "files/file_lock.h"

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <fcntl.h>
#include <new>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

constexpr unsigned LongestWork = 120; // seconds; on a disk that does not answer the copy gives up

Error Failed(int reason)
{
    const std::error_code code(reason, std::generic_category());
    return {.message = "The process could not be copied: " + code.message() + ".", .code = code};
}

/// The display, and whoever else talks to the program, must not take the copy for it when the program is gone.
void CloseConnections()
{
    const int most = int(std::min(::sysconf(_SC_OPEN_MAX), 4096L));
    for (int fd = STDERR_FILENO + 1; fd < most; ++fd) {
        struct stat status;
        if (::fstat(fd, &status) == 0 && S_ISSOCK(status.st_mode))
            ::close(fd);
    }
}

/// What the copy does; the answer travels as its exit code.
int Run(const std::function<std::error_code()>& work)
{
    for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGALRM, SIGPIPE})
        std::signal(signal, SIG_DFL);
    ::alarm(LongestWork);
    CloseConnections();
    FileLock::LeaveToOriginal();
    ::umask(0077);
    [[maybe_unused]] const int slower = ::nice(10); // the user comes first
    try {
        return work().value() & 0xff;
    } catch (const std::bad_alloc&) {
        return ENOMEM;
    } catch (...) {
        return EIO;
    }
}

} // namespace

Result<ProcessCopy> ProcessCopy::Start(const std::function<std::error_code()>& work)
{
    int ends[2];
    if (::pipe(ends) == -1)
        return Failed(errno);
    ::fcntl(ends[0], F_SETFD, FD_CLOEXEC);
    ::fcntl(ends[1], F_SETFD, FD_CLOEXEC);
    const pid_t process = ::fork();
    if (process == 0)
        ::_exit(Run(work)); // closes the writing end, whatever happens to the copy
    const int reason = errno;
    ::close(ends[1]);
    if (process == -1) {
        ::close(ends[0]);
        return Failed(reason);
    }
    ProcessCopy copy;
    copy.m_process = process;
    copy.m_ended = ends[0];
    return copy;
}

ProcessCopy::~ProcessCopy()
{
    Stop();
    Wait();
}

void ProcessCopy::Stop()
{
    if (m_process > 0)
        ::kill(pid_t(m_process), SIGKILL);
}

std::error_code ProcessCopy::Wait()
{
    if (m_process <= 0)
        return m_answer;
    int status = 0;
    pid_t ended = 0;
    do
        ended = ::waitpid(pid_t(m_process), &status, 0);
    while (ended == -1 && errno == EINTR);
    m_process = -1;
    ::close(m_ended);
    m_ended = -1;
    const bool answered = ended != -1 && WIFEXITED(status);
    m_answer = {answered ? WEXITSTATUS(status) : EINTR, std::generic_category()};
    return m_answer;
}
