// What the branches of a network have to fulfil, in a file as in the tables.
#pragma once

#include "editors/network/network.h"

#include <QString>
#include <unordered_map>
#include <unordered_set>

/// Keys of names. Unlike a set of Qt it stands it when memory ends while a network is loaded.
using CBranchKeys = std::unordered_set<QString>;

/// What is wrong with a branch.
struct CBranchFault
{
    enum Rule
    {
        None,
        Named,
        OneOfAName,
        EndsDiffer
    };
    Rule rule = None; // that is broken
    QString name{};   // of the branch

    /// For the user: a sentence that says what was expected.
    QString Text() const;
};

/// `taken`: the keys of the names of other branches.
CBranchFault FindFault(const CNetworkBranch& branch, const CBranchKeys& taken);

/// Names for the branches that a network gets.
class CBranchNames
{
public:
    /// None is to be like one that the network has.
    explicit CBranchNames(const CNetwork& network);
    /// `wanted` or, where that is taken, `numbered` of it and the first free number from 2 on. It is taken from now on.
    QString Take(const QString& wanted, const QString& numbered);

private:
    CBranchKeys m_taken;
    std::unordered_map<QString, int>
        m_numbers; // the last one that was tried, by the key of what was wanted: many may want the same
};
