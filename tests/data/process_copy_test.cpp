#include "files/private_folder.h"
#include "files/process_copy.h"
#include "test_folder.h"

#include <chrono>
#include <fstream>
#include <gtest/gtest.h>
#include <new>
#include <thread>

namespace {

using namespace std::chrono_literals;

/// Until something holds, for at most five seconds.
template <typename Met>
bool Comes(Met met)
{
    for (const auto end = std::chrono::steady_clock::now() + 5s; std::chrono::steady_clock::now() < end;
         std::this_thread::sleep_for(5ms))
        if (met())
            return true;
    return false;
}

bool Exists(const std::string& path)
{
    return std::filesystem::exists(path);
}

std::error_code Mark(const std::string& path, int value)
{
    std::ofstream(path) << value;
    return {};
}

} // namespace

TEST(ProcessCopy, WorksOnWhatWasWhileTheProcessGoesOn)
{
    const TestFolder folder;
    const std::string go = folder.Path("go"), result = folder.Path("result");
    int value = 1;
    Result<ProcessCopy> copy = ProcessCopy::Start([&] {
        const bool told = Comes([&] { return Exists(go); });
        return told ? Mark(result, value) : std::make_error_code(std::errc::timed_out);
    });
    ASSERT_TRUE(copy);
    value = 2;
    Mark(go, 0);
    EXPECT_FALSE(copy->Wait());
    int seen = 0;
    std::ifstream(result) >> seen;
    EXPECT_EQ(seen, 1);
}

TEST(ProcessCopy, AnswersWhyItFailed)
{
    const std::pair<std::function<std::error_code()>, std::errc> cases[] = {
        {[] { return std::make_error_code(std::errc::no_space_on_device); }, std::errc::no_space_on_device},
        {[]() -> std::error_code { throw std::bad_alloc(); }, std::errc::not_enough_memory},
        {[]() -> std::error_code { throw 1; }, std::errc::io_error},
        {[]() -> std::error_code { std::abort(); }, std::errc::interrupted}};
    for (const auto& [work, answer] : cases)
        EXPECT_EQ(ProcessCopy::Start(work)->Wait(), answer);
}

TEST(ProcessCopy, StopsAtOnceAndNothingOfItComesLater)
{
    const TestFolder folder;
    const std::string started = folder.Path("started"), late = folder.Path("late");
    {
        const Result<ProcessCopy> copy = ProcessCopy::Start([&] {
            Mark(started, 0);
            std::this_thread::sleep_for(200ms);
            return Mark(late, 0);
        });
        ASSERT_TRUE(Comes([&] { return Exists(started); }));
    }
    std::this_thread::sleep_for(400ms);
    EXPECT_FALSE(Exists(late));
}

TEST(ProcessLock, IsHeldUntilTheLastCopyOfADeadProcessHasEnded)
{
    const TestFolder folder;
    const std::string path = folder.Path("lock"), go = folder.Path("go");
    const auto hold = [&] { // and die, with a copy still at work
        static std::optional<ProcessLock> lock;
        static std::optional<ProcessCopy> copy;
        lock = std::move(ProcessLock::Take(path).value());
        copy = std::move(ProcessCopy::Start([&] {
                             Comes([&] { return Exists(go); });
                             return std::error_code();
                         }).value());
        return std::error_code();
    };
    EXPECT_FALSE(ProcessCopy::Start(hold)->Wait());
    EXPECT_EQ(ProcessLock::Take(path).error().code, std::errc::device_or_resource_busy);
    EXPECT_TRUE(ProcessLock::IsOrphan(path));
    Mark(go, 0);
    EXPECT_TRUE(Comes([&] { return bool(ProcessLock::Take(path)); }));
    const Result<ProcessLock> own = ProcessLock::Take(path);
    ASSERT_TRUE(own);
    EXPECT_FALSE(ProcessLock::IsOrphan(path));
    EXPECT_EQ(ProcessLock::Take(path).error().code, std::errc::device_or_resource_busy);
}
