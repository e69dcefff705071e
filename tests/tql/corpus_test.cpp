// Every file that was ever worth keeping, good, bad or found by the fuzzer, through the properties that hold for all.
#include "../../fuzz/tql_properties.h"
#include "tql/tql_support.h"

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

TEST(Corpus, EveryFileKeepsTheProperties)
{
    for (const char* folder : {"tests/corpus", "fuzz/corpus"}) {
        const auto files = FilesUnder(Root / folder);
        EXPECT_FALSE(files.empty()) << folder;
        for (const auto& file : files)
            EXPECT_EQ(CheckTextProperties(Content(file)), "") << file;
    }
}

TEST(Corpus, GoodFilesLoadAndBadOnesDoNot)
{
    for (const auto& file : FilesUnder(Root / "tests/corpus/tql")) {
        const Structure structure(tqlLoadFile(file.string()));
        TqlSyntaxError error;
        tqlGetSyntaxErr(structure, &error);
        EXPECT_EQ(error.message.empty(), file.parent_path().filename() == "good") << file << ": " << error.message;
    }
}

// Every file cut off at every byte: an error or a document, and the properties hold for both.
TEST(Corpus, TruncatedFilesKeepTheProperties)
{
    for (const auto& file : FilesUnder(Root / "tests/corpus/tql/good")) {
        const std::string text = Content(file);
        for (std::size_t length = 0; length < std::min<std::size_t>(text.size(), 2000); ++length)
            ASSERT_EQ(CheckTextProperties(text.substr(0, length)), "") << file << " cut to " << length;
    }
}

} // namespace
