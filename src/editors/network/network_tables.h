// The tables beside the map: the branches, and the channel of one of them.
#pragma once

#include "grid/row_source.h"

class CGridModel;
class CNetworkDoc;

enum BranchColumn
{
    BranchName,
    BranchFrom,
    BranchTo,
    BranchVertices,
    BranchFlow
};
enum ChannelColumn
{
    ChannelChainage,
    ChannelRadius,
    ChannelWidth
};

/// Branches come by import only.
std::shared_ptr<IRowSource> MakeBranchRows(CNetworkDoc& document);
/// Sorted by chainage. Null for an index that there is no branch for.
std::shared_ptr<IRowSource> MakeChannelRows(CNetworkDoc& document, int branch);
void AddBranchColumns(CGridModel& model);
void AddChannelColumns(CGridModel& model);
