#include "editors/common/branch_names.h"

#include "ks/fc/branch_name.h"
#include "ks/fc/exchange.h"

#include <QSet>

void AppendBranchNames(const QStringList& branches, CObList& objects)
{
    QSet<QString> known;
    for (const auto& object : objects) {
        if (const auto* item = dynamic_cast<const CKvrCBEText*>(object.get()))
            known << KsBranchKey(item->text);
    }
    for (const QString& branch : branches) {
        const QString key = KsBranchKey(branch);
        if (known.contains(key))
            continue;
        known << key;
        auto item = std::make_unique<CKvrCBEText>();
        item->text = branch;
        objects.push_back(std::move(item));
    }
}
