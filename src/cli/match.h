#pragma once

#include <algorithm>
#include <string_view>

/// Names of sections and keywords are ASCII.
inline bool SameIgnoringCase(std::string_view a, std::string_view b)
{
    const auto lower = [](char c) { return c >= 'A' && c <= 'Z' ? char(c - 'A' + 'a') : c; };
    return std::ranges::equal(a, b, {}, lower, lower);
}
