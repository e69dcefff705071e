#include "files/field.h"

#include <chrono>
#include <ctime>

namespace {

thread_local const HDDateTime* dateOfObjects = nullptr; // of the innermost one

} // namespace

DatedObjects::DatedObjects(const HDDateTime& date) : m_before(dateOfObjects), m_date(date)
{
    dateOfObjects = &m_date;
}

DatedObjects::~DatedObjects()
{
    dateOfObjects = m_before;
}

HDDateTime HDDateTime::Now()
{
    if (dateOfObjects)
        return *dateOfObjects;
    const std::time_t now = std::time(nullptr);
    const std::tm* const local = std::localtime(&now);
    if (!local)
        return {};
    return {local->tm_year + 1900, local->tm_mon + 1, local->tm_mday, local->tm_hour, local->tm_min, local->tm_sec};
}

bool HDDateTime::IsValid() const
{
    namespace ch = std::chrono;
    if (Year < 100 || Year > 9999 || Month < 1 || Month > 12 || Day < 1 || Day > 31)
        return false; // also keeps the calendar types inside the ranges that they define
    const ch::year_month_day date{ch::year(Year), ch::month(unsigned(Month)), ch::day(unsigned(Day))};
    return date.ok() && Hour >= 0 && Hour <= 23 && Minute >= 0 && Minute <= 59 && Second >= 0 && Second <= 59;
}
