#include "files/process_copy.h"

#include "files/file_lock.h"

#include <algorithm>
#include <cerrno>
#include <climits>
#include <csignal>
#include <cstring>
#include <exception>
#include <fcntl.h>
#include <new>
#include <poll.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/syscall.h>
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

bool isCopy = false;

/// What the copy does.
ProcessCopy::Answer Run(const std::function<ProcessCopy::Answer()>& work, ProcessCopy::Pace pace)
{
    isCopy = true;
    for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGALRM, SIGPIPE})
        std::signal(signal, SIG_DFL);
    ::alarm(LongestWork);
    CloseConnections();
    FileLock::LeaveToOriginal();
    ::umask(0077);
    const rlimit none{};
    ::setrlimit(RLIMIT_CORE, &none); // of the program's memory only the program leaves an image
    [[maybe_unused]] const int slower = pace == ProcessCopy::Pace::Aside ? ::nice(10) : 0;
    try {
        return work();
    } catch (const std::bad_alloc&) {
        return std::make_error_code(std::errc::not_enough_memory);
    } catch (...) {
        return std::make_error_code(std::errc::io_error);
    }
}

/// Giving back what a large program has in memory takes the system tens of milliseconds after the answer has come. The
/// descriptor can be read when that is over; -1 where the system has none of this kind.
int EndOf([[maybe_unused]] pid_t process)
{
#ifdef SYS_pidfd_open
    return int(::syscall(SYS_pidfd_open, process, 0));
#else
    return -1;
#endif
}

/// The answer as it travels, in one piece that a pipe takes at once and that is there whole or not at all. A copy that
/// ends without it has not done its work, whatever its exit code is.
struct Letter
{
    int error = 0;
    unsigned length = 0;
    char text[PIPE_BUF - 2 * sizeof(int)]{};
};

void Send(int pipe, const ProcessCopy::Answer& answer)
{
    Letter letter{.error = answer.error.value(), .length = unsigned(std::min(answer.text.size(), sizeof letter.text))};
    answer.text.copy(letter.text, letter.length);
    [[maybe_unused]] const ssize_t sent = ::write(pipe, &letter, sizeof letter);
}

ProcessCopy::Answer Receive(int pipe, int status)
{
    Letter letter;
    if (::read(pipe, &letter, sizeof letter) == ssize_t(sizeof letter) && letter.length <= sizeof letter.text)
        return {{letter.error, std::generic_category()}, {letter.text, letter.length}};
    return {std::make_error_code(std::errc::interrupted), WIFSIGNALED(status) ? ::strsignal(WTERMSIG(status)) : ""};
}

} // namespace

Result<ProcessCopy> ProcessCopy::Start(const std::function<Answer()>& work, Pace pace)
{
    int ends[2];
    if (::pipe(ends) == -1)
        return Failed(errno);
    ::fcntl(ends[0], F_SETFD, FD_CLOEXEC);
    ::fcntl(ends[1], F_SETFD, FD_CLOEXEC);
    ::fcntl(ends[0], F_SETFL, O_NONBLOCK); // what the copy has started in its turn may keep the other end open
    const pid_t process = ::fork();
    if (process == 0) {
        ::close(ends[0]);
        Send(ends[1], Run(work, pace));
        ::_exit(0); // closes the writing end, as whatever else happens to the copy does
    }
    const int reason = errno;
    ::close(ends[1]);
    if (process == -1) {
        ::close(ends[0]);
        return Failed(reason);
    }
    ProcessCopy copy;
    copy.m_process = process;
    copy.m_letter = ends[0];
    const int end = EndOf(process);
    copy.m_ended = end == -1 ? copy.m_letter : end;
    return copy;
}

bool ProcessCopy::IsThis()
{
    return isCopy;
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

const ProcessCopy::Answer& ProcessCopy::Wait()
{
    if (m_process <= 0)
        return m_answer;
    int status = 0;
    while (::waitpid(pid_t(m_process), &status, 0) == -1 && errno == EINTR) {
    }
    m_process = -1;
    m_answer = Receive(m_letter, status);
    if (m_ended != m_letter)
        ::close(m_ended);
    ::close(m_letter);
    m_letter = m_ended = -1;
    return m_answer;
}

const ProcessCopy::Answer& ProcessCopy::Wait(std::chrono::milliseconds longest)
{
    using Clock = std::chrono::steady_clock;
    pollfd end{.fd = m_ended, .events = POLLIN, .revents = 0};
    int ready = 0;
    for (const auto last = Clock::now() + longest; m_process > 0 && ready <= 0 && Clock::now() < last;) {
        const auto left = std::chrono::ceil<std::chrono::milliseconds>(last - Clock::now());
        ready = ::poll(&end, 1, int(std::max<std::int64_t>(left.count(), 0)));
    }
    const bool isLate = m_process > 0 && ready <= 0;
    if (isLate)
        Stop();
    Wait();
    if (isLate && m_answer.error == std::errc::interrupted)
        m_answer = std::make_error_code(std::errc::timed_out);
    return m_answer;
}
