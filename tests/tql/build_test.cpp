#include "test_folder.h"
#include "tql/tql_support.h"

#include <filesystem>
#include <fstream>
#include <gtest/gtest.h>
#include <iterator>

namespace {

TEST(Building, TheLayoutIsExact)
{
    const Structure out(tqlCreate());
    tqlAddTarget(out, "KAVO0_HD");
    tqlAddSection(out, "Global_Variables");
    tqlPutParam(out, "Calc", false);
    tqlPutParam(out, "Item", std::int32_t{-7});
    tqlPutParam(out, "Title", "main \"river\"");
    tqlPutParamFilename(out, "GeoDb", "a>b");
    tqlAddSection(out, "Empty");
    tqlEndSection(out);
    EXPECT_TRUE(tqlPutListParam(out, "List", "bidsn",
                                {true, std::int32_t{1}, 2.5, std::string_view("s"), std::string_view("f")}));
    tqlAddKeyword(out, "None");
    tqlAddRawKeyword(out, "Raw", "1.50 , \"x\"");
    tqlAddRawKeyword(out, "RawNone", "");
    tqlEndSection(out);
    EXPECT_EQ(tqlGetText(out), "") << "a section is still open";
    tqlEndSection(out);
    EXPECT_EQ(tqlGetText(out), R"(// KVR parameter file 1
[KAVO0_HD]
  [Global_Variables]
    Calc = false
    Item = -7
    Title = "main \"river\""
    GeoDb = <a\>b>
    [Empty]
    [/Empty]
    List = true, 1, 2.5, "s", <f>
    None =
    Raw = 1.50 , "x"
    RawNone =
  [/Global_Variables]
[/KAVO0_HD]
)");
}

TEST(Building, AListThatDoesNotFitItsSignatureAddsNothing)
{
    const Structure out(tqlCreate());
    tqlAddTarget(out, "T");
    EXPECT_FALSE(tqlPutListParam(out, "K", "bi", {true}));
    EXPECT_FALSE(tqlPutListParam(out, "K", "bi", {true, 0.5}));
    EXPECT_FALSE(tqlPutListParam(out, "K", "x", {true}));
    EXPECT_FALSE(tqlPutListParam(out, "K", "i", {std::string_view("1")}));
    EXPECT_TRUE(tqlPutListParam(out, "K", "d", {std::int32_t{3}}));
    tqlEndSection(out);
    EXPECT_EQ(tqlGetText(out), "// KVR parameter file 1\n[T]\n  K = 3\n[/T]\n");
}

// What no file can hold gives no text at all, so that it cannot be saved by mistake.
TEST(Building, WhatCannotBeReadBackIsNotWritten)
{
    const auto refused = [](void (*add)(tqlHandle)) {
        const Structure out(tqlCreate());
        tqlAddTarget(out, "T");
        add(out);
        tqlEndSection(out);
        const TestFolder folder;
        const std::string path = folder.Path("refused.hdkv");
        EXPECT_FALSE(tqlAppend(out, path));
        EXPECT_EQ(tqlGetErrorGlb(), int(TqlError::Write));
        EXPECT_FALSE(std::filesystem::exists(path));
        return tqlGetText(out).empty();
    };
    EXPECT_TRUE(refused([](tqlHandle out) { tqlAddKeyword(out, "a b"); }));
    EXPECT_TRUE(refused([](tqlHandle out) { tqlAddKeyword(out, ""); }));
    EXPECT_TRUE(refused([](tqlHandle out) { tqlAddInt(out, 1); }));
    EXPECT_TRUE(refused([](tqlHandle out) { tqlAddTarget(out, "Inner"), tqlEndSection(out); }));
    EXPECT_TRUE(refused([](tqlHandle out) { tqlEndSection(out), tqlEndSection(out); }));
    EXPECT_TRUE(
        refused([](tqlHandle out) { tqlEndSection(out), tqlPutParam(out, "K", true), tqlAddTarget(out, "T"); }));
    for (const char* raw : {"1,", "1 2", " 1", "1 ", "\"a", "1 // no", "1\n[/T]", "\xFF", "1\r"}) {
        const Structure out(tqlCreate());
        tqlAddTarget(out, "T");
        tqlAddRawKeyword(out, "K", raw);
        tqlEndSection(out);
        EXPECT_EQ(tqlGetText(out), "") << raw;
    }
    EXPECT_TRUE(refused([](tqlHandle out) {
        for (int i = 0; i < 128; ++i)
            tqlAddSection(out, "S");
        for (int i = 0; i < 128; ++i)
            tqlEndSection(out);
    }));
}

TEST(Building, AppendAddsToTheFileAndReportsFailure)
{
    const TestFolder folder;
    const std::string path = folder.Path("\xE6\xB2\xB3.hdkv");
    const Structure out(tqlCreate());
    tqlAddTarget(out, "T");
    tqlEndSection(out);
    EXPECT_TRUE(tqlAppend(out, path));
    EXPECT_TRUE(tqlAppend(out, path));
    std::ifstream in(std::filesystem::u8path(path), std::ios::binary);
    const std::string content{std::istreambuf_iterator<char>(in), {}};
    EXPECT_EQ(content, std::string(tqlGetText(out)) + std::string(tqlGetText(out)));

    EXPECT_FALSE(tqlAppend(out, folder.Path("no such folder/x.hdkv")));
    EXPECT_EQ(tqlPeekErrorGlb(), int(TqlError::Write));
    EXPECT_EQ(tqlGetErrorGlb(), int(TqlError::Write));
    EXPECT_EQ(tqlGetErrorGlb(), 0);
    if (std::filesystem::exists("/dev/full")) {
        EXPECT_FALSE(tqlAppend(out, "/dev/full"));
    }
}

TEST(Building, ClosingSetsTheHandleToNull)
{
    tqlHandle created = tqlCreate(), loaded = tqlLoadText("[T]\n[/T]", "x");
    for (tqlHandle* handle : {&created, &loaded}) {
        tqlClose(handle);
        EXPECT_EQ(*handle, nullptr);
        tqlClose(handle);
    }
    tqlClose(nullptr);
}

} // namespace
