#include "shell/library_trial.h"

#include "files/process_copy.h"

#include <QCoreApplication>
#include <QFile>
#include <exception>

#ifdef Q_OS_LINUX
#include <dlfcn.h>
#endif

namespace {

struct LibraryTrial
{
    Q_DECLARE_TR_FUNCTIONS(LibraryTrial)
};

#ifdef Q_OS_LINUX

constexpr std::chrono::seconds Patience{5};
constexpr std::errc Threw = std::errc::state_not_recoverable; // no library has such an answer of its own

/// In the copy: loads the library; what it throws is the answer.
ProcessCopy::Answer Load(const char* file)
{
    // The system's declaration says that it throws nothing; what it runs may.
    void* (*const volatile load)(const char*, int) = ::dlopen;
    try {
        load(file, RTLD_NOW | RTLD_LOCAL);
        return {};
    } catch (const std::exception& thrown) {
        return {std::make_error_code(Threw), thrown.what()};
    } catch (...) {
        return std::make_error_code(Threw);
    }
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
    Result<ProcessCopy> copy = ProcessCopy::Start([&] { return Load(name.constData()); }, ProcessCopy::Pace::Awaited);
    if (!copy)
        return {};
    const ProcessCopy::Answer& answer = copy->Wait(Patience);
    if (!answer.error)
        return {};
    if (answer.error == Threw)
        return ThrownText(answer.text.c_str());
    if (answer.error == std::errc::timed_out)
        return LibraryTrial::tr("its start did not end within %1 seconds").arg(Patience.count());
    return answer.text.empty() ? LibraryTrial::tr("it ended the program that tried it")
                               : LibraryTrial::tr("it ended the program that tried it (%1)")
                                     .arg(QString::fromLocal8Bit(answer.text.c_str()));
}

#else

QString TryLibrary(const QString&)
{
    return {};
}

#endif
