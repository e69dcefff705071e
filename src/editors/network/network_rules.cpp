#include "editors/network/network_rules.h"

#include "ks/fc/branch_name.h"

#include <QCoreApplication>
#include <algorithm>

namespace {

struct NetworkRules
{
    Q_DECLARE_TR_FUNCTIONS(NetworkRules)
};

} // namespace

QString CBranchFault::Text() const
{
    switch (rule) {
    case Named:
        return NetworkRules::tr("a branch needs a name.");
    case OneOfAName:
        return NetworkRules::tr("there is a branch \"%1\" already.").arg(name);
    case EndsDiffer:
        return NetworkRules::tr("the chainages of the two ends of a branch have to differ.");
    default:
        return {};
    }
}

CBranchFault FindFault(const CNetworkBranch& branch, const CBranchKeys& taken)
{
    const QString name = branch.Name(), key = KsBranchKey(name);
    if (key.isEmpty())
        return {CBranchFault::Named, name};
    if (taken.contains(key))
        return {CBranchFault::OneOfAName, name};
    return {branch.start == branch.end ? CBranchFault::EndsDiffer : CBranchFault::None, name};
}

CBranchNames::CBranchNames(const CNetwork& network)
{
    m_taken.reserve(network.branches.size());
    for (const CNetworkBranch& branch : network.branches)
        m_taken.insert(KsBranchKey(branch.Name()));
}

QString CBranchNames::Take(const QString& wanted, const QString& numbered)
{
    QString name = wanted, key = KsBranchKey(wanted);
    if (m_taken.contains(key)) {
        int& number = m_numbers[key];
        number = std::max(number, 1);
        do {
            name = numbered.arg(wanted, QString::number(++number));
            key = KsBranchKey(name);
        } while (m_taken.contains(key));
    }
    m_taken.insert(key);
    return name;
}
