// The yardstick: a reader and a writer of nothing but the lines of initial conditions, as one writes them for one
// purpose, without checks, messages or other sections.
#pragma once

#include <string>
#include <vector>

struct PlainRecord
{
    std::string name;
    double chainage = 0, h = 0, q = 0;
    friend bool operator==(const PlainRecord&, const PlainRecord&) = default;
};

/// The whole file in memory.
std::string ReadText(const std::string& path);

/// Reads the file, splits its lines and converts every DATA line of section "InitList"; keywords before it (the global
/// values) are split into name and text.
struct PlainFile
{
    std::vector<std::pair<std::string, std::string>> globals;
    std::vector<PlainRecord> records;
};
PlainFile HandCodedRead(const std::string& path);

/// Writes the same file back.
void HandCodedWrite(const PlainFile& file, const std::string& path);
