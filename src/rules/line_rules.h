// What the values of one line have to do with one another, list by list.
#pragma once

#include "data/hd_parameters.h"
#include "rules/problem.h"

/// The rules of a list of the file by its section; null for one without any.
using LineRules = void (*)(const HD_RiverPos& record, const ProblemPlace& place, CProblems& problems);
LineRules LineRulesOf(std::string_view section);

/// Of a least and a greatest resistance, and of a table of resistances over velocity.
void CheckToolbox(double least, const Field& leastField, double greatest, const std::vector<CBRTVeloRes>& table,
                  const Field& tableField, const ProblemPlace& place, CProblems& problems);
/// Of the levels of two layers.
void CheckLayers(double level, double interface, const Field& interfaceField, const ProblemPlace& place,
                 CProblems& problems);
