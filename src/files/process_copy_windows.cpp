#include "files/process_copy.h"

Result<ProcessCopy> ProcessCopy::Start(const std::function<std::error_code()>& work)
{
    ProcessCopy copy;
    copy.m_answer = work(); // the system has no copies of a process
    return copy;
}

ProcessCopy::~ProcessCopy() = default;

void ProcessCopy::Stop() {}

std::error_code ProcessCopy::Wait()
{
    return m_answer;
}
