// Texts that files of the sources record, and the tables in documents that are made from declarations.
#pragma once

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <gtest/gtest.h>
#include <iterator>
#include <string>

inline std::string ReadText(const std::filesystem::path& path)
{
    std::ifstream stream(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(stream), {}};
}

/// Whether a text is the one that a file of the sources records.
inline void ExpectRecorded(const std::string& text, const std::filesystem::path& record)
{
    if (std::getenv("KVR_UPDATE_RECORDS"))
        std::ofstream(record, std::ios::binary) << text;
    else
        EXPECT_EQ(ReadText(record), text) << "if it is meant: ninja update_records, and look at what has changed";
}

/// The document with the text between two of its marks replaced.
inline std::string WithTable(std::string document, const std::string& name, const std::string& table)
{
    const std::string begin = "<!-- generated: " + name + " -->\n", end = "<!-- end of " + name + " -->\n";
    const std::size_t from = document.find(begin), to = document.find(end);
    if (from == std::string::npos || to == std::string::npos) {
        ADD_FAILURE() << "no marks of " << name;
        return document;
    }
    return document.replace(from + begin.size(), to - from - begin.size(), table);
}
