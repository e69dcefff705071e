// What the list of problems asks of a document's view.
#pragma once

#include "rules/problem.h"
#include "rules/river.h"

#include <QString>
#include <memory>
#include <vector>

struct HD_Parameters;

/// Where a problem is, as the user calls it.
struct ProblemWhere
{
    int tab = -1; // of the page; -1 where no page shows the value
    QString page{}, line{}, field{};
};

/// Something that was not taken from the file as it stands there.
struct FileProblem
{
    RuleId rule{};
    QString text{};
    ProblemWhere where{}; // in the file
};

class IProblemHost
{
public:
    virtual ~IProblemHost() = default;
    virtual const HD_Parameters& CheckedParameters() const = 0;
    virtual QString CheckedTitle() const = 0;
    /// Of the file; empty for a document that has never been saved.
    virtual QString CheckedPath() const = 0;
    /// The branches of the project's network; null outside a project, and in one without a network.
    virtual std::shared_ptr<const CRiver> CheckedRiver() = 0;
    /// Of each problem, in their order.
    virtual std::vector<ProblemWhere> WhereAre(const std::vector<Problem>& problems) const = 0;
    /// Brings the place into view, for editing. Does nothing when what is being typed may not be left.
    virtual void ShowProblem(const ProblemPlace& place) = 0;
    /// Those that the document has had since its file was read; none after a save.
    virtual std::vector<FileProblem> FileProblems() const = 0;
    /// Shows them with all that is known.
    virtual void ShowFileProblems() = 0;
    /// Carries out the rule's remedy as one step to undo. The user is told when it could not be.
    virtual void Mend(const Problem& problem) = 0;
};
