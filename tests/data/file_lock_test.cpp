#include "faulty_platform.h"
#include "hd_support.h"

#include "files/file_lock.h"
#include "files/platform_process.h"
#include "files/process_copy.h"

#include <atomic>
#include <ctime>
#include <limits>
#include <thread>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

using Locks = FolderTest;

} // namespace

TEST_F(Locks, OneHasItAndTheOthersHearWho)
{
    Write("river.hdkv", "x");
    fs::create_symlink("river.hdkv", m_folder / "link.hdkv");
    FileLock first = FileLock::Try(Path("river.hdkv"), "first");
    ASSERT_TRUE(first.IsHeld());
    // By another spelling of the extension, which a save may give it, or through a link it is the same file.
    for (const char* name : {"river.hdkv", "river.HDKV", "link.hdkv"}) {
        const FileLock second = FileLock::Try(Path(name), "second");
        EXPECT_FALSE(second.IsHeld());
        ASSERT_TRUE(second.HeldBy()) << name;
        EXPECT_EQ(second.HeldBy()->program, "first");
        EXPECT_EQ(second.HeldBy()->process, ThisProcess().number);
        EXPECT_EQ(second.HeldBy()->user + second.HeldBy()->host, ThisProcess().user + ThisProcess().host);
        EXPECT_NEAR(double(second.HeldBy()->since), double(std::time(nullptr)), 60);
        EXPECT_TRUE(HolderText(*second.HeldBy()).find("(first, process ") != std::string::npos);
    }
    EXPECT_TRUE(FileLock::Try(Path("river.kvnw"), "second").IsHeld());
    EXPECT_TRUE(first.IsFor(Path("link.hdkv")) && first.IsFor(Path("river.HDKV")) && !first.IsFor(Path("a.hdkv")));
    FileLock moved = std::move(first);
    EXPECT_TRUE(moved.IsHeld() && !first.IsHeld());
    std::jthread leaving([&] {
        std::this_thread::sleep_for(50ms);
        moved.Release();
    });
    EXPECT_FALSE(FileLock::WaitFor(Path("river.hdkv"), "second", 1ms).IsHeld());
    EXPECT_TRUE(FileLock::WaitFor(Path("river.hdkv"), "second", 10s).IsHeld());
    EXPECT_EQ(FileCount(), 2u) << "nothing is left over";
}

TEST_F(Locks, AFileOfSeveralNamesHasOneLock)
{
    Write("river.hdkv", "x");
    fs::create_hard_link(m_folder / "river.hdkv", m_folder / "other.hdkv");
    FileLock first = FileLock::Try(Path("river.hdkv"), "first");
    ASSERT_TRUE(first.IsHeld());
    const FileLock second = FileLock::Try(Path("other.hdkv"), "second");
    ASSERT_TRUE(second.HeldBy());
    EXPECT_EQ(second.HeldBy()->process, ThisProcess().number) << "whoever has it is named by the system";
    EXPECT_EQ(second.HeldBy()->user + second.HeldBy()->host, ThisProcess().user + ThisProcess().host);
    EXPECT_TRUE(HolderText(*second.HeldBy()).ends_with("process " + std::to_string(ThisProcess().number) + ')'));
    // A copy of the process that goes on for a while holds nothing.
    auto copy = ProcessCopy::Start([] {
        std::this_thread::sleep_for(60s);
        return std::error_code();
    });
    ASSERT_TRUE(copy);
    EXPECT_TRUE(FileLock::Try(Path("other.hdkv"), "second").HeldBy()) << "the original does";
    first.Release();
    EXPECT_TRUE(FileLock::WaitFor(Path("other.hdkv"), "second", 10s).IsHeld());
    copy.value().Stop();
    EXPECT_EQ(FileCount(), 2u);
    // A name that is given to a file while it is in use, and a file that gets into the place of one.
    Write("a.hdkv", "x");
    FileLock late = FileLock::Try(Path("a.hdkv"), "first");
    fs::create_hard_link(m_folder / "a.hdkv", m_folder / "b.hdkv");
    EXPECT_TRUE(FileLock::Try(Path("b.hdkv"), "second").IsHeld());
    late.Follow(Path("a.hdkv"));
    EXPECT_TRUE(FileLock::Try(Path("b.hdkv"), "second").HeldBy());
    fs::remove(m_folder / "a.hdkv");
    Write("a.hdkv", "y");
    late.Follow(Path("a.hdkv"));
    EXPECT_TRUE(FileLock::Try(Path("b.hdkv"), "second").IsHeld()) << "it is another file";
    EXPECT_TRUE(FileLock::Try(Path("a.hdkv"), "second").HeldBy());
}

TEST_F(Locks, OneGoesOnInAFolderOfAnotherNameAndKnowsThatItWasRemoved)
{
    fs::create_directory(m_folder / "p");
    Write("p/river.hdkv", "x");
    FileLock lock = FileLock::Try(Path("p/river.hdkv"), "first");
    ASSERT_TRUE(lock.IsHeld());
    EXPECT_FALSE(lock.WasRemoved()());
    fs::rename(m_folder / "p", m_folder / "q");
    EXPECT_FALSE(lock.WasRemoved()()) << "it went along";
    EXPECT_TRUE(lock.IsFor(Path("q/river.hdkv")) && !lock.IsFor(Path("p/river.hdkv")));
    fs::create_directory(m_folder / "p");
    EXPECT_TRUE(lock.WasRemoved()()) << "who opens the file of that name now finds none";
    lock.Follow(Path("q/river.hdkv"));
    EXPECT_FALSE(lock.WasRemoved()());
    fs::remove(lock.Path());
    EXPECT_TRUE(lock.WasRemoved()());
    const FileLock other = FileLock::Try(Path("q/river.hdkv"), "second");
    EXPECT_TRUE(other.IsHeld() && lock.WasRemoved()() && !lock.IsFor(Path("q/river.hdkv")));
    lock.Release();
    EXPECT_TRUE(FileLock::Try(Path("q/river.hdkv"), "third").HeldBy()) << "another's stays";
    lock = FileLock::Try(Path("q/river.kvnw"), "first");
    fs::rename(m_folder / "q", m_folder / "r");
    lock.Follow(Path("r/river.kvnw"));
    lock.Release();
    EXPECT_FALSE(fs::exists(m_folder / "r/.river.kvnw.lock")) << "the own one goes wherever it stands";
}

TEST_F(Locks, WhatADeadProgramOrAnybodyElseLeavesIsNoLock)
{
    Write(".river.hdkv.lock", "program kvrshell\nprocess 1\nuser a b\nhost h\nsince 17\n");
    EXPECT_TRUE(FileLock::Try(Path("river.hdkv"), "second").IsHeld());
    Write(".river.hdkv.lock", std::string(80, '\0')); // the power has gone
    EXPECT_TRUE(FileLock::Try(Path("river.hdkv"), "second").IsHeld());
    // Whatever stands in a lock file that is held, it is shown as one short line.
    Write(".river.hdkv.lock", "user a\x1b[2J" + std::string(5000, 'u') + "\nprocess 99999999999999999999\nsince x\n");
    PlatformFile::Handle file = 0;
    ASSERT_FALSE(PlatformFile::Native().Open(m_folder / ".river.hdkv.lock", PlatformFile::Purpose::Read, file));
    ASSERT_FALSE(PlatformFile::Native().Lock(file));
    const FileLock second = FileLock::Try(Path("river.hdkv"), "second");
    PlatformFile::Native().Close(file);
    ASSERT_TRUE(second.HeldBy());
    const std::string text = HolderText(*second.HeldBy());
    EXPECT_TRUE(text.starts_with("a[2Juuu") && text.size() < 200) << text;
    EXPECT_EQ(HolderText({}), "another program");
    LockHolder atNoTime;
    atNoTime.since = std::numeric_limits<std::int64_t>::max();
    EXPECT_EQ(HolderText(atNoTime), "another program");
}

TEST_F(Locks, AFolderThatTakesNoneSaysWhy)
{
    for (const char* call : {"Open", "Lock", "StatusOf", "Status"}) {
        FaultyPlatform platform;
        platform.fault = [&](const std::string& made) {
            return made == call ? std::make_error_code(std::errc::no_lock_available) : std::error_code();
        };
        const FileLock lock = FileLock::Try(Path("river.hdkv"), "first", &platform);
        EXPECT_FALSE(lock.IsHeld() || lock.HeldBy());
        EXPECT_EQ(lock.WhyNone(), std::errc::no_lock_available) << call;
        const bool isPlaceKnown = call != std::string("Status"); // of the file, which may be a link
        EXPECT_EQ(lock.Path(), isPlaceKnown ? Path(".river.hdkv.lock") : "") << call;
        // What cannot be looked at may be somebody else's.
        EXPECT_EQ(FileCount(), call == std::string("StatusOf")) << call;
        fs::remove(m_folder / ".river.hdkv.lock");
    }
    // A file of the user's that happens to be called so, or has another name besides, is left alone.
    for (const char* theirs : {"what the user wrote", "program for the summer\n", "program a\nprocess 1\nuser\n",
                               "program a\nprocess 1\nuser b\nhost c\nsince then\n",
                               "program a\nprocess 1\nuser b\nhost c\nsince 1\nand more"}) {
        Write(".river.hdkv.lock", theirs);
        EXPECT_EQ(FileLock::Try(Path("river.hdkv"), "first").WhyNone(), std::errc::file_exists);
        EXPECT_EQ(Text(".river.hdkv.lock"), theirs);
    }
    Write(".river.hdkv.lock", "");
    fs::create_hard_link(m_folder / ".river.hdkv.lock", m_folder / "kept");
    EXPECT_EQ(FileLock::Try(Path("river.hdkv"), "first").WhyNone(), std::errc::file_exists);
    EXPECT_EQ(FileCount(), 2u);
    fs::permissions(m_folder / "kept", fs::perms(0600));
    EXPECT_EQ(FileLock::Try(Path("river.hdkv"), "first").Path(), Path(".river.hdkv.lock")) << "it can be named";
    EXPECT_EQ(fs::status(m_folder / "kept").permissions(), fs::perms(0600));
    const FileLock nowhere = FileLock::WaitFor(Path("missing/river.hdkv"), "first", 10s);
    EXPECT_EQ(nowhere.WhyNone(), std::errc::no_such_file_or_directory);
}

// The file goes with each lock: who opened it in between must not take what nobody else sees for the lock.
TEST_F(Locks, OnlyOneHoldsItHoweverTheyComeAndGo)
{
    int holders = 0, most = 0, times = 0; // only ever touched under the lock
    std::atomic<int> without = 0;
    {
        std::vector<std::jthread> threads;
        for (int i = 0; i < 4; ++i)
            threads.emplace_back([&] {
                for (int round = 0; round < 100;) {
                    const FileLock lock = FileLock::Try(Path("a.hdkv"), "thread");
                    if (!lock.IsHeld()) {
                        without += !lock.HeldBy();
                        continue;
                    }
                    most = std::max(most, ++holders);
                    ++times;
                    ++round;
                    --holders;
                }
            });
    }
    EXPECT_EQ(without, 0) << "a lock that is gone is no reason to go on without";
    EXPECT_EQ(most, 1);
    EXPECT_EQ(times, 400);
}
