#include "hd_support.h"

#include "base/utf8_path.h"

#include <cstring>
#include <functional>
#ifdef __linux__
#include <sys/stat.h>
#include <sys/xattr.h>
#endif

namespace fs = std::filesystem;

namespace {

/// The system's calls, with one of them failing or writing short.
class FaultyPlatform : public PlatformFile
{
public:
    std::string failing;        // name of the call that fails
    std::size_t writeLimit = 0; // bytes a call writes at most, 0 for all
    std::size_t failAfter = 0;  // bytes after which writing fails, when it is to fail
    std::vector<std::string> calls;

    bool losesTarget = false; // a replacement that fails has removed the target

    std::error_code Create(const fs::path& path, Access access, Handle& file) override
    {
        return Do("Create", [&] { return Native().Create(path, access, file); });
    }
    std::error_code Write(Handle file, std::string_view text, std::size_t& written) override
    {
        if (writeLimit)
            text = text.substr(0, writeLimit);
        written = 0;
        if (failing == "Write" && m_written >= failAfter)
            return Fail();
        const std::error_code error = Native().Write(file, text, written);
        m_written += written;
        return error;
    }
    std::error_code TakePermissions(Handle file, const fs::path& from) override
    {
        return Do("TakePermissions", [&] { return Native().TakePermissions(file, from); });
    }
    std::error_code Sync(Handle file) override
    {
        return Do("Sync", [&] { return Native().Sync(file); });
    }
    std::error_code Close(Handle file) override
    {
        const std::error_code error = Native().Close(file);
        return Do("Close", [&] { return error; });
    }
    std::error_code CheckWritable(const fs::path& path) override
    {
        return Do("CheckWritable", [&] { return Native().CheckWritable(path); });
    }
    std::error_code Replace(const fs::path& from, const fs::path& to) override
    {
        if (losesTarget)
            fs::remove(to);
        return Do("Replace", [&] { return Native().Replace(from, to); });
    }
    std::error_code Rename(const fs::path& from, const fs::path& to) override
    {
        return Do("Rename", [&] { return Native().Rename(from, to); });
    }
    std::error_code SyncFolder(const fs::path& folder) override
    {
        return Do("SyncFolder", [&] { return Native().SyncFolder(folder); });
    }

private:
    static std::error_code Fail() { return std::make_error_code(std::errc::no_space_on_device); }
    std::error_code Do(const char* name, const std::function<std::error_code()>& call)
    {
        calls.push_back(name);
        return failing == name ? Fail() : call();
    }
    std::size_t m_written = 0;
};

using SafeFile = FolderTest;

} // namespace

TEST_F(SafeFile, WritesNewAndReplacesOld)
{
    for (const std::string& text : {std::string("first"), std::string(), std::string(3 << 20, 'x') + "\r\n\0"}) {
        ASSERT_TRUE(WriteFileSafely(Path("a \xC3\xBC.hdkv"), text));
        EXPECT_EQ(ReadWholeFile(Path("a \xC3\xBC.hdkv")).value(), text);
    }
    EXPECT_EQ(FileCount(), 1u);
}

TEST_F(SafeFile, EveryStepThatFailsLeavesTheTargetAlone)
{
    for (const char* step : {"Create", "Write", "TakePermissions", "Sync", "Close", "CheckWritable", "Replace"}) {
        for (const std::size_t failAfter : {0, 6}) {
            Write("a.hdkv", "old content");
            FaultyPlatform platform;
            platform.failing = step;
            platform.writeLimit = 3;
            platform.failAfter = failAfter;
            const auto result = WriteFileSafely(Path("a.hdkv"), "new content", {.platform = &platform});
            ASSERT_FALSE(result) << step;
            EXPECT_EQ(result.error().message, "Could not write \"" + Path("a.hdkv") + "\": No space left on device.");
            EXPECT_EQ(Text("a.hdkv"), "old content") << step;
            EXPECT_EQ(FileCount(), 1u) << step;
        }
    }
}

TEST_F(SafeFile, ShortWritesAreContinuedAndStepsComeInOrder)
{
    Write("a.hdkv", "old");
    FaultyPlatform platform;
    platform.writeLimit = 4;
    ASSERT_TRUE(WriteFileSafely(Path("a.hdkv"), "longer than four", {.platform = &platform}));
    EXPECT_EQ(Text("a.hdkv"), "longer than four");
    EXPECT_EQ(platform.calls, (std::vector<std::string>{"CheckWritable", "Create", "TakePermissions", "Sync", "Close",
                                                        "Replace", "SyncFolder"}));
    // Both contents are whole when the folder cannot be synced, so the save stands.
    platform.failing = "SyncFolder";
    EXPECT_TRUE(WriteFileSafely(Path("a.hdkv"), "x", {.platform = &platform}));
    platform.calls.clear();
    ASSERT_TRUE(WriteFileSafely(Path("new.hdkv"), "x", {.sync = false, .platform = &platform}));
    EXPECT_EQ(platform.calls, (std::vector<std::string>{"Create", "Close", "Replace"}));
}

TEST_F(SafeFile, PermissionsAndLinksStay)
{
    Write("a.hdkv", "old");
    fs::permissions(m_folder / "a.hdkv", fs::perms(0640));
    fs::create_directory(m_folder / "sub");
    fs::create_symlink("../a.hdkv", m_folder / "sub" / "link");
    fs::create_symlink("sub/link", m_folder / "chain");
    ASSERT_TRUE(WriteFileSafely(Path("chain"), "through the chain"));
    EXPECT_TRUE(fs::is_symlink(m_folder / "chain") && fs::is_symlink(m_folder / "sub" / "link"));
    EXPECT_EQ(Text("a.hdkv"), "through the chain");
    EXPECT_EQ(fs::status(m_folder / "a.hdkv").permissions(), fs::perms(0640));
    fs::create_symlink("not yet", m_folder / "dangling");
    ASSERT_TRUE(WriteFileSafely(Path("dangling"), "made"));
    EXPECT_EQ(Text("not yet"), "made");
    fs::create_symlink("loop", m_folder / "loop");
    EXPECT_FALSE(WriteFileSafely(Path("loop"), "x"));
}

// Where a replacement can fail half way, the finished temporary file may be the only copy there is.
TEST_F(SafeFile, WhatIsLeftWhenTheTargetIsLostStaysAndIsNamed)
{
    Write("a.hdkv", "old content");
    FaultyPlatform platform;
    platform.failing = "Replace";
    platform.losesTarget = true;
    const auto result = WriteFileSafely(Path("a.hdkv"), "new content", {.platform = &platform});
    ASSERT_FALSE(result);
    EXPECT_EQ(FileCount(), 1u);
    EXPECT_EQ(ReadWholeFile(result.error().kept).value(), "new content");
    EXPECT_NE(result.error().message.find(result.error().kept), std::string::npos) << result.error().message;
    EXPECT_EQ(result.error().code, std::errc::no_space_on_device);
}

#ifdef __linux__
// Until it has the permissions of the file it replaces, nobody else may read the new content.
TEST_F(SafeFile, TheNewContentIsNeverOpenToOthers)
{
    class Watcher final : public FaultyPlatform
    {
    public:
        std::error_code Write(Handle file, std::string_view text, std::size_t& written) override
        {
            struct stat status;
            ::fstat(int(file), &status);
            mode = status.st_mode & 07777;
            return FaultyPlatform::Write(file, text, written);
        }
        unsigned mode = 0;
    };
    const mode_t before = ::umask(022);
    Write("a.hdkv", "secret");
    fs::permissions(m_folder / "a.hdkv", fs::perms(0640));
    Watcher platform;
    ASSERT_TRUE(WriteFileSafely(Path("a.hdkv"), "more secrets", {.platform = &platform}));
    EXPECT_EQ(platform.mode, 0600u);
    EXPECT_EQ(fs::status(m_folder / "a.hdkv").permissions(), fs::perms(0640));
    ASSERT_TRUE(WriteFileSafely(Path("new.hdkv"), "x", {.platform = &platform}));
    EXPECT_EQ(fs::status(m_folder / "new.hdkv").permissions(), fs::perms(0644));
    ::umask(before);
}

TEST_F(SafeFile, ExtendedAttributesAndTheAccessListStay)
{
    // In the binary form of the kernel: owner rw-, user 1 r--, group r--, mask r--, other ---.
    const unsigned char list[] = {2, 0, 0,    0,    1,    0,    6,    0, 0xff, 0xff, 0xff, 0xff, 2,    0,    4,
                                  0, 1, 0,    0,    0,    4,    0,    4, 0,    0xff, 0xff, 0xff, 0xff, 0x10, 0,
                                  4, 0, 0xff, 0xff, 0xff, 0xff, 0x20, 0, 0,    0,    0xff, 0xff, 0xff, 0xff};
    Write("a.hdkv", "old");
    const std::string path = Path("a.hdkv");
    if (::setxattr(path.c_str(), "user.origin", "survey", 6, 0) != 0)
        GTEST_SKIP() << "the file system keeps no attributes";
    const bool lists = ::setxattr(path.c_str(), "system.posix_acl_access", list, sizeof list, 0) == 0;
    ASSERT_TRUE(WriteFileSafely(path, "new"));
    char value[64] = {};
    EXPECT_EQ(::getxattr(path.c_str(), "user.origin", value, sizeof value), 6);
    EXPECT_EQ(std::string(value, 6), "survey");
    if (lists) {
        ASSERT_EQ(::getxattr(path.c_str(), "system.posix_acl_access", value, sizeof value), ssize_t(sizeof list));
        EXPECT_EQ(std::memcmp(value, list, sizeof list), 0);
    }
}
#endif

TEST_F(SafeFile, ALinkIsRenamedAndItsTargetWritten)
{
    fs::create_directory(m_folder / "shared");
    Write("shared/a.hdkv", "old");
    fs::create_symlink("shared/a.hdkv", m_folder / "a.hdkv");
    ASSERT_TRUE(WriteFileSafely(Path("a.hdkv"), "new"));
    ASSERT_TRUE(RenameFile(Path("a.hdkv"), Path("a.HDKV")));
    EXPECT_TRUE(fs::is_symlink(m_folder / "a.HDKV"));
    EXPECT_EQ(Text("shared/a.hdkv"), "new");
    const auto failed = RenameFile(Path("missing"), Path("b"));
    ASSERT_FALSE(failed);
    EXPECT_EQ(failed.error().code, std::errc::no_such_file_or_directory);
}

TEST_F(SafeFile, RefusesWhatIsNoFileToReplace)
{
    fs::create_directory(m_folder / "folder");
    const struct
    {
        std::string path;
        const char* reason;
    } cases[] = {{Path("folder"), "it is a folder"},
                 {Path("missing/a.hdkv"), "No such file or directory"},
                 {"/dev/null", "it is not an ordinary file"}};
    for (const auto& c : cases) {
        const auto result = WriteFileSafely(c.path, "x");
        ASSERT_FALSE(result) << c.path;
        EXPECT_EQ(result.error().message, "Could not write \"" + c.path + "\": " + c.reason + ".");
    }
}

TEST_F(SafeFile, OriginalsAreKeptUnderFreeNames)
{
    Write("x.HDKV", "broken");
    Write("x.HDKV.unreadable-1", "older");
    const auto kept = KeepOriginal(Path("x.HDKV"), "unreadable");
    ASSERT_TRUE(kept);
    EXPECT_EQ(kept.value(), Path("x.HDKV.unreadable-2"));
    EXPECT_EQ(Text("x.HDKV.unreadable-1") + Text("x.HDKV.unreadable-2") + Text("x.HDKV"), "olderbrokenbroken");
    FaultyPlatform platform;
    platform.failing = "Sync";
    EXPECT_FALSE(KeepOriginal(Path("x.HDKV"), "unreadable", &platform));
    EXPECT_FALSE(KeepOriginal(Path("missing"), "unreadable"));
    EXPECT_EQ(FileCount(), 3u);
}

TEST_F(SafeFile, SameFileSeesThroughNames)
{
    Write("a", "");
    Write("b", "");
    EXPECT_TRUE(SameFile(Path("a"), Path("../") + m_folder.filename().string() + "/a"));
    EXPECT_FALSE(SameFile(Path("a"), Path("b")));
    EXPECT_FALSE(SameFile(Path("a"), Path("missing")));
}

TEST_F(SafeFile, AnHDFileThatCannotBeWrittenOrReadSaysSo)
{
    HD_Parameters parameters;
    ASSERT_TRUE(SaveHDFile(parameters, Path("a.HDKV")));
    EXPECT_TRUE(LoadHDFile(Path("a.HDKV")));
    Write("bad.hdkv", "[KAVO0_HD]\n[InitList]\n[/WindList]\n");
    const auto bad = LoadHDFile(Path("bad.hdkv"));
    ASSERT_FALSE(bad);
    EXPECT_EQ(bad.error().message, "bad.hdkv, line 3, column 1: expected [/InitList], found [/WindList]");
    EXPECT_EQ(tqlPeekErrorGlb(), 0);
    EXPECT_FALSE(LoadHDFile(Path("missing.hdkv")));
}
