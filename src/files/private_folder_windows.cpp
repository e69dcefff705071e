#include "files/private_folder.h"

#include "base/utf8_path.h"

#include <cerrno>

namespace {

Error Refused(const std::string& path, std::error_code code, bool reading = false)
{
    return {.message = "Could not use \"" + path + "\": " + code.message() + ".",
            .code = code,
            .path = path,
            .reading = reading};
}

} // namespace

// The user's local application data are nobody else's already.
Result<void> MakePrivateFolder(const std::string& path)
{
    std::error_code error;
    std::filesystem::create_directories(PathFromUtf8(path), error);
    return error ? Refused(path, error) : Result<void>();
}

Result<PrivateFile> OpenPrivateFile(const std::string& path)
{
    std::error_code error;
    const std::filesystem::path file = PathFromUtf8(path);
    if (!std::filesystem::is_regular_file(std::filesystem::symlink_status(file, error)))
        return Refused(path, error ? error : std::make_error_code(std::errc::invalid_argument), true);
    PrivateFile opened;
    opened.size = std::filesystem::file_size(file, error);
    opened.stream.reset(::_wfopen(file.c_str(), L"rb"));
    if (error || !opened.stream)
        return Refused(path, error ? error : std::error_code(errno, std::generic_category()), true);
    return opened;
}
