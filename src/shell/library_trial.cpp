#include "shell/library_trial.h"

#include <QCoreApplication>
#include <QFile>
#include <algorithm>
#include <exception>

#ifdef Q_OS_LINUX
#include <cerrno>
#include <cstring>
#include <dlfcn.h>
#include <fcntl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>
#endif

namespace {

struct LibraryTrial
{
    Q_DECLARE_TR_FUNCTIONS(LibraryTrial)
};

#ifdef Q_OS_LINUX

/// In the copy: loads the library and ends, with 1 when it threw; `report` takes what.
[[noreturn]] void TryHere(const char* file, int report)
{
    constexpr unsigned patience = 10; // seconds
    ::alarm(patience);
    const rlimit none{};
    ::setrlimit(RLIMIT_CORE, &none);
    // The system's declaration says that it throws nothing; what it runs may.
    void* (*const volatile load)(const char*, int) = ::dlopen;
    try {
        load(file, RTLD_NOW | RTLD_LOCAL);
    } catch (const std::exception& thrown) {
        const ssize_t written = ::write(report, thrown.what(), std::strlen(thrown.what()));
        ::_exit(written < 0 ? 2 : 1);
    } catch (...) {
        ::_exit(1);
    }
    ::_exit(0);
}

QByteArray ReadToEnd(int file)
{
    QByteArray text;
    char buffer[256];
    for (ssize_t size = 1; size != 0;) {
        size = ::read(file, buffer, sizeof buffer);
        if (size < 0 && errno != EINTR)
            break;
        text.append(buffer, std::max<ssize_t>(size, 0));
    }
    return text;
}

#endif

} // namespace

QString ThrownText(const char* what)
{
    return what && *what ? LibraryTrial::tr("it failed with the error \"%1\"").arg(QString::fromLocal8Bit(what))
                         : LibraryTrial::tr("it failed with an error that it does not name");
}

#ifdef Q_OS_LINUX

QString TryLibrary(const QString& file)
{
    const QByteArray name = QFile::encodeName(file);
    int ends[2];
    if (::pipe2(ends, O_CLOEXEC) != 0)
        return {};
    const pid_t copy = ::fork();
    if (copy == 0)
        TryHere(name.constData(), ends[1]);
    ::close(ends[1]);
    const QByteArray thrown = copy > 0 ? ReadToEnd(ends[0]) : QByteArray();
    ::close(ends[0]);
    int status = 0;
    while (copy > 0 && ::waitpid(copy, &status, 0) < 0 && errno == EINTR) {
    }
    if (WIFSIGNALED(status))
        return LibraryTrial::tr("it ended the program that tried it (%1)")
            .arg(QString::fromLocal8Bit(::strsignal(WTERMSIG(status))));
    return WEXITSTATUS(status) ? ThrownText(thrown.constData()) : QString();
}

#else

QString TryLibrary(const QString&)
{
    return {};
}

#endif
