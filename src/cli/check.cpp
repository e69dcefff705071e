#include "cli/open_file.h"

#include <algorithm>
#include <iostream>

namespace {

int CheckOne(const std::string& file)
{
    const Result<TqlStructure> structure = ParseFile(file);
    if (!structure)
        return Complain(structure.error().message, Exit::Unreadable);
    const auto findings = CheckHDStructure(structure.value().Get());
    for (const Finding& finding : findings)
        PrintFinding(std::cout, file, finding);
    std::cout << file << ": " << findings.size() << (findings.size() == 1 ? " finding\n" : " findings\n");
    return findings.empty() ? Exit::Fine : Exit::Findings;
}

} // namespace

int Check(const std::vector<std::string>& files)
{
    int worst = Exit::Fine;
    for (const std::string& file : files)
        worst = std::max(worst, CheckOne(file));
    return worst;
}
