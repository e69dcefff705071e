#include "test_folder.h"
#include "tql/tql_support.h"

#include <filesystem>
#include <fstream>
#include <gtest/gtest.h>

namespace {

namespace fs = std::filesystem;

TqlSyntaxError LoadError(const std::string& path)
{
    const Structure structure(tqlLoadFile(path));
    TqlSyntaxError error;
    const bool failed = tqlGetSyntaxErr(structure, &error);
    EXPECT_EQ(failed, error.code != TqlError::None);
    EXPECT_EQ(tqlPeekErrorGlb(), int(error.code));
    EXPECT_EQ(tqlGetNoSections(structure), error.code == TqlError::None ? 1 : 0);
    return error;
}

std::string WriteFile(const TestFolder& folder, const std::string& name, const std::string& content)
{
    const std::string path = folder.Path(name);
    std::ofstream(fs::u8path(path), std::ios::binary) << content;
    return path;
}

TEST(Loading, LayoutIsFree)
{
    const std::string good[] = {
        "[T]\n[/T]\n",
        "[T]\n[/T]",
        "\xEF\xBB\xBF// c\r\n\r\n  \t[T] // opens\r\n\tK=1,2//c\r\nL =\r\n M = // none\r\n[/T]\r\n",
        "[T]\nK = \"a // b\" // c\n[/T]\n\n  \n",
        "[T]\ntrue = true\nnan = 1\n12 = 3\n\xE6\xB2\xB3.a-b_ = 1\n[/T]",
    };
    for (const std::string& text : good) {
        const Structure structure = LoadText(text);
        TqlSyntaxError error;
        EXPECT_FALSE(tqlGetSyntaxErr(structure, &error)) << text << error.message;
        EXPECT_EQ(tqlGetNoSections(structure), 1);
        EXPECT_EQ(tqlGetErrorGlb(), 0);
    }
}

TEST(Loading, FilesThatCannotBeReadSayWhy)
{
    const TestFolder folder;
    const TqlSyntaxError missing = LoadError(folder.Path("nowhere.hdkv"));
    EXPECT_EQ(missing.code, TqlError::Unreadable);
    EXPECT_EQ(missing.file, "nowhere.hdkv");
    EXPECT_EQ(missing.line, 0u);
    EXPECT_EQ(missing.message, folder.Path("nowhere.hdkv") + " cannot be read: there is no such file");
    EXPECT_NE(LoadError(folder.Path("")).message.find("it is a folder"), std::string::npos);
    EXPECT_EQ(LoadError("").code, TqlError::Unreadable);
    if (fs::exists("/dev/zero")) {
        EXPECT_EQ(LoadError("/dev/zero").code, TqlError::Unreadable) << "endless";
    }
    if (fs::exists("/proc/self/mem")) { // opens, but reading its front fails
        EXPECT_EQ(LoadError("/proc/self/mem").code, TqlError::Unreadable);
    }
    const std::string secret = WriteFile(folder, "secret.hdkv", "[T]\n[/T]\n");
    fs::permissions(secret, fs::perms::none);
    if (!std::ifstream(secret)) { // the administrator may read everything
        EXPECT_EQ(LoadError(secret).code, TqlError::Unreadable);
    }
    fs::remove(secret);
}

TEST(Loading, AFileIsReadWholeWhateverItsName)
{
    std::string text = "[T]\n";
    for (int i = 0; i < 100000; ++i)
        text += "K = " + std::to_string(i) + "\n";
    const TestFolder folder;
    const std::string path = WriteFile(folder, "\xE6\xB2\xB3 1.hdkv", text + "[/T]");
    const Structure structure(tqlLoadFile(path));
    std::int32_t last = 0;
    EXPECT_TRUE(tqlGetParam(tqlTargetByNameNum(structure, "T", 1), "K", &last, 100000));
    EXPECT_EQ(last, 99999);
}

TEST(Loading, TheLastLoadDecidesTheGlobalError)
{
    const TestFolder folder;
    EXPECT_EQ(LoadError(WriteFile(folder, "bad.hdkv", "[T]\n")).code, TqlError::Syntax);
    EXPECT_NE(tqlPeekErrorGlb(), 0);
    EXPECT_EQ(LoadError(WriteFile(folder, "good.hdkv", "[T]\n[/T]\n")).code, TqlError::None);
    EXPECT_EQ(tqlPeekErrorGlb(), 0);
}

TEST(Loading, AFileOverTheLimitIsRefusedBeforeItIsRead)
{
    const TestFolder folder;
    const std::string path = WriteFile(folder, "huge.hdkv", "");
    fs::resize_file(path, std::uintmax_t{1} << 62 >> 20); // more than any memory, and nothing on the disk
    const TqlSyntaxError error = LoadError(path);
    EXPECT_EQ(error.code, TqlError::TooLarge);
    EXPECT_EQ(error.message, "huge.hdkv, line 1, column 1: expected a file smaller than 2 GiB, found one of "
                             "4398046511104 bytes");
}

TEST(Loading, ACommentAloneIsAFileUnlessItIsAPieceOfTheFirstLine)
{
    for (const char* text :
         {"// KVR parameter file 1\n", "// KVR parameter file 1\r\n", "// KVR parameter file 2", "// kvr"})
        EXPECT_EQ(tqlGetNoSections(LoadText(text)), 0) << text;
}

TEST(Loading, LimitsAreExact)
{
    const auto nested = [](int depth) {
        std::string text;
        for (int i = 0; i < depth; ++i)
            text += "[S]\n";
        for (int i = 0; i < depth; ++i)
            text += "[/S]\n";
        return text;
    };
    const auto lineOf = [](std::size_t length) {
        const std::string start = "K = \"";
        return "[T]\n" + start + std::string(length - start.size() - 1, 'x') + "\"\r\n[/T]\n";
    };
    constexpr std::size_t longest = 16 * 1024 * 1024;
    const std::pair<std::string, std::size_t> cases[] = {
        {nested(128), 0}, {nested(129), 129}, {lineOf(longest), 0}, {lineOf(longest + 1), 2}};
    for (const auto& [text, line] : cases) {
        const Structure structure = LoadText(text);
        TqlSyntaxError error;
        tqlGetSyntaxErr(structure, &error);
        EXPECT_EQ(error.code, line ? TqlError::TooLarge : TqlError::None) << error.message;
        EXPECT_EQ(error.line, line);
        EXPECT_EQ(tqlPeekErrorGlb(), int(error.code));
    }
}

} // namespace
