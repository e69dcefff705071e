#include "base/utf8_path.h"
#include "cli/open_file.h"

int New(const std::string& file)
{
    FileLock lock;
    if (const int failed = LockFile(file, lock))
        return failed;
    std::error_code unknown; // the writer finds out why
    if (std::filesystem::exists(std::filesystem::symlink_status(PathFromUtf8(file), unknown)))
        return Complain("\"" + file + "\" exists already; it was left as it is.", Exit::NotWritten);
    const HD_Parameters defaults;
    return Rewrite(defaults, file, lock, {}, VersionOfText({})); // nothing that came meanwhile is replaced
}
