#include "files/platform_file.h"

std::error_code PlatformFile::ReadLink(const Path& path, Path& target)
{
    std::error_code error;
    target = std::filesystem::read_symlink(path, error);
    return error;
}
