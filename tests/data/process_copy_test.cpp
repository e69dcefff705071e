#include "files/file_lock.h"
#include "files/platform_process.h"
#include "files/process_copy.h"
#include "test_folder.h"

#include <chrono>
#include <cstdlib>
#include <fstream>
#include <gtest/gtest.h>
#include <new>
#include <optional>
#include <thread>
#ifdef __linux__
#include <poll.h>
#include <sys/wait.h>
#endif

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
    EXPECT_FALSE(copy->Wait().error);
    int seen = 0;
    std::ifstream(result) >> seen;
    EXPECT_EQ(seen, 1);
}

TEST(ProcessCopy, AnswersWhyItFailed)
{
    using Answer = ProcessCopy::Answer;
    const std::string longText(10000, 'x');
    const struct
    {
        std::function<Answer()> work;
        std::errc error;
        std::string text{};
    } cases[] = {
        {[] { return std::make_error_code(std::errc::no_space_on_device); }, std::errc::no_space_on_device},
        {[] { return Answer(std::make_error_code(std::errc::io_error), "in words"); }, std::errc::io_error, "in words"},
        {[&] { return Answer({}, longText); }, std::errc(), longText.substr(0, 4088)},
        {[]() -> Answer { throw std::bad_alloc(); }, std::errc::not_enough_memory},
        {[]() -> Answer { throw 1; }, std::errc::io_error},
        {[]() -> Answer { std::abort(); }, std::errc::interrupted, "Aborted"},
        {[]() -> Answer { std::_Exit(0); }, std::errc::interrupted}};
    for (const auto& [work, error, text] : cases) {
        Result<ProcessCopy> copy = ProcessCopy::Start(work);
        EXPECT_EQ(copy->Wait(5s).error, error);
        EXPECT_EQ(copy->Wait().text, text);
    }
    // One that would never end, and has started something that goes on.
    const auto begin = std::chrono::steady_clock::now();
    EXPECT_EQ(ProcessCopy::Start([]() -> Answer {
                  const auto more = ProcessCopy::Start([]() -> Answer {
                      std::this_thread::sleep_for(3s);
                      return {};
                  });
                  std::this_thread::sleep_for(1h);
                  return {};
              })
                  ->Wait(200ms)
                  .error,
              std::errc::timed_out);
    EXPECT_LT(std::chrono::steady_clock::now() - begin, 2s);
}

#ifdef __linux__
/// A large program's memory goes back to the system after the answer: whoever waits for the end must not wait for that.
TEST(ProcessCopy, HasEndedWhenItIsSaidToHave)
{
    const std::string large(std::size_t(64) << 20, 'x');
    Result<ProcessCopy> copy = ProcessCopy::Start([&] {
        const std::string own = large;
        return ProcessCopy::Answer({}, own.substr(own.size() - 1));
    });
    ASSERT_TRUE(copy);
    pollfd end{.fd = copy->Ended(), .events = POLLIN, .revents = 0};
    ASSERT_EQ(::poll(&end, 1, 10000), 1);
    siginfo_t known{};
    EXPECT_EQ(::waitid(P_ALL, 0, &known, WEXITED | WNOHANG | WNOWAIT), 0);
    EXPECT_NE(known.si_pid, 0);
    EXPECT_EQ(copy->Wait().text, "x");
}
#endif

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

TEST(FileLock, IsHeldUntilTheLastCopyOfADeadProcessHasEnded)
{
    const TestFolder folder;
    const std::string path = folder.Path("session"), go = folder.Path("go");
    const auto take = [&] { return FileLock::Try(path, "test"); };
    const auto hold = [&] { // and die, with a copy still at work
        static std::optional<FileLock> lock;
        static std::optional<ProcessCopy> copy;
        lock = take();
        lock->ShareWithCopies();
        copy = std::move(ProcessCopy::Start([&] {
                             Comes([&] { return Exists(go); });
                             return std::error_code();
                         }).value());
        return std::error_code();
    };
    EXPECT_FALSE(ProcessCopy::Start(hold)->Wait().error);
    ASSERT_TRUE(take().HeldBy());
    EXPECT_TRUE(HasEnded(take().HeldBy()->process));
    Mark(go, 0);
    EXPECT_TRUE(Comes([&] { return take().IsHeld(); }));
    const FileLock own = take();
    ASSERT_TRUE(own.IsHeld() && take().HeldBy());
    EXPECT_FALSE(HasEnded(take().HeldBy()->process));
}
