// What was found in files, for people, for scripts and for the tools that show findings in sources.
#pragma once

#include "rules/file_check.h"

#include <ostream>
#include <string>
#include <vector>

/// Prints "file:line:column: severity code: text" of each; of a rule how many more there are than those that are
/// listed.
void PrintFindings(std::ostream& stream, const std::string& path, const FileCheck& check);

struct CheckedFile
{
    std::string path{};
    FileCheck check{};
    std::string error{}; // why it could not be read; then nothing was checked
};
/// One object: see docs/hdkv.md.
void PrintJson(std::ostream& stream, const std::vector<CheckedFile>& files);
/// A log in the Static Analysis Results Interchange Format, version 2.1.0.
void PrintSarif(std::ostream& stream, const std::vector<CheckedFile>& files);
