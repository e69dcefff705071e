// The tables that exchange locations with other editors, by type code.
#pragma once

#include "data/hd_parameters.h"
#include "ks/fc/exchange.h"
#include "res/strings.h"

#include <span>

struct HDDataTable
{
    CGenList& (*list)(HD_Parameters& parameters);
    int tab;                         // place on the sheet, from 0, that a request switches to
    Str inserted, deleted, selected; // said when the page in front cannot be left
    /// The second value of a record's item; null where items have none.
    double (*second)(const HD_RiverPos& record);
    /// What a new line takes from the global values and the item, beside branch and chainage; null for the family's
    /// own defaults.
    void (*fill)(HD_RiverPos& record, const HD_Global_Var& globals, const CKvr_CBE_ModelDataItem& item);
};

/// A row for each HDDataType, in that order.
std::span<const HDDataTable> HDDataTables();
/// Null for a type that there is no table for.
const HDDataTable* FindDataTable(int type);
