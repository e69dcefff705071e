#include "ks/fc/branch_name.h"

#include <algorithm>

namespace {

bool IsDirectionMark(QChar c)
{
    return c == u'\u200E' || c == u'\u200F' || (c >= u'\u202A' && c <= u'\u202E') || (c >= u'\u2066' && c <= u'\u2069');
}

} // namespace

CString KsBranchKey(const CString& name)
{
    CString key = name;
    key.removeIf(IsDirectionMark);
    return key.trimmed().toUpper();
}

bool KsSameBranch(const CString& a, const CString& b)
{
    // Most names differ in plain letters or digits, which is told without making their keys.
    const auto [left, right] = std::mismatch(a.begin(), a.end(), b.begin(), b.end());
    const auto isPlain = [](QChar c) { return c > u' ' && c < u'\x80'; };
    if (left != a.end() && right != b.end() && isPlain(*left) && isPlain(*right) && left->toUpper() != right->toUpper())
        return false;
    return KsBranchKey(a) == KsBranchKey(b);
}
