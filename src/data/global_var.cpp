#include "data/global_var.h"

#include "files/field_io.h"

void HD_Global_Var::Load(tqlHandle target, LoadReport* report)
{
    ReadDeclared(target, HDGlobals(), this, report);
    const tqlHandle section = tqlSectionByNameNum(tqlSectionByNameNum(target, HDGlobals().name, 1), HDMarkSection, 1);
    const tqlHandle flags = tqlKeywordByNameNum(section, HDMarkFlags, 1);
    if (!report || !flags || MarkInterpolate.size() <= MarkTitles.size())
        return;
    report->InSection(HDMarkSection);
    report->Add(flags, flags,
                {.kind = Finding::SurplusFlags,
                 .behind = int(MarkTitles.size()),
                 .found = std::string(tqlGetRawParams(flags)),
                 .used = std::to_string(MarkTitles.size())});
}

void HD_Global_Var::Save(tqlHandle structure) const
{
    if (MarkInterpolate.size() == MarkTitles.size())
        return WriteDeclared(structure, HDGlobals(), this);
    HD_Global_Var even(*this);
    even.MarkInterpolate.resize(MarkTitles.size());
    WriteDeclared(structure, HDGlobals(), &even);
}
