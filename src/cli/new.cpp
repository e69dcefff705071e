#include "base/utf8_path.h"
#include "cli/open_file.h"

int New(const std::string& file)
{
    FileLock lock;
    if (const int failed = LockFile(file, lock))
        return failed;
    std::error_code error;
    if (std::filesystem::exists(std::filesystem::symlink_status(PathFromUtf8(file), error)))
        return Complain("\"" + file + "\" exists already; it was left as it is.", Exit::NotWritten);
    const HD_Parameters defaults;
    return Rewrite(defaults, file, lock);
}
