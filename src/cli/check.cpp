#include "cli/findings_text.h"
#include "cli/open_file.h"
#include "cli/terminal.h"

#include <algorithm>
#include <iostream>

namespace {

/// Exit::Fine, Exit::Findings, or another code after a message.
int CheckOne(const CRiver* river, CheckedFile& file)
{
    const Result<TqlStructure> structure = ParseFile(file.path);
    TellUnfinished(file.path);
    if (!structure) {
        file.error = structure.error().message;
        return ComplainUnread(structure.error());
    }
    const DatedObjects undated{HDDateTime()};
    file.check = CheckHDFile(structure.value().Get(), river, file.path);
    return file.check.Count() == 0 ? Exit::Fine : Exit::Findings;
}

void PrintText(const CheckedFile& file)
{
    if (!file.error.empty())
        return;
    PrintFindings(std::cout, file.path, file.check);
    const std::size_t count = file.check.Count();
    std::cout << Printable(file.path) << ": " << count << (count == 1 ? " finding\n" : " findings\n");
}

} // namespace

int Check(const std::vector<std::string>& files, const std::string& network, FindingsFormat format)
{
    std::optional<CRiver> river;
    if (!network.empty()) {
        auto loaded = LoadRiver(network);
        if (!loaded)
            return ComplainUnread(loaded.error());
        river = std::move(loaded.value());
    }
    int worst = Exit::Fine;
    std::vector<CheckedFile> checked;
    for (const std::string& path : files) {
        CheckedFile file{.path = path};
        worst = std::max(worst, CheckOne(river ? &*river : nullptr, file));
        if (format == FindingsFormat::Text)
            PrintText(file);
        else
            checked.push_back(std::move(file));
    }
    if (format == FindingsFormat::Json)
        PrintJson(std::cout, checked);
    else if (format == FindingsFormat::Sarif)
        PrintSarif(std::cout, checked);
    return worst;
}
