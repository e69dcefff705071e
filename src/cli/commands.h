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

/// What is to become of the other names of a file that has several (hard links).
enum class HardLinks
{
    Refuse, // the file is not written
    Keep,   // all names get the new content
    Split   // only the one that the command was given
};

/// Where a command writes to, and what it may do there. A script cannot be asked, so it says so beforehand.
struct Output
{
    std::string path; // empty: over the file that was read
    HardLinks hardLinks = HardLinks::Refuse;
    bool loseMetadata = false; // owner, group, mode and the like may be others afterwards

    const std::string& Over(const std::string& file) const { return path.empty() ? file : path; }
};
namespace Option { // that allow what is refused without them
inline constexpr const char* HardLinks = "--hard-links";
inline constexpr const char* LoseMetadata = "--lose-metadata";
} // namespace Option

enum class FindingsFormat
{
    Text,
    Json,
    Sarif
};
/// `network`: the file of the river network that the files have to fit; empty for none.
int Check(const std::vector<std::string>& files, const std::string& network, FindingsFormat format);
/// An overview of the file, or the records of one list.
int Show(const std::string& file, const std::string& list, Format format);
int Get(const std::string& file, const std::string& keyword);
int Set(const std::string& file, const std::string& keyword, const std::vector<std::string>& values,
        const Output& output);
int Fmt(const std::string& file, const Output& output, bool checkOnly);
int New(const std::string& file);
