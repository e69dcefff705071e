// The texts of the list of problems, in the user's language.
#pragma once

#include "rules/problem.h"

#include <QCoreApplication>
#include <QIcon>

class ProblemTexts
{
    Q_DECLARE_TR_FUNCTIONS(ProblemTexts)
public:
    static QString TitleOf(RuleId rule);
    static QString ExplanationOf(RuleId rule);
    static QString NameOf(Severity severity);
    /// "2 errors".
    static QString CountOf(Severity severity, std::size_t count);
    /// What to call the fix; empty for none.
    static QString NameOf(Remedy remedy);
    /// What is wrong at the place, with the numbers in the user's units.
    static QString TextOf(const Problem& problem);

    static QIcon IconOf(Severity severity);
};
