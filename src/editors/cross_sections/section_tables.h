// The tables beside the plot: the cross sections, and the points of one of them.
#pragma once

#include "editors/cross_sections/section.h"
#include "grid/row_source.h"

class CCrossSectionDoc;
class CGridModel;

enum SectionColumn
{
    SectionBranch,
    SectionChainage,
    SectionRadius,
    SectionWidth,
    SectionTopoId
};
enum PointColumn
{
    PointOffset,
    PointLevel
};

std::shared_ptr<IRowSource> MakeSectionRows(CCrossSectionDoc& document);
/// Null for an index that there is no section for.
std::shared_ptr<IRowSource> MakePointRows(CCrossSectionDoc& document, int section);
/// What the tables call a value of a point.
QString TitleOf(double CSectionPoint::*value);
void AddSectionColumns(CGridModel& model);
void AddPointColumns(CGridModel& model);
