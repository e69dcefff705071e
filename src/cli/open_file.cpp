#include "cli/open_file.h"

#include <algorithm>
#include <iostream>

int Complain(std::string_view message, int code)
{
    std::cerr << "hdkv: " << message << '\n';
    return code;
}

void PrintFinding(std::ostream& stream, const std::string& path, const Finding& finding)
{
    stream << path << ':' << finding.line << ':' << finding.column << ": " << finding.text << '\n';
}

int OpenFile(const std::string& path, Purpose purpose, HD_Parameters& parameters)
{
    const Result<TqlStructure> structure = ParseFile(path);
    if (!structure)
        return Complain(structure.error().message, Exit::Unreadable);
    const tqlHandle handle = structure.value().Get();
    if (!tqlTargetByNameNum(handle, HDTargetName, 1))
        return Complain(path + " is no HD parameter file: it has no target [" + HDTargetName + "].", Exit::Unreadable);
    if (purpose == Purpose::Rewrite) {
        auto findings = CheckHDStructure(handle);
        std::erase_if(findings, [](const Finding& finding) { return !finding.losesContent; });
        for (const Finding& finding : findings)
            PrintFinding(std::cerr, path, finding);
        if (!findings.empty())
            return Complain("Nothing was written, because what is listed above would be lost.", Exit::Findings);
    }
    parameters.Load(handle);
    return Exit::Fine;
}

int Rewrite(const HD_Parameters& parameters, const std::string& path)
{
    const Result<void> saved = SaveHDFile(parameters, path, {.everySet = true});
    return saved ? Exit::Fine : Complain(saved.error().message, Exit::NotWritten);
}
