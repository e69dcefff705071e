// The one walker over declared fields: keyword parameters into an object and back, and objects with one another.
#pragma once

#include "files/field.h"
#include "files/finding.h"
#include "tql/tql.h"

/// Number of file parameters of one element of a group (elements hold no groups).
std::size_t ParamsOf(FieldList fields);

/// Whether `count` elements of a group fit into the parameters that are left in its keyword.
bool CountFits(FieldList elements, std::int32_t count, int paramsLeft);

/// Walks the parameters of one keyword.
struct ParamCursor
{
    tqlHandle keyword;
    tqlHandle param; // null behind the last
    int number = 1;
    int count;
    LoadReport* report;      // may be null
    bool onlyFinite = false; // numbers have to be some, unless their field may be unknown

    explicit ParamCursor(tqlHandle itsKeyword, LoadReport* itsReport = nullptr)
        : keyword(itsKeyword), param(tqlParamByNum(keyword, 1)), count(tqlGetNoParams(keyword)), report(itsReport)
    {
    }
    int Left() const { return count - number + 1; }
    /// Reads the parameter and goes to the next; false, and the value untouched, when it is of another type.
    template <typename Value>
    bool Take(Value* value)
    {
        ++number;
        return tqlTake(&param, value);
    }
    void Next()
    {
        param = tqlNextParam(param);
        ++number;
    }
    void ToEnd()
    {
        param = nullptr;
        number = count + 1;
    }
};

/// Reads parameters into the object and leaves the cursor behind them. A value of another type whose meaning is beyond
/// doubt is taken: 2.0 where an integer is expected, 1 for true. What is missing or of another type otherwise keeps its
/// value. A group whose count does not fit the parameters that are there keeps its elements, and nothing behind it can
/// be told apart, so reading ends. All of this is reported. False when parameters were missing.
bool ReadFields(ParamCursor& params, FieldList fields, void* object);
/// Parameters behind those that were read stay with their object; that is reported, too.
void ReadExtra(ParamCursor& params, ExtraParams& extra);

/// The object's parameters in file notation.
std::string ParamsText(FieldList fields, const void* object);

/// Appends the object's parameters to the keyword being written.
void WriteFields(tqlHandle structure, FieldList fields, const void* object);

/// "2024-02-29 23:59:00"; whatever the six integers are, a date or not.
std::string DateText(const HDDateTime& date);

/// "0.5 to 1", "at least 0", "at most 1", in base units; empty without bounds.
std::string BoundsWords(const Bounds& bounds);

/// Whether all fields are equal, numbers to the last bit.
bool SameFields(FieldList fields, const void* a, const void* b);
