// Owner, mode, access lists and attributes of files, for platform_file_posix.cpp.
#pragma once

#include "files/platform_file.h"

std::error_code TakePermissionsOf(int file, const char* from, LostMetadata& lost);
std::error_code TakePermissionsOfNewFile(int file, const char* folder);
