// Every file that was ever worth keeping, good, bad or found by a fuzzer, through the checks that hold for all.
#include "files/structure.h"
#include "properties.h"

#include <filesystem>
#include <fstream>
#include <gtest/gtest.h>
#include <iterator>

namespace {

namespace fs = std::filesystem;

std::vector<fs::path> FilesUnder(const fs::path& folder)
{
    std::vector<fs::path> files;
    for (const auto& entry : fs::recursive_directory_iterator(folder))
        if (entry.is_regular_file())
            files.push_back(entry.path());
    return files;
}

std::string Content(const fs::path& path)
{
    std::ifstream in(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), {}};
}

const fs::path Root(KVR_SOURCE_DIR);

const struct
{
    const char* folder; // of what was kept for it
    std::string (*check)(const std::string& text);
} checks[] = {{"tql", CheckTql},
              {"hd", CheckHDFile},
              {"network", CheckNetworkFile},
              {"sections", CheckSectionFile},
              {"project", CheckProjectFile},
              {"recovery", CheckRecovery},
              {"table", CheckTable}};

TEST(Corpus, EveryFileKeepsTheProperties)
{
    for (const char* folder : {"tests/corpus", "fuzz/corpus"}) {
        const auto files = FilesUnder(Root / folder);
        EXPECT_FALSE(files.empty()) << folder;
        for (const auto& file : files)
            for (const auto& each : checks)
                EXPECT_EQ(each.check(Content(file)), "") << each.folder << ": " << file;
    }
}

TEST(Corpus, GoodFilesLoadAndBadOnesDoNot)
{
    for (const auto& file : FilesUnder(Root / "tests/corpus/tql")) {
        const auto structure = ParseFile(file.string());
        EXPECT_EQ(bool(structure), file.parent_path().filename() == "good")
            << file << ": " << (structure ? "" : structure.error().message);
    }
}

// Every file cut off at every byte.
TEST(Corpus, TruncatedFilesKeepTheProperties)
{
    for (const auto& each : checks) {
        for (const auto& file : FilesUnder(Root / "fuzz/corpus" / each.folder)) {
            const std::string text = Content(file);
            for (std::size_t length = 0; length < std::min<std::size_t>(text.size(), 1000); ++length)
                ASSERT_EQ(each.check(text.substr(0, length)), "") << file << " cut to " << length;
        }
    }
}

} // namespace
