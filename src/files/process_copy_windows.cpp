#include "files/process_copy.h"

Result<ProcessCopy> ProcessCopy::Start(const std::function<Answer()>& work, Pace)
{
    ProcessCopy copy;
    copy.m_answer = work(); // the system has no copies of a process
    return copy;
}

bool ProcessCopy::IsThis()
{
    return false;
}

ProcessCopy::~ProcessCopy() = default;

void ProcessCopy::Stop() {}

const ProcessCopy::Answer& ProcessCopy::Wait()
{
    return m_answer;
}

const ProcessCopy::Answer& ProcessCopy::Wait(std::chrono::milliseconds)
{
    return m_answer;
}
