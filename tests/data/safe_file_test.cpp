#include "faulty_platform.h"
#include "hd_support.h"

#include "base/utf8_path.h"

#include <algorithm>
#include <cstring>
#include <tuple>
#ifdef __linux__
#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>
#endif

namespace fs = std::filesystem;

namespace {

class SafeFile : public FolderTest
{
protected:
    std::vector<std::string> Names() const
    {
        std::vector<std::string> names;
        for (const auto& entry : fs::directory_iterator(m_folder))
            names.push_back(entry.path().filename().string());
        std::ranges::sort(names);
        return names;
    }
    void Empty() const
    {
        for (const auto& entry : fs::directory_iterator(m_folder))
            fs::remove_all(entry.path());
    }
    /// Whether a file of the folder holds that text.
    bool Holds(const std::string& text) const
    {
        return std::ranges::any_of(Names(), [&](const std::string& name) { return Text(name.c_str()) == text; });
    }
};

std::error_code DiskFull()
{
    return std::make_error_code(std::errc::no_space_on_device);
}

} // namespace

TEST_F(SafeFile, WhatASaveThatWasCutOffDisplacedIsNamedByTheNextOne)
{
    // The program ends at each call from the swap on: nothing that it does then has any effect.
    for (const char* other : {"", "another program's"})
        for (std::size_t last = 0;; ++last) {
            SCOPED_TRACE(other + std::to_string(last));
            for (const auto& each : fs::directory_iterator(m_folder))
                fs::remove(each);
            Write("a.HDKV", "old");
            Write("b.HDKV", "another file");
            FaultyPlatform killed;
            std::size_t calls = 0;
            bool hasSwapped = false;
            killed.fault = [&](const std::string& call) {
                if (call == "Exchange" && *other)
                    Write("a.HDKV", other);
                hasSwapped = hasSwapped || call == "Exchange";
                return hasSwapped && ++calls > last ? std::make_error_code(std::errc::io_error) : std::error_code();
            };
            std::ignore =
                WriteFileSafely(Path("a.HDKV"), "new", {.platform = &killed, .expected = VersionOfText("old")});
            const bool wasCutOff = FileCount() > 2 && !fs::exists(m_folder / "a.HDKV.displaced-1");
            const auto left = NameLeftBehind(Path("a.hdkv"));
            EXPECT_TRUE(NameLeftBehind(Path("b.HDKV")).empty());
            const bool isAway = *other && Text("a.HDKV") == "new";
            if (wasCutOff && isAway) {
                ASSERT_EQ(left.size(), 1u);
                EXPECT_EQ(left.front(), Path("a.hdkv.displaced-1"));
                EXPECT_EQ(ReadText(PathFromUtf8(left.front())), other);
            } else {
                EXPECT_TRUE(left.empty()) << "nobody misses it";
            }
            if (calls <= last)
                break;
        }
    // A save says so itself, when it is certain that nobody else is at it.
    Write("a.HDKV", "old");
    FaultyPlatform killed;
    bool hasSwapped = false;
    killed.fault = [&](const std::string& call) {
        if (call == "Exchange")
            Write("a.HDKV", "another program's");
        return std::exchange(hasSwapped, hasSwapped || call == "Exchange") ? std::make_error_code(std::errc::io_error)
                                                                           : std::error_code();
    };
    std::ignore = WriteFileSafely(Path("a.HDKV"), "new", {.platform = &killed, .expected = VersionOfText("old")});
    EXPECT_TRUE(WriteFileSafely(Path("a.HDKV"), "newer").value().leftBehind.empty());
    const auto told = WriteFileSafely(Path("a.HDKV"), "newest", {.isLocked = true});
    ASSERT_EQ(told.value().leftBehind.size(), 1u);
    EXPECT_EQ(ReadText(PathFromUtf8(told.value().leftBehind.front())), "another program's");
    EXPECT_TRUE(WriteFileSafely(Path("a.HDKV"), "last", {.isLocked = true}).value().leftBehind.empty());
}

TEST_F(SafeFile, WritesNewAndReplacesOld)
{
    for (const std::string& text : {std::string("first"), std::string(), std::string(3 << 20, 'x') + "\r\n\0"}) {
        ASSERT_TRUE(WriteFileSafely(Path("a \xC3\xBC.hdkv"), text));
        EXPECT_EQ(ReadWholeFile(Path("a \xC3\xBC.hdkv")).value(), text);
    }
    EXPECT_EQ(FileCount(), 1u);
}

namespace {

/// A way to save a.hdkv.
struct Way
{
    const char* name;
    bool exists = true, link = false, otherName = false, canExchange = true, expects = false, renames = false;
};
constexpr Way ways[] = {{.name = "a new file", .exists = false},
                        {.name = "an old one"},
                        {.name = "that is known", .expects = true},
                        {.name = "that cannot be swapped", .canExchange = false, .expects = true},
                        {.name = "through a link", .link = true},
                        {.name = "of two names", .otherName = true},
                        {.name = "of two names that is known", .otherName = true, .expects = true},
                        {.name = "that is renamed", .expects = true, .renames = true},
                        {.name = "a link that is renamed", .link = true, .renames = true}};

class EveryCall : public SafeFile
{
protected:
    void Prepare(const Way& way)
    {
        Empty();
        if (!way.exists)
            return;
        const char* const file = way.link ? "target" : "a.hdkv";
        Write(file, "old content");
        fs::permissions(m_folder / file, fs::perms(0640));
        if (way.link)
            fs::create_symlink("target", m_folder / "a.hdkv");
        if (way.otherName)
            fs::create_hard_link(m_folder / "a.hdkv", m_folder / "other name");
    }
    Result<WriteReport> Save(const Way& way, FaultyPlatform& platform)
    {
        platform.writeLimit = 4;
        platform.canExchange = way.canExchange;
        SafeFileOptions options{.platform = &platform};
        if (way.expects)
            options.expected = VersionOfText("old content");
        if (way.renames)
            options.renameTo = Path("a.HDKV");
        return WriteFileSafely(Path("a.hdkv"), "new content", options);
    }
    /// What must hold whatever call fails.
    void CheckOutcome(const Way& way, const Result<WriteReport>& result)
    {
        const bool renamed = fs::exists(fs::symlink_status(m_folder / "a.HDKV"));
        const bool stayed = fs::exists(fs::symlink_status(m_folder / "a.hdkv"));
        EXPECT_FALSE(renamed && stayed) << "two of it";
        const char* const name = renamed ? "a.HDKV" : "a.hdkv";
        if (result || !result.error().kept.empty()) {
            EXPECT_EQ(result ? Text(name) : ReadText(PathFromUtf8(result.error().kept)), "new content");
        } else {
            EXPECT_EQ(stayed ? Text(name) : "", way.exists ? "old content" : "");
        }
        if (!way.exists)
            return;
        EXPECT_EQ(fs::is_symlink(m_folder / name), way.link);
        EXPECT_EQ(fs::status(m_folder / name).permissions(), fs::perms(0640));
        EXPECT_EQ(fs::hard_link_count(m_folder / (way.link ? "target" : name)), 1u + way.otherName);
    }
};

} // namespace

// Each call once, and from each on all of them, which is what the death of the process is to the disk.
TEST_F(EveryCall, ThatFailsLeavesOldOrNewAndSaysWhich)
{
    std::size_t points = 0;
    const int errors[] = {EIO, ENOSPC, EACCES, EROFS, EMFILE, EINTR, EPERM};
    for (const Way& way : ways) {
        std::size_t count = 1000;
        for (const bool once : {true, false})
            for (const int error : errors)
                for (std::size_t failing = 1; failing <= count; ++failing, ++points) {
                    Prepare(way);
                    FaultyPlatform platform;
                    std::string failed;
                    platform.fault = [&](const std::string& call) {
                        const std::size_t number = platform.calls.size();
                        if (number == failing)
                            failed = call;
                        return number == failing || (!once && number > failing)
                                   ? std::error_code(error, std::generic_category())
                                   : std::error_code();
                    };
                    const auto result = Save(way, platform);
                    SCOPED_TRACE(std::string(way.name) + ": " + failed + " fails with " + std::strerror(error) +
                                 (once ? "" : ", and all after it"));
                    CheckOutcome(way, result);
                    const std::string& beside = result ? result.value().displaced : result.error().kept;
                    const std::size_t files = 1u + way.link + way.otherName;
                    EXPECT_LE(FileCount(), files + (!once || failed == "Remove" || !beside.empty()));
                    if (!result && result.error().kept.empty()) {
                        EXPECT_EQ(result.error().code, std::error_code(error, std::generic_category()));
                        EXPECT_EQ(result.error().path, Path("a.hdkv"));
                    }
                    if (result && failed == "SyncFolder" && once && !way.otherName) {
                        EXPECT_EQ(result.value().unconfirmed.value(), error);
                    }
                    if (failed.empty()) // all calls have failed once
                        count = failing;
                }
    }
    RecordProperty("points", int(points));
    EXPECT_GT(points, 2000u);
}

// Whenever another program writes during a save, what it wrote is found: under the name, or beside it and said.
TEST_F(EveryCall, IsAChanceForOthersWhoLoseNothing)
{
    for (const Way& way : ways)
        for (const bool replaces : {true, false})
            for (std::size_t at = 1, count = 1000; at <= count; ++at) {
                Prepare(way);
                // Where the content is known, another of the same length is told apart, too.
                const std::string theirs = way.expects ? "her content" : "their own";
                if (way.exists && at % 2) // as most files, it was not written just now
                    fs::last_write_time(m_folder / "a.hdkv", fs::file_time_type::clock::now() - std::chrono::hours(1));
                FaultyPlatform platform;
                std::string when;
                bool hasLooked = way.expects, isLate = false;
                const bool hasCoarseClock = way.expects && way.canExchange && !way.otherName && at % 2 == 0;
                platform.fault = [&](const std::string& call) {
                    if (platform.calls.size() <= at) {
                        hasLooked = hasLooked || call == "List";
                        isLate = isLate || call == "Replace" || (way.otherName && call == "SyncFolder");
                    }
                    if (platform.calls.size() == at) {
                        when = call;
                        const char* const target = way.link && way.exists            ? "target"
                                                   : fs::exists(m_folder / "a.HDKV") ? "a.HDKV"
                                                                                     : "a.hdkv";
                        if (replaces) {
                            Write("theirs", theirs);
                            fs::rename(m_folder / "theirs", m_folder / target);
                        } else {
                            std::error_code isNew;
                            const auto time = fs::last_write_time(m_folder / target, isNew);
                            Write(target, theirs);
                            if (hasCoarseClock && !isNew)
                                fs::last_write_time(m_folder / target, time);
                        }
                    }
                    return std::error_code();
                };
                const auto result = Save(way, platform);
                if (when.empty()) {
                    count = at;
                    continue;
                }
                // What is there when the save begins is what it is to replace, unless it knows better. Without a swap,
                // and into a file of several names, there is no last moment that could be looked at.
                if (!hasLooked || isLate)
                    continue;
                SCOPED_TRACE(std::string(way.name) + ", at " + std::to_string(at) + " " + when);
                EXPECT_TRUE(Holds(theirs));
                if (!result) {
                    EXPECT_EQ(result.error().code, ChangedOutside);
                } else if (!result.value().displaced.empty()) {
                    EXPECT_EQ(ReadText(PathFromUtf8(result.value().displaced)), theirs);
                }
            }
}

TEST_F(SafeFile, ShortWritesAreContinuedAndStepsComeInOrder)
{
    Write("a.hdkv", "old");
    FaultyPlatform platform;
    platform.writeLimit = 16;
    ASSERT_TRUE(WriteFileSafely(Path("a.hdkv"), "longer than sixteen", {.platform = &platform}));
    EXPECT_EQ(Text("a.hdkv"), "longer than sixteen");
    EXPECT_EQ(platform.calls, (std::vector<std::string>{"Status", "CheckWritable", "List", "Create", "Lock", "Write",
                                                        "Write", "TakePermissions", "Sync", "Close", "RenameNew",
                                                        "Exchange", "Status", "RenameNew", "SyncFolder", "Remove"}));
    platform.calls.clear();
    ASSERT_TRUE(WriteFileSafely(Path("new.hdkv"), "x", {.sync = false, .platform = &platform}));
    EXPECT_EQ(platform.calls, (std::vector<std::string>{"Status", "List", "Create", "Lock", "Write",
                                                        "TakeNewPermissions", "Close", "RenameNew"}));
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

// What was not expected to be there is asked about, or refused where nobody can be asked.
TEST_F(SafeFile, AChangeOfSomebodyElseIsNotReplacedUnasked)
{
    Write("a.hdkv", "theirs");
    SafeFileOptions options{.expected = VersionOfText("ours")};
    const auto refused = WriteFileSafely(Path("a.hdkv"), "new", options);
    ASSERT_FALSE(refused);
    EXPECT_EQ(refused.error().message,
              "Could not write \"" + Path("a.hdkv") + "\": another program has changed it since it was read.");
    WriteAnswer answer = WriteAnswer::Cancel;
    int asked = 0;
    options.ask = [&](const WriteQuestion& question) {
        asked += question.kind == WriteQuestion::ChangedOutside;
        return answer;
    };
    const auto cancelled = WriteFileSafely(Path("a.hdkv"), "new", options);
    ASSERT_FALSE(cancelled);
    EXPECT_EQ(cancelled.error().code, std::errc::operation_canceled);
    EXPECT_EQ(Text("a.hdkv"), "theirs");
    answer = WriteAnswer::Yes;
    const auto written = WriteFileSafely(Path("a.hdkv"), "new", options);
    ASSERT_TRUE(written);
    EXPECT_EQ(written.value().displaced, Path("a.hdkv.displaced-1"));
    EXPECT_EQ(Text("a.hdkv.displaced-1") + Text("a.hdkv"), "theirsnew");
    // The next save expects what this one wrote. The same content in another file is no change.
    options.expected = written.value().version;
    Write("same", "new");
    fs::rename(m_folder / "same", m_folder / "a.hdkv");
    ASSERT_TRUE(WriteFileSafely(Path("a.hdkv"), "newer", options));
    EXPECT_EQ(asked, 2);
    EXPECT_EQ(FileCount(), 2u);
}

TEST_F(SafeFile, VersionsDifferWithTheContentOnly)
{
    std::string text(300000, 'x');
    Write("a", text);
    FileVersion version;
    ASSERT_FALSE(VersionOfFile(PlatformFile::Native(), m_folder / "a", version));
    EXPECT_EQ(version, VersionOfText(text));
    for (const std::size_t place : {std::size_t(0), std::size_t(262143), std::size_t(262144), text.size() - 1}) {
        std::string other = text;
        other[place] = 'y';
        EXPECT_NE(VersionOfText(other).hash, version.hash) << place;
    }
    std::swap(text[0], text[40]);
    EXPECT_EQ(VersionOfText(text), version);
    EXPECT_NE(VersionOfText(std::string(1, '\0')), VersionOfText(std::string(2, '\0')));
}

TEST_F(SafeFile, OtherNamesOfAFileAreAskedAbout)
{
    for (const WriteAnswer answer : {WriteAnswer::Yes, WriteAnswer::No, WriteAnswer::Cancel}) {
        Empty();
        Write("a.hdkv", "old, and longer");
        fs::create_hard_link(m_folder / "a.hdkv", m_folder / "b");
        const auto result = WriteFileSafely(Path("a.hdkv"), "new", {.ask = [&](const WriteQuestion& question) {
                                                EXPECT_EQ(question.kind, WriteQuestion::HardLinks);
                                                EXPECT_EQ(question.names, 2u);
                                                return answer;
                                            }});
        EXPECT_EQ(bool(result), answer != WriteAnswer::Cancel);
        EXPECT_EQ(Text("a.hdkv"), result ? "new" : "old, and longer");
        EXPECT_EQ(Text("b"), answer == WriteAnswer::Yes ? "new" : "old, and longer");
        EXPECT_EQ(FileCount(), 2u);
    }
    // A disk that is full half way: the whole new content is beside it, under a name that no cleaning touches.
    FaultyPlatform platform;
    platform.writeLimit = 4;
    std::size_t writes = 0;
    platform.fault = [&](const std::string& call) {
        writes += call == "Write";
        return call == "Write" && writes == 5 ? DiskFull() : std::error_code();
    };
    const auto torn = WriteFileSafely(Path("a.hdkv"), "new content", {.platform = &platform});
    ASSERT_FALSE(torn);
    EXPECT_EQ(torn.error().kept, Path("a.hdkv.new-1"));
    EXPECT_EQ(Text("a.hdkv.new-1"), "new content");
    EXPECT_EQ(UnfinishedSaves(Path("a.hdkv")), std::vector{Path("a.hdkv.new-1")}) << "as when the program was killed";
    EXPECT_TRUE(UnfinishedSaves(Path("b.hdkv")).empty());
}

TEST_F(SafeFile, WhatCannotBeKeptIsAskedAboutAndSaid)
{
    FaultyPlatform platform;
    platform.losing = {.owner = true, .accessList = true};
    Write("a.hdkv", "old");
    WriteAnswer answer = WriteAnswer::Cancel;
    SafeFileOptions options{.platform = &platform};
    options.ask = [&](const WriteQuestion& question) {
        EXPECT_EQ(question.kind, WriteQuestion::LosesMetadata);
        EXPECT_EQ(LostText(question.lost), "owner, access list");
        return answer;
    };
    EXPECT_FALSE(WriteFileSafely(Path("a.hdkv"), "new", options));
    EXPECT_EQ(Text("a.hdkv"), "old");
    EXPECT_EQ(FileCount(), 1u);
    answer = WriteAnswer::Yes;
    EXPECT_TRUE(WriteFileSafely(Path("a.hdkv"), "new", options));
    options.ask = {};
    const auto told = WriteFileSafely(Path("a.hdkv"), "newer", options);
    ASSERT_TRUE(told);
    EXPECT_EQ(LostText(told.value().lost), "owner, access list");
}

// Those of killed programs go; what is in use, young, or not named as they are stays.
TEST_F(SafeFile, LeftOverTemporariesGoWhenTheyAreOld)
{
    for (const char* name : {".kvr-0123456789abcdef.tmp", ".kvr-42.tmp", ".kvr-mine.tmp", "kvr-42.tmp"})
        Write(name, "half");
    fs::create_directory(m_folder / ".kvr-1.tmp");
    PlatformFile::Handle used = 0;
    ASSERT_FALSE(PlatformFile::Native().Open(m_folder / ".kvr-42.tmp", PlatformFile::Purpose::Read, used));
    ASSERT_FALSE(PlatformFile::Native().Lock(used));
    FaultyPlatform platform;
    platform.aged = std::int64_t(3500) * 1'000'000'000;
    ASSERT_TRUE(WriteFileSafely(Path("a.hdkv"), "x", {.platform = &platform}));
    EXPECT_EQ(FileCount(), 6u);
    platform.aged = std::int64_t(3700) * 1'000'000'000;
    ASSERT_TRUE(WriteFileSafely(Path("a.hdkv"), "x", {.platform = &platform}));
    PlatformFile::Native().Close(used);
    EXPECT_EQ(Names(),
              (std::vector<std::string>{".kvr-1.tmp", ".kvr-42.tmp", ".kvr-mine.tmp", "a.hdkv", "kvr-42.tmp"}));
}

// A last moment in which somebody writes, or in which the system does not say whether anybody did: what was swapped out
// stays, whatever fails and however old it gets.
TEST_F(SafeFile, WhatIsSwappedOutIsNoLeftOver)
{
    for (const char* failing : {"RenameNew", "Status"}) {
        Empty();
        Write("a.hdkv", "old");
        FaultyPlatform platform;
        bool swapped = false;
        platform.fault = [&](const std::string& call) {
            if (call == "Exchange" && failing == std::string("RenameNew"))
                Write("a.hdkv", "theirs");
            const bool fails = swapped && call == failing;
            swapped = swapped || call == "Exchange";
            return fails ? std::error_code(EIO, std::generic_category()) : std::error_code();
        };
        const auto written = WriteFileSafely(Path("a.hdkv"), "new", {.platform = &platform});
        ASSERT_TRUE(written);
        const auto& [unconfirmed, lost, displaced, unknown, leftBehind, unfinished, notRenamed, version, inPlace] = written.value();
        EXPECT_EQ(unknown.value(), failing == std::string("Status") ? EIO : 0);
        platform.fault = [](const std::string&) { return std::error_code(); };
        platform.aged = std::int64_t(7200) * 1'000'000'000;
        ASSERT_TRUE(WriteFileSafely(Path("b.hdkv"), "x", {.platform = &platform}));
        EXPECT_EQ(ReadText(PathFromUtf8(displaced)), unknown ? "old" : "theirs") << displaced;
        EXPECT_EQ(FileCount(), 3u);
    }
}

// Where a replacement can fail half way, the finished temporary file may be the only copy there is.
TEST_F(SafeFile, WhatIsLeftWhenTheTargetIsLostStaysAndIsNamed)
{
    struct Case
    {
        const char* lostAt;
        bool canLook; // whether the target is there is not known otherwise
    };
    for (const auto& [lostAt, canLook] : {Case{"Replace", true}, {"Replace", false}, {"Exchange", true}}) {
        SCOPED_TRACE(std::string(lostAt) + (canLook ? "" : ", unknown"));
        Write("a.hdkv", "old content");
        bool isReplaced = false;
        FaultyPlatform platform;
        platform.canExchange = false;
        platform.fault = [&](const std::string& call) {
            if (call == lostAt)
                fs::remove(m_folder / "a.hdkv");
            isReplaced = isReplaced || call == "Replace";
            return call == "Replace" || (isReplaced && !canLook && call == "Status") ? DiskFull() : std::error_code();
        };
        const auto result = WriteFileSafely(Path("a.hdkv"), "new content", {.platform = &platform});
        ASSERT_FALSE(result);
        EXPECT_EQ(FileCount(), 1u);
        EXPECT_EQ(ReadWholeFile(result.error().kept).value(), "new content");
        EXPECT_NE(result.error().message.find(result.error().kept), std::string::npos) << result.error().message;
        EXPECT_EQ(result.error().code, std::errc::no_space_on_device);
        fs::remove(result.error().kept);
    }
}

#ifdef __linux__
// Until it has the permissions of the file it replaces, or of a new one, nobody else may read the new content.
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
    for (const char* name : {"a.hdkv", "new.hdkv"}) {
        Watcher platform;
        ASSERT_TRUE(WriteFileSafely(Path(name), "more secrets", {.platform = &platform}));
        EXPECT_EQ(platform.mode, 0600u);
    }
    EXPECT_EQ(fs::status(m_folder / "a.hdkv").permissions(), fs::perms(0640));
    EXPECT_EQ(fs::status(m_folder / "new.hdkv").permissions(), fs::perms(0644));
    ::umask(before);
}

namespace {

// In the binary form of the kernel: owner rw-, user 1 r--, group r--, mask r--, other ---.
const unsigned char accessList[] = {2, 0, 0,    0,    1,    0,    6,    0, 0xff, 0xff, 0xff, 0xff, 2,    0,    4,
                                    0, 1, 0,    0,    0,    4,    0,    4, 0,    0xff, 0xff, 0xff, 0xff, 0x10, 0,
                                    4, 0, 0xff, 0xff, 0xff, 0xff, 0x20, 0, 0,    0,    0xff, 0xff, 0xff, 0xff};

std::string Attribute(const std::string& path, const char* name)
{
    char value[64] = {};
    const ssize_t size = ::getxattr(path.c_str(), name, value, sizeof value);
    return size < 0 ? "(none)" : std::string(value, std::size_t(size));
}

} // namespace

TEST_F(SafeFile, ExtendedAttributesAndTheAccessListStay)
{
    Write("a.hdkv", "old");
    const std::string path = Path("a.hdkv");
    if (::setxattr(path.c_str(), "user.origin", "survey", 6, 0) != 0)
        GTEST_SKIP() << "the file system keeps no attributes";
    ::setxattr(path.c_str(), "system.posix_acl_access", accessList, sizeof accessList, 0);
    const std::string before = Attribute(path, "system.posix_acl_access");
    const auto written = WriteFileSafely(path, "new");
    ASSERT_TRUE(written);
    EXPECT_EQ(Attribute(path, "user.origin"), "survey");
    EXPECT_EQ(Attribute(path, "system.posix_acl_access"), before);
    EXPECT_EQ(LostText(written.value().lost), "");

    // What a folder gives its new files, it gives one of ours, too.
    if (::setxattr(m_folder.c_str(), "system.posix_acl_default", accessList, sizeof accessList, 0) != 0)
        return;
    Write("usual", "x");
    ASSERT_TRUE(WriteFileSafely(Path("ours"), "x"));
    EXPECT_EQ(Attribute(Path("ours"), "system.posix_acl_access"), Attribute(Path("usual"), "system.posix_acl_access"));
    EXPECT_EQ(fs::status(m_folder / "ours").permissions(), fs::status(m_folder / "usual").permissions());
}

// Where a file system has no attributes, there are none to lose: whoever saves there is not asked about them.
TEST_F(SafeFile, AFileSystemWithoutAttributesLosesNone)
{
    const char* const without = "/sys/kernel/debug";
    if (::listxattr(without, nullptr, 0) != -1 || errno != ENOTSUP)
        GTEST_SKIP() << "needs a file system that knows no attributes";
    PlatformFile::Handle file = 0;
    ASSERT_FALSE(PlatformFile::Native().Create(m_folder / "a.hdkv", file));
    LostMetadata lost;
    EXPECT_FALSE(PlatformFile::Native().TakePermissions(file, without, lost));
    PlatformFile::Native().Close(file);
    EXPECT_EQ(LostText(lost), "");
}

// Somebody else's file in a folder that one may write to.
TEST_F(SafeFile, AnOwnerThatCannotBeKeptIsLostWithTheRightsOfTheGroup)
{
    if (::geteuid() != 0)
        GTEST_SKIP() << "needs files of two users";
    fs::permissions(m_folder, fs::perms(0777));
    Write("a.hdkv", "old");
    fs::permissions(m_folder / "a.hdkv", fs::perms(0666));
    Write("b.hdkv", "old");
    fs::permissions(m_folder / "b.hdkv", fs::perms(0662));
    ASSERT_EQ(::setegid(65534), 0);
    ASSERT_EQ(::seteuid(65534), 0);
    const auto a = WriteFileSafely(Path("a.hdkv"), "new"), b = WriteFileSafely(Path("b.hdkv"), "new");
    ASSERT_EQ(::seteuid(0), 0);
    ASSERT_EQ(::setegid(0), 0);
    ASSERT_TRUE(a && b);
    EXPECT_EQ(LostText(a.value().lost), "owner, group");
    EXPECT_EQ(LostText(b.value().lost), "owner, group, mode");
    EXPECT_EQ(fs::status(m_folder / "a.hdkv").permissions(), fs::perms(0666));
    EXPECT_EQ(fs::status(m_folder / "b.hdkv").permissions(), fs::perms(0622)) << "another group may no more than all";
}
#endif

TEST_F(SafeFile, RefusesWhatIsNoFileToReplace)
{
    Write("river", "whole");
    EXPECT_FALSE(WriteFileSafely(Path("river") + '\0' + ".hdkv", "new")) << "the system would write to another file";
    EXPECT_EQ(Text("river"), "whole");
    fs::remove(m_folder / "river");
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
    EXPECT_EQ(NotWritten("a", {512, std::generic_category()}).message,
              "Could not write \"a\": the system gives the error number 512.");
}

TEST_F(SafeFile, ANewSpellingReplacesWhatWasThereOnlyWhenItWasThereBefore)
{
    Write("a.hdkv", "old");
    Write("a.HDKV", "asked about");
    ASSERT_TRUE(WriteFileSafely(Path("a.hdkv"), "new", {.renameTo = Path("a.HDKV")}));
    EXPECT_EQ(Names(), std::vector<std::string>{"a.HDKV"});
    Write("b.hdkv", "old");
    FaultyPlatform platform;
    platform.fault = [&](const std::string& call) {
        if (call == "Sync")
            Write("b.HDKV", "somebody else's");
        return std::error_code();
    };
    const auto kept = WriteFileSafely(Path("b.hdkv"), "new", {.platform = &platform, .renameTo = Path("b.HDKV")});
    ASSERT_TRUE(kept);
    EXPECT_EQ(kept.value().notRenamed, std::errc::file_exists);
    EXPECT_EQ(Text("b.hdkv") + Text("b.HDKV"), "newsomebody else's");
}

TEST_F(SafeFile, OriginalsAreKeptUnderFreeNames)
{
    Write("x.HDKV", "broken");
    Write("x.HDKV.unreadable-1", "older");
    const auto kept = KeepOriginal(Path("x.HDKV"), "unreadable");
    ASSERT_TRUE(kept);
    EXPECT_EQ(kept.value().path, Path("x.HDKV.unreadable-2"));
    EXPECT_EQ(kept.value().version, VersionOfText("broken"));
    EXPECT_EQ(Text("x.HDKV.unreadable-1") + Text("x.HDKV.unreadable-2") + Text("x.HDKV"), "olderbrokenbroken");
    for (const char* step : {"Open", "StatusOf", "Read", "Create", "Write", "TakePermissions", "Sync", "RenameNew"}) {
        FaultyPlatform platform;
        platform.fault = [&](const std::string& call) { return call == step ? DiskFull() : std::error_code(); };
        EXPECT_FALSE(KeepOriginal(Path("x.HDKV"), "unreadable", &platform)) << step;
    }
    EXPECT_FALSE(KeepOriginal(Path("missing"), "unreadable"));
    EXPECT_EQ(FileCount(), 3u);
    const std::string longest(255, 'n');
    Write(longest.c_str(), "long");
    const auto beside = KeepOriginal(Path(longest.c_str()), "original");
    ASSERT_TRUE(beside);
    EXPECT_EQ(ReadText(PathFromUtf8(beside.value().path)), "long");
}

TEST_F(SafeFile, SameFileSeesThroughNames)
{
    Write("a", "");
    Write("b", "");
    EXPECT_TRUE(IsSameFile(Path("a"), Path("../") + m_folder.filename().string() + "/a"));
    EXPECT_FALSE(IsSameFile(Path("a"), Path("b")));
    EXPECT_FALSE(IsSameFile(Path("a"), Path("missing")));
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
    // A byte-order mark belongs to what the file holds.
    FileVersion version;
    Write("marked.hdkv", "\xEF\xBB\xBF[KAVO0_HD]\n[/KAVO0_HD]\n");
    ASSERT_TRUE(ParseFile(Path("marked.hdkv"), nullptr, &version));
    EXPECT_EQ(version, VersionOfText(Text("marked.hdkv")));
}
