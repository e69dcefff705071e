// Writing a file so that at every moment either its old or its new content is there whole.
#pragma once

#include "base/result.h"
#include "files/platform_file.h"

#include <string>
#include <string_view>

struct SafeFileOptions
{
    bool sync = true;                 // wait until the content is on the medium before the old file goes
    PlatformFile* platform = nullptr; // null for the system's own
};

/// Writes `text` to a temporary sibling, checks every step, and puts it in the place of `path` (UTF-8), which may exist
/// or not. An existing file's permissions, owner and attributes are kept, and nobody else may read the new content
/// before; a symbolic link stays one and its target is replaced. On failure the temporary file is gone, the target is
/// what it was, and the error names path and reason. Where a system has lost the target in replacing it, the temporary
/// file stays and the error names it.
Result<void> WriteFileSafely(const std::string& path, std::string_view text, const SafeFileOptions& options = {});

/// Renames a file within its folder: a symbolic link itself, over `to` if that exists. Everything else about it stays.
Result<void> RenameFile(const std::string& from, const std::string& to, PlatformFile* platform = nullptr);

/// The first of PATH.WHY-1, -2, ... that is free.
std::string FreeCopyName(const std::string& path, std::string_view why);
/// Keeps a copy of a file beside it under such a name, never over an existing one. Returns the copy's path.
Result<std::string> KeepOriginal(const std::string& path, std::string_view why, PlatformFile* platform = nullptr);

/// The content of a file, byte for byte.
Result<std::string> ReadWholeFile(const std::string& path);

/// Whether both paths name one existing file on the disk. Where a name is meant that a user gave, in whatever case, ask
/// the shell's library (KsSameFile).
bool SameFile(const std::string& a, const std::string& b);
