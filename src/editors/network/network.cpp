#include "editors/network/network.h"

#include "ks/fc/branch_name.h"

#include <algorithm>
#include <cmath>

double CNetworkBranch::Length() const
{
    double length = 0;
    for (std::size_t i = 1; i < line.size(); ++i)
        length += std::hypot(line[i].x() - line[i - 1].x(), line[i].y() - line[i - 1].y());
    return length;
}

void CNetworkBranch::SortChannel()
{
    std::stable_sort(channel.begin(), channel.end(),
                     [](const CChannelRow& a, const CChannelRow& b) { return a.chainage < b.chainage; });
}

int CNetwork::FindBranch(const QString& name) const
{
    const auto isIt = [wanted = name.toStdString()](const auto& each) { return KsSameBranch(each.name, wanted); };
    const auto found = std::find_if(branches.begin(), branches.end(), isIt);
    return found == branches.end() ? -1 : int(found - branches.begin());
}

QRectF CNetwork::Extent() const
{
    double left = HUGE_VAL, top = HUGE_VAL, right = -HUGE_VAL, bottom = -HUGE_VAL;
    for (const CNetworkBranch& branch : branches) {
        for (const QPointF& at : branch.line) {
            left = std::min(left, at.x());
            right = std::max(right, at.x());
            top = std::min(top, at.y());
            bottom = std::max(bottom, at.y());
        }
    }
    return left > right ? QRectF() : QRectF(QPointF(left, top), QPointF(right, bottom));
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
