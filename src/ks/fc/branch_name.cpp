#include "ks/fc/branch_name.h"

#include <QStringView>
#include <algorithm>
#include <optional>

namespace {

/// Of two letters at the same place: whether their capitals are the same, as far as that needs no table.
template <typename Letter>
std::optional<bool> SameCapital(Letter a, Letter b)
{
    if (a == b)
        return true;
    const auto isAscii = [](Letter c) { return c < 0x80; };
    if (!isAscii(a) || !isAscii(b))
        return std::nullopt; // "ss" is the capital of a single letter, too
    const auto capital = [](Letter c) { return c >= 'a' && c <= 'z' ? Letter(c - 'a' + 'A') : c; };
    return capital(a) == capital(b);
}

/// Most names differ early or are spelt alike: that is told without making their keys. Nothing when it is not enough.
template <typename Letter, typename Text>
std::optional<bool> SameAtSight(const Text& a, const Text& b)
{
    const auto common = std::min(a.size(), b.size());
    for (decltype(a.size()) i = 0; i < common; ++i) {
        const auto same = SameCapital(Letter(a[i]), Letter(b[i]));
        if (!same || !*same)
            return same;
    }
    return a.size() == b.size();
}

} // namespace

CString KsBranchKey(const CString& name)
{
    return name.toUpper();
}

bool KsSameBranch(const CString& a, const CString& b)
{
    const std::u16string_view first(QStringView(a).utf16(), std::size_t(a.size()));
    const std::u16string_view second(QStringView(b).utf16(), std::size_t(b.size()));
    const auto same = SameAtSight<char16_t>(first, second);
    return same ? *same : KsBranchKey(a) == KsBranchKey(b);
}

bool KsSameBranch(std::string_view a, std::string_view b)
{
    const auto same = SameAtSight<unsigned char>(a, b);
    const auto text = [](std::string_view name) { return CString::fromUtf8(name.data(), qsizetype(name.size())); };
    return same ? *same : KsBranchKey(text(a)) == KsBranchKey(text(b));
}
