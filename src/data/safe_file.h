// Writing a file so that at every moment either its old or its new content is there whole.
#pragma once

#include "data/platform_file.h"
#include "data/result.h"

#include <string>
#include <string_view>

struct SafeFileOptions
{
    bool sync = true;                 // wait until the content is on the medium before the old file goes
    PlatformFile* platform = nullptr; // null for the system's own
};

/// Writes `text` to a temporary sibling, checks every step, and puts it in the place of `path` (UTF-8), which may exist
/// or not. An existing file's permissions are kept; a symbolic link stays one and its target is replaced. On failure
/// the temporary file is gone, the target is what it was, and the error names path and reason.
Result<void> WriteFileSafely(const std::string& path, std::string_view text, const SafeFileOptions& options = {});

/// Keeps a copy of a file beside it as NAME.unreadable-1, -2, ..., never over an existing one. Returns the copy's path.
Result<std::string> KeepUnreadable(const std::string& path, PlatformFile* platform = nullptr);

/// The content of a file, byte for byte.
Result<std::string> ReadWholeFile(const std::string& path);

/// Whether both paths name one existing file.
bool SameFile(const std::string& a, const std::string& b);
