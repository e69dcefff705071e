// The base of every record that is tied to a location in the river network.
#pragma once

#include "base/not_given.h"
#include "files/extra_params.h"
#include "files/field.h"
#include "tql/tql.h"

#include <memory>
#include <string>

class LoadReport;

/// The keyword of a record in its list's section.
inline constexpr const char* RecordKeyword = "DATA";

class HD_RiverPos
{
public:
    using PassedAs = HD_RiverPos; // as lists and rows know all families

    std::string RiverName;      // branch name
    double Chainage = NotGiven; // position along the branch, metres
    ExtraParams Extra;          // what the file holds behind the family's parameters

    HD_RiverPos() = default;
    HD_RiverPos(const HD_RiverPos&) = default;
    HD_RiverPos& operator=(const HD_RiverPos&) = default;
    virtual ~HD_RiverPos() = default;

    /// Appends this record to the file being written, as one keyword "DATA" in the current section.
    virtual void Save(tqlHandle /*structure*/) const {}
    /// Reads this record from one keyword "DATA" by parameter number; what is not there keeps its value.
    virtual void Load(tqlHandle /*keyword*/, LoadReport* /*report*/ = nullptr) {}
    /// The fields after RiverName and Chainage, in file order.
    virtual FieldList Fields() const { return {}; }

    /// No branch name, or no chainage: the line is incomplete.
    bool IsBlank() const { return RiverName.empty() || Chainage == NotGiven; }
};
