// What the tests of the data room share: parameters from text, and objects whose every field differs from another's.
#pragma once

#include "data/hd_file.h"
#include "files/field_io.h"
#include "recorded_text.h"
#include "test_folder.h"

#include <filesystem>
#include <fstream>
#include <gtest/gtest.h>
#include <limits>

inline TqlStructure Parsed(const std::string& text)
{
    TqlStructure structure(tqlLoadText(text, "test.hdkv"));
    TqlSyntaxError error;
    if (tqlGetSyntaxErr(structure.Get(), &error))
        ADD_FAILURE() << error.message;
    return structure;
}

/// Reads the content of a target "KAVO0_HD".
inline HD_Parameters FromTarget(const std::string& content)
{
    HD_Parameters parameters;
    parameters.Load(Parsed("[KAVO0_HD]\n" + content + "\n[/KAVO0_HD]\n").Get());
    return parameters;
}

/// Reads lines of one sub-section of the global values.
inline HD_Parameters FromSection(const std::string& name, const std::string& lines)
{
    return FromTarget("[Global_Variables]\n[" + name + "]\n" + lines + "\n[/" + name + "]\n[/Global_Variables]");
}

/// Gives every field, and in groups every element, another value. `seed` makes results differ.
inline void Disturb(FieldList fields, void* object, int& seed)
{
    // What swallows the seed comes rarely: no two records next to each other have it in the same field.
    constexpr double infinity = std::numeric_limits<double>::infinity();
    constexpr double numbers[] = {0.1 + 0.2, -0.0, 5e-324, 1e10 - 1e-6, -1e-7};
    for (const Field& field : fields) {
        ++seed;
        Visit(field, object,
              Overloads{[&](double& value) {
                            value = seed % 97 == 0   ? infinity
                                    : seed % 89 == 0 ? std::numeric_limits<double>::max()
                                    : value == 0     ? -1.0 / seed
                                                     : value + numbers[std::size_t(seed) % std::size(numbers)] + seed;
                        },
                        [&](std::int32_t& value) { value += 100 + seed; }, [](bool& value) { value = !value; },
                        [&](std::string& value) { value += "\"<M\xC3\x9CHLE>\\\n\t" + std::to_string(seed); },
                        [&](HDDateTime& value) { value = {1900 + seed, 13, -1, 25, 61, seed}; }, // kept, though no date
                        [&](GroupValue<void> group) {
                            group.Renew(2 + std::size_t(seed % 3));
                            for (std::size_t i = 0; i < group.size(); ++i)
                                Disturb(group.Elements(), group[i], seed);
                        }});
    }
}

/// Calls `visit(name, fields)` for every keyword and item list of the global values.
template <typename Visit>
void ForEachGlobal(Visit visit)
{
    for (const DeclaredSection& section : HDGlobals().Sections()) {
        for (const DeclaredKeyword& row : section.keywords)
            visit(std::string(section.name) + "/" + std::string(row.name), row.Fields());
        for (const DeclaredSection& items : section.Sections())
            visit(std::string(section.name) + "/" + std::string(items.name), items.keywords.front().Fields());
    }
}

/// Calls `visit(name, list of a, list of b)` for every list, each set of the encroachment lists included.
template <typename Visit>
void ForEachList(HD_Parameters& a, HD_Parameters& b, Visit visit)
{
    for (const ListEntry& entry : HDLists())
        for (std::size_t i = 0; i < std::min(entry.list(a).ListCount(), entry.list(b).ListCount()); ++i)
            visit(entry.list(a).ListAt(i).SectionName().c_str(), entry.list(a).ListAt(i), entry.list(b).ListAt(i));
}

class FolderTest : public testing::Test
{
protected:
    std::string Path(const char* name) const { return (m_folder / name).string(); }
    void Write(const char* name, std::string_view text) const
    {
        std::ofstream(m_folder / name, std::ios::binary) << text;
    }
    std::string Text(const char* name) const { return ReadText(m_folder / name); }
    std::size_t FileCount() const
    {
        return std::size_t(std::distance(std::filesystem::directory_iterator(m_folder), {}));
    }

private:
    const TestFolder m_owner;

protected:
    const std::filesystem::path m_folder = m_owner.Path();
};
