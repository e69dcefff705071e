#include "cli/open_file.h"
#include "cli/terminal.h"

#include <algorithm>
#include <iostream>

namespace {

int CheckOne(const std::string& file)
{
    const Result<TqlStructure> structure = ParseFile(file);
    TellUnfinished(file);
    if (!structure)
        return ComplainUnread(structure.error());
    const DatedObjects undated{HDDateTime()};
    const auto findings = CheckHDStructure(structure.value().Get());
    PrintFindings(std::cout, file, findings);
    std::cout << Printable(file) << ": " << findings.size() << (findings.size() == 1 ? " finding\n" : " findings\n");
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
