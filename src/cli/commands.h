// The commands of hdkv. Each prints its data on standard output and its messages on standard error, and returns the
// exit code.
#pragma once

#include <string>
#include <vector>

namespace Exit {
inline constexpr int Fine = 0;
inline constexpr int Findings = 1; // or: the file would change
inline constexpr int Usage = 2;
inline constexpr int Unreadable = 3;
inline constexpr int NotWritten = 4;
inline constexpr int NoMemory = 5;
} // namespace Exit

enum class Format
{
    Table,
    Csv,
    Json
};

int Check(const std::vector<std::string>& files);
/// An overview of the file, or the records of one list.
int Show(const std::string& file, const std::string& list, Format format);
int Get(const std::string& file, const std::string& keyword);
/// Writes to `out`, or over the file when that is empty.
int Set(const std::string& file, const std::string& keyword, const std::vector<std::string>& values,
        const std::string& out);
int Fmt(const std::string& file, const std::string& out, bool checkOnly);
int New(const std::string& file);
