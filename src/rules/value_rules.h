// What a value must keep to by itself: its range, its choices, what a river may have.
#pragma once

#include "rules/plausible.h"
#include "rules/problem.h"

#include <functional>

class CValueRules
{
public:
    /// Of the fields of a list's records, or of those of a section of global values. The global values tell what is
    /// plausible; they must live as long.
    CValueRules(std::string_view section, FieldList fields, const HD_Global_Var& global);

    /// Reports what is wrong with the values of an object that has these fields. `place` says where it stands.
    void Check(const void* object, const ProblemPlace& place, CProblems& problems) const;

private:
    struct Rule
    {
        const Field* field;
        const Field* group; // whose elements have the field; null for the object's own
        std::vector<Plausible> plausible;
        std::int32_t choices; // how many there are; 0 for a field without
    };
    void Add(std::string_view section, const Field& field, const Field* group, const HD_Global_Var& global);
    static void CheckOne(const Rule& rule, const void* object, ProblemPlace place, CProblems& problems);
    static void CheckNumber(const Rule& rule, double value, const ProblemPlace& place, CProblems& problems);

    std::vector<Rule> m_rules; // of those fields that have any
};
