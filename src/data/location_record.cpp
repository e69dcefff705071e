#include "data/location_record.h"

#include "data/field_io.h"

void WriteRecord(tqlHandle structure, const HD_RiverPos& record, FieldList fields)
{
    tqlAddKeyword(structure, "DATA");
    tqlAddString(structure, record.RiverName);
    tqlAddDouble(structure, record.Chainage);
    WriteFields(structure, fields, &record);
    record.Extra.Write(structure);
}

void ReadRecord(tqlHandle keyword, HD_RiverPos& record, FieldList fields)
{
    tqlGetString(tqlParamByNum(keyword, 1), &record.RiverName);
    tqlGetDouble(tqlParamByNum(keyword, 2), &record.Chainage);
    const int count = tqlGetNoParams(keyword);
    const int next = ReadFields(keyword, 3, count, fields, &record);
    record.Extra.Read(keyword, next, count);
}

FieldList LocationFields()
{
    static constexpr Field fields[] = {Text<&HD_RiverPos::RiverName>("RiverName"),
                                       Number<&HD_RiverPos::Chainage>("Chainage", UnitGroup::Chainage)};
    return fields;
}
