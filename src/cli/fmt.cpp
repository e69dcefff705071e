#include "cli/open_file.h"

int Fmt(const std::string& file, const Output& output, bool checkOnly)
{
    const std::string& target = output.Over(file);
    FileLock lock;
    if (const int failed = checkOnly ? Exit::Fine : LockFile(target, lock))
        return failed;
    HD_Parameters parameters;
    FileVersion version;
    if (const int failed = OpenFile(file, Purpose::Rewrite, parameters, &version))
        return failed;
    const Result<std::string> before = ReadWholeFile(file);
    if (!before)
        return Complain(before.error().message, Exit::Unreadable);
    const bool same = before.value() == HDFileText(parameters, true);
    if (checkOnly)
        return same ? Exit::Fine : Complain(file + " is not in canonical form.", Exit::Findings);
    if (same && output.path.empty())
        return Exit::Fine;
    return Rewrite(parameters, target, lock, output, output.path.empty() ? version : VersionThere(target));
}
