#include "editors/network/network.h"

#include "editors/network/measured_line.h"
#include "ks/fc/branch_name.h"

#include <algorithm>
#include <cmath>

double CNetworkBranch::Length() const
{
    return LengthOf(line);
}

void CNetworkBranch::SortChannel()
{
    std::ranges::stable_sort(channel, {}, &CChannelRow::chainage);
}

int CNetwork::FindBranch(const QString& name) const
{
    const auto isIt = [&name](const auto& each) { return KsSameBranch(each.Name(), name); };
    const auto found = std::find_if(branches.begin(), branches.end(), isIt);
    return found == branches.end() ? -1 : int(found - branches.begin());
}

QRectF CNetwork::Extent() const
{
    CExtent around;
    for (const CNetworkBranch& branch : branches)
        around.Add(branch.line);
    return around.Box();
}

double ChannelValue(const std::vector<CChannelRow>& channel, double CChannelRow::*value, double chainage)
{
    const CChannelRow* before = nullptr;
    for (const CChannelRow& row : channel) {
        if (std::isnan(row.*value))
            continue;
        if (row.chainage == chainage)
            return row.*value;
        if (row.chainage > chainage) {
            if (!before)
                return KsUnset;
            const double part = (chainage - before->chainage) / (row.chainage - before->chainage);
            return std::lerp(before->*value, row.*value, part);
        }
        before = &row;
    }
    return KsUnset;
}
