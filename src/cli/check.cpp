#include "cli/open_file.h"
#include "cli/terminal.h"

#include <algorithm>
#include <iostream>
#include <map>

namespace {

/// What stands on the screen of findings of one kind; a file may have a finding in every line.
struct Listed
{
    static constexpr std::size_t Most = 1000;
    std::size_t count = 0;
    const Finding* last = nullptr; // that was printed
};

void PrintFindings(const std::string& file, const std::vector<Finding>& findings)
{
    std::map<Finding::Kind, Listed> kinds;
    for (const Finding& finding : findings) {
        Listed& kind = kinds[finding.kind];
        if (++kind.count > Listed::Most)
            continue;
        PrintFinding(std::cout, file, finding);
        kind.last = &finding;
    }
    for (const auto& [kind, listed] : kinds) {
        if (listed.count <= Listed::Most)
            continue;
        const std::size_t more = listed.count - Listed::Most;
        std::cout << Printable(file) << ": " << more << " more like the one in line " << listed.last->line
                  << ", column " << listed.last->column << '\n';
    }
    std::cout << Printable(file) << ": " << findings.size() << (findings.size() == 1 ? " finding\n" : " findings\n");
}

int CheckOne(const std::string& file)
{
    const Result<TqlStructure> structure = ParseFile(file);
    if (!structure)
        return ComplainUnread(structure.error());
    const UndatedObjects undated;
    const auto findings = CheckHDStructure(structure.value().Get());
    PrintFindings(file, findings);
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
