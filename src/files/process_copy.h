// Work on everything as it is at this moment, done while the program goes on and changes it.
#pragma once

#include "base/result.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <string>

/// A copy of this process that does one piece of work and ends: it has all memory as it was when it was started, which
/// the system shares until one of both writes to it. The copy has one thread, no connection to the display, and runs no
/// destructors but those of the work: the work computes and writes files, and asks nothing of the user interface.
///
/// Where a system has no such copies the work is done before Start returns.
class ProcessCopy
{
public:
    /// What the work came to: why it failed, as a system error, and words of its own.
    struct Answer
    {
        Answer(std::error_code failure = {}, std::string words = {}) : error(failure), text(std::move(words)) {}
        std::error_code error; // interrupted: the copy ended before the work did; `text` is by which signal, if any
        std::string text;      // cut where it is longer than a few thousand bytes
    };
    enum class Pace
    {
        Aside, // slower than the program: the user comes first
        Awaited
    };
    static Result<ProcessCopy> Start(const std::function<Answer()>& work, Pace pace = Pace::Aside);
    /// Whether this process is such a copy.
    static bool IsThis();
    ProcessCopy(ProcessCopy&& other) noexcept { *this = std::move(other); }
    ProcessCopy& operator=(ProcessCopy&& other) noexcept
    {
        std::swap(m_process, other.m_process);
        std::swap(m_letter, other.m_letter);
        std::swap(m_ended, other.m_ended);
        std::swap(m_answer, other.m_answer);
        return *this;
    }
    ~ProcessCopy(); // stops it

    /// A descriptor that can be read when the copy has ended, and Wait does not wait any more; where the system does not
    /// tell, when it is about to end. -1 when its end is known.
    int Ended() const { return m_ended; }
    /// Ends the copy whatever it is doing. What it was just doing may still come to its end until Wait returns.
    void Stop();
    /// Waits until the copy has ended.
    const Answer& Wait();
    /// Waits for at most so long, and stops it then, with the answer timed_out.
    const Answer& Wait(std::chrono::milliseconds longest);

private:
    ProcessCopy() = default;

    std::intptr_t m_process = -1;
    int m_letter = -1; // where the answer comes from
    int m_ended = -1;  // the same where the system has nothing better
    Answer m_answer;
};
