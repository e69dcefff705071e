// Joins the parts of a line that meet end to end.
#pragma once

#include "editors/network/gis_lines.h"

struct CJoinedLine
{
    CGisLine line;
    int parts = 0;  // that it is made of
    int turned = 0; // how many of them run the other way
};

/// Parts meet where two of their ends, and no third one, are at the same place. A joined line runs as its first part in
/// the order given.
std::vector<CJoinedLine> JoinLines(const std::vector<CGisLine>& parts);
