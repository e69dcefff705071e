// What is found in one file: what reading it met, and what the rules say about its content.
#pragma once

#include "rules/problem.h"
#include "rules/river.h"

#include <optional>

struct FileFinding
{
    RuleId rule{};
    std::size_t line = 1, column = 1; // in the file, from 1
    std::string section{}, keyword{}; // a keyword where the finding is about one; empty for a section
    std::size_t record = 0;           // of a list, from 1; 0 for what is in none
    std::string branch{};             // of the record
    std::optional<double> chainage{}; // metres
    std::string field{};              // as docs/hdkv.md calls it
    std::string text{};               // English, with the name of the section or keyword
    Remedy remedy = Remedy::None;
};
struct FileCheck
{
    std::vector<FileFinding> findings{};                                          // in the order of the file
    std::vector<std::size_t> counts = std::vector<std::size_t>(HDRules().size()); // by rule, with those not listed

    std::size_t Count() const;
};
/// What reading found.
FileCheck MakeFileCheck(const std::vector<Finding>& findings);
/// `river` may be null: then nothing is said about branches. `path`: of the file that the structure was read from.
FileCheck CheckHDFile(tqlHandle structure, const CRiver* river, const std::string& path);
