#include "cli/open_file.h"

int Fmt(const std::string& file, const std::string& out, bool checkOnly)
{
    HD_Parameters parameters;
    if (const int failed = OpenFile(file, Purpose::Rewrite, parameters))
        return failed;
    const Result<std::string> before = ReadWholeFile(file);
    if (!before)
        return Complain(before.error().message, Exit::Unreadable);
    const bool same = before.value() == HDFileText(parameters, true);
    if (checkOnly)
        return same ? Exit::Fine : Complain(file + " is not in canonical form.", Exit::Findings);
    if (same && out.empty())
        return Exit::Fine;
    return Rewrite(parameters, out.empty() ? file : out);
}
