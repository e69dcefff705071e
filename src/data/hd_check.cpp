#include "data/hd_check.h"

#include "data/hd_parameters.h"

std::vector<Finding> CheckHDStructure(tqlHandle structure)
{
    LoadReport report(structure, LoadReport::Wanted::Everything);
    HD_Parameters{}.Load(structure, &report);
    return report.Take();
}
