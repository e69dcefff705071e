#include "cli/open_file.h"

#include "cli/terminal.h"

#include <algorithm>
#include <iostream>

int Complain(std::string_view message, int code)
{
    std::cerr << "hdkv: " << Printable(message) << '\n';
    return code;
}

int ComplainNoMemory()
{
    std::cerr << "hdkv: There is not enough memory.\n";
    return Exit::NoMemory;
}

int ComplainUnread(const Error& error)
{
    return Complain(error.message, error.code == std::errc::not_enough_memory ? Exit::NoMemory : Exit::Unreadable);
}

void PrintFinding(std::ostream& stream, const std::string& path, const Finding& finding)
{
    stream << Printable(path) << ':' << finding.line << ':' << finding.column << ": " << Printable(FindingText(finding))
           << '\n';
}

int OpenFile(const std::string& path, Purpose purpose, HD_Parameters& parameters, FileVersion* version)
{
    const Result<TqlStructure> structure = ParseFile(path, nullptr, version);
    if (!structure)
        return ComplainUnread(structure.error());
    const tqlHandle handle = structure.value().Get();
    if (!tqlTargetByNameNum(handle, HDTargetName, 1))
        return Complain(path + " is no HD parameter file: it has no target [" + HDTargetName + "].", Exit::Unreadable);
    LoadReport report(handle);
    const UndatedObjects undated;
    parameters = HD_Parameters();
    parameters.Load(handle, &report);
    if (purpose == Purpose::Read)
        return Exit::Fine;
    const auto findings = report.Take();
    for (const Finding& finding : findings)
        PrintFinding(std::cerr, path, finding);
    if (std::ranges::any_of(findings, &Finding::LosesContent))
        return Complain("Nothing was written, because something of what is listed above would be lost.",
                        Exit::Findings);
    return Exit::Fine;
}

int LockFile(const std::string& path, FileLock& lock)
{
    constexpr std::chrono::seconds longest(5);
    lock = FileLock::WaitFor(path, "hdkv", longest);
    if (!lock.HeldBy())
        return Exit::Fine;
    return Complain("\"" + path + "\" was left as it is: it is in use by " + HolderText(*lock.HeldBy()) + ".",
                    Exit::NotWritten);
}

int Rewrite(const HD_Parameters& parameters, const std::string& path, const FileLock& lock,
            const std::optional<FileVersion>& expected)
{
    const auto saved = SaveHDFile(parameters, path, {.everySet = true, .file = {.expected = expected}});
    if (!saved)
        return Complain(saved.error().message, Exit::NotWritten);
    const std::string name = "\"" + path + "\" ";
    const WriteReport& report = saved.value();
    if (lock.WhyNone())
        Complain(name + "was written without a lock, which its folder does not take: " + lock.WhyNone().message() + ".",
                 Exit::Fine);
    if (report.unconfirmed)
        Complain(name + "is saved, but the disk has not confirmed it: " + report.unconfirmed.message() + ".",
                 Exit::Fine);
    if (report.lost.Any())
        Complain(name + "is saved; not kept of it as it was before: " + LostText(report.lost) + ".", Exit::Fine);
    if (!report.displaced.empty() && report.unknown)
        Complain(name + "is saved; what it held just before is kept in \"" + report.displaced +
                     "\", for whether another program had written that could not be seen: " + report.unknown.message() +
                     ".",
                 Exit::Fine);
    else if (!report.displaced.empty())
        Complain(name + "is saved; what another program had written meanwhile is kept in \"" + report.displaced + "\".",
                 Exit::Fine);
    return Exit::Fine;
}
