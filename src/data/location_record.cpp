#include "data/location_record.h"

#include "files/field_io.h"

void WriteRecord(tqlHandle structure, const HD_RiverPos& record, FieldList fields)
{
    tqlAddKeyword(structure, RecordKeyword);
    tqlAddString(structure, record.RiverName);
    tqlAddDouble(structure, record.Chainage);
    WriteFields(structure, fields, &record);
    record.Extra.Write(structure);
}

void ReadRecord(tqlHandle keyword, LoadReport* report, HD_RiverPos& record, FieldList fields)
{
    ParamCursor params(keyword, report);
    if (ReadFields(params, LocationFields(), &record))
        ReadFields(params, fields, &record);
    ReadExtra(params, record.Extra);
}
