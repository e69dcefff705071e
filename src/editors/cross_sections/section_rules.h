// What a cross section has to fulfil, in a file as in the tables.
#pragma once

#include "editors/cross_sections/section.h"

/// What is wrong with a section.
struct CSectionFault
{
    QString text{};                // for the user: a sentence that says what was expected; empty for nothing
    std::string_view keyword = {}; // of the file, where it stands
    int point = -1;                // or this point
};

/// What is expected instead of such a fault.
QString SectionRule(CSectionFault::Field field);
CSectionFault FindFault(const CCrossSection& section);
/// That there is such a section already.
QString WhyTaken(const CCrossSection& section);
