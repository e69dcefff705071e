#include "cli/open_file.h"

#include "cli/findings_text.h"
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

void TellUnfinished(const std::string& path)
{
    for (const std::string& whole : UnfinishedSaves(path))
        Complain("A save of \"" + path +
                     "\" was cut off while the file was written over: it may be half old and half " +
                     "new. The whole new content is in \"" + whole + "\".",
                 Exit::Fine);
}

int OpenFile(const std::string& path, Purpose purpose, HD_Parameters& parameters, FileVersion* version)
{
    const Result<TqlStructure> structure = ParseFile(path, nullptr, version);
    TellUnfinished(path);
    if (!structure)
        return ComplainUnread(structure.error());
    const tqlHandle handle = structure.value().Get();
    if (!tqlTargetByNameNum(handle, HDTargetName, 1))
        return Complain(path + " is no HD parameter file: it has no target [" + HDTargetName + "].", Exit::Unreadable);
    LoadReport report(handle);
    const DatedObjects undated{HDDateTime()};
    parameters = HD_Parameters();
    parameters.Load(handle, &report);
    if (purpose == Purpose::Read)
        return Exit::Fine;
    const auto findings = report.Take();
    PrintFindings(std::cerr, path, MakeFileCheck(findings));
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

std::optional<FileVersion> VersionThere(const std::string& path)
{
    const Result<std::string> text = ReadWholeFile(path);
    return text ? std::optional(VersionOfText(text.value())) : std::nullopt;
}

namespace {

WriteAnswer Answer(const WriteQuestion& question, const Output& allowed)
{
    switch (question.kind) {
    case WriteQuestion::ChangedOutside:
        break;
    case WriteQuestion::HardLinks:
        return allowed.hardLinks == HardLinks::Keep    ? WriteAnswer::Yes
               : allowed.hardLinks == HardLinks::Split ? WriteAnswer::No
                                                       : WriteAnswer::Cancel;
    case WriteQuestion::LosesMetadata:
        return allowed.loseMetadata ? WriteAnswer::Yes : WriteAnswer::Cancel;
    }
    return WriteAnswer::Cancel;
}

/// Why the file was not written, and what lets it be.
std::string RefusalText(const WriteQuestion& question)
{
    const std::string left = "\"" + question.path + "\" was left as it is: ";
    switch (question.kind) {
    case WriteQuestion::ChangedOutside:
        return NotWritten(question.path, std::make_error_code(ChangedOutside)).message;
    case WriteQuestion::HardLinks:
        return left + "it is one of " + std::to_string(question.names) + " names of the same file (hard links). " +
               Option::HardLinks + " keep gives all of them the new content, " + Option::HardLinks +
               " split this one alone.";
    case WriteQuestion::LosesMetadata:
        return left + "this would not be kept of it as it was before: " + LostText(question.lost) + ". " +
               Option::LoseMetadata + " writes it all the same.";
    }
    return {};
}

} // namespace

int Rewrite(const HD_Parameters& parameters, const std::string& path, const FileLock& lock, const Output& allowed,
            const std::optional<FileVersion>& expected)
{
    if (lock.WhyNone() && lock.Path().empty()) // it would be written without knowing what a link leads to
        return Complain(NotWritten(path, lock.WhyNone()).message, Exit::NotWritten);
    std::optional<WriteQuestion> refused;
    const auto ask = [&](const WriteQuestion& question) {
        const WriteAnswer answer = Answer(question, allowed);
        if (answer == WriteAnswer::Cancel)
            refused = question;
        return answer;
    };
    const auto saved = SaveHDFile(
        parameters, path, {.everySet = true, .file = {.expected = expected, .isLocked = lock.IsHeld(), .ask = ask}});
    if (!saved)
        return Complain(refused ? RefusalText(*refused) : saved.error().message, Exit::NotWritten);
    const std::string name = "\"" + path + "\" ";
    const WriteReport& report = saved.value();
    if (lock.WhyNone())
        Complain(name + "was written without a lock: \"" + lock.Path() +
                     "\" cannot be one: " + lock.WhyNone().message() + ".",
                 Exit::Fine);
    if (report.unconfirmed)
        Complain(name + "is saved, but the disk has not confirmed it: " + report.unconfirmed.message() + ".",
                 Exit::Fine);
    if (report.lost.Any())
        Complain(name + "is saved; not kept of it as it was before: " + LostText(report.lost) + ".", Exit::Fine);
    for (const std::string& left : report.leftBehind)
        Complain("A save of \"" + path + "\" was cut off; what another program may have written to it just before is " +
                     "kept in \"" + left + "\".",
                 Exit::Fine);
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
