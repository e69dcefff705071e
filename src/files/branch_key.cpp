#include "files/branch_key.h"

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <memory>
#include <unicase.h>
#include <unictype.h>
#include <unistr.h>

namespace {

bool IsPlain(std::string_view name)
{
    return std::ranges::all_of(name, [](char c) { return c >= '\0'; });
}

std::string PlainKey(std::string_view name)
{
    const auto isBlank = [](char c) { return c == ' ' || (c >= '\t' && c <= '\r'); };
    while (!name.empty() && isBlank(name.front()))
        name.remove_prefix(1);
    while (!name.empty() && isBlank(name.back()))
        name.remove_suffix(1);
    std::string key(name);
    for (char& c : key)
        if (c >= 'a' && c <= 'z')
            c = char(c - 'a' + 'A');
    return key;
}

const std::uint8_t* Bytes(std::string_view text)
{
    return reinterpret_cast<const std::uint8_t*>(text.data());
}

/// Without blanks around it and characters of no width.
std::string Bare(std::string_view name)
{
    std::string bare;
    std::size_t end = 0; // behind the last that is no blank
    while (!name.empty()) {
        ucs4_t code = 0;
        const int length = u8_mbtouc(&code, Bytes(name), name.size());
        const bool isBlank = uc_is_property_white_space(code);
        if (!HasNoWidth(code) && !(isBlank && bare.empty()))
            bare.append(name, 0, std::size_t(length));
        if (!isBlank && !HasNoWidth(code))
            end = bare.size();
        name.remove_prefix(std::size_t(length));
    }
    bare.resize(end);
    return bare;
}

} // namespace

std::string BranchKey(std::string_view name)
{
    if (IsPlain(name))
        return PlainKey(name);
    if (u8_check(Bytes(name), name.size()))
        return std::string(name);
    const std::string bare = Bare(name);
    std::size_t length = 0;
    const std::unique_ptr<std::uint8_t, decltype(&std::free)> upper(
        u8_toupper(Bytes(bare), bare.size(), nullptr, nullptr, nullptr, &length), &std::free);
    return upper ? std::string(reinterpret_cast<const char*>(upper.get()), length) : bare;
}
