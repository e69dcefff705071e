// What a cross section has to fulfil, in a file as in the tables.
#pragma once

#include "editors/cross_sections/section.h"

/// What is wrong with a section.
struct CSectionFault
{
    enum Field
    {
        Nothing,
        Branch,
        Width,
        Point
    };
    Field field = Nothing;
    int point = -1; // of Field::Point
    QString text{}; // for the user: a sentence that says what was expected
};

/// What is expected instead of such a fault.
QString SectionRule(CSectionFault::Field field);
CSectionFault FindFault(const CCrossSection& section);
/// That there is such a section already.
QString WhyTaken(const CCrossSection& section);
