// Reading and writing of a location record by its family's field list.
#pragma once

#include "data/river_pos.h"

void WriteRecord(tqlHandle structure, const HD_RiverPos& record, FieldList fields);
void ReadRecord(tqlHandle keyword, LoadReport* report, HD_RiverPos& record, FieldList fields);

/// Parameters 1 and 2 of every record: branch name and chainage.
FieldList LocationFields();

/// Base of the families: `T::DeclaredFields()` lists the fields behind branch name and chainage.
template <typename T>
class HDRecord : public HD_RiverPos
{
public:
    void Save(tqlHandle structure) const override { WriteRecord(structure, *this, T::DeclaredFields()); }
    void Load(tqlHandle keyword, LoadReport* report = nullptr) override
    {
        ReadRecord(keyword, report, *this, T::DeclaredFields());
    }
    FieldList Fields() const override { return T::DeclaredFields(); }
};
