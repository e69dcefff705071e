#include "ks/fc/branch_name.h"

#include "files/branch_key.h"

#include <algorithm>

CString KsBranchKey(const CString& name)
{
    return QString::fromStdString(BranchKey(name.toStdString()));
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
