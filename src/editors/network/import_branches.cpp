#include "editors/network/import_branches.h"

#include "ks/fc/branch_name.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QLibrary>
#include <QSet>
#include <cmath>
#include <optional>

namespace {

struct ImportBranches
{
    Q_DECLARE_TR_FUNCTIONS(ImportBranches)
};

// How such fields are called, in the order of preference.
const QStringList& NameFields()
{
    static const QStringList names{"branch",     "branchname", "branch_name", "river", "rivername",
                                   "river_name", "name",       "reach",       "id"};
    return names;
}
const QStringList& StartFields()
{
    static const QStringList names{"start", "chainage_start", "start_chainage", "startchainage", "ch_start", "from"};
    return names;
}
const QStringList& EndFields()
{
    static const QStringList names{"end", "chainage_end", "end_chainage", "endchainage", "ch_end", "to"};
    return names;
}

int FindField(const CGisLayer& layer, const QStringList& names)
{
    for (const QString& name : names) {
        for (int i = 0; i < layer.fields.size(); ++i) {
            if (layer.fields[i].compare(name, Qt::CaseInsensitive) == 0)
                return i;
        }
    }
    return -1;
}

std::optional<double> Number(const CGisLine& line, int field)
{
    bool good = false;
    const double value = line.values.value(field).toDouble(&good);
    return field >= 0 && good && std::isfinite(value) ? std::optional(value) : std::nullopt;
}

QString FreeName(const QString& wanted, const QSet<QString>& taken)
{
    QString name = wanted;
    for (int number = 2; taken.contains(KsBranchKey(name)); ++number)
        name = QStringLiteral("%1 (%2)").arg(wanted).arg(number);
    return name;
}

} // namespace

bool CanImport()
{
#ifdef KVR_GDAL
    return true;
#else
    return false;
#endif
}

CGisFile ReadGisFile(const QString& path)
{
    CGisFile file;
    QLibrary library(QCoreApplication::applicationDirPath() + u'/' + QLatin1String(GisLibrary)); // stays loaded
    const auto read = reinterpret_cast<GisReader*>(library.resolve(GisFunction));
    if (read)
        read(path, file);
    else
        file.error =
            ImportBranches::tr("The library that reads GIS files could not be loaded: %1").arg(library.errorString());
    return file;
}

CImportFields ProposeFields(const CGisLayer& layer)
{
    CImportFields fields{FindField(layer, NameFields()), FindField(layer, StartFields()),
                         FindField(layer, EndFields())};
    if (fields.start < 0 || fields.end < 0)
        fields.start = fields.end = -1;
    return fields;
}

std::vector<CNetworkBranch> MakeBranches(const CGisLayer& layer, const CImportFields& fields, const CNetwork& network,
                                         QStringList& notes)
{
    QSet<QString> taken;
    for (const CNetworkBranch& branch : network.branches)
        taken << KsBranchKey(branch.name);
    std::vector<CNetworkBranch> branches;
    for (const CGisLine& line : layer.lines) {
        CNetworkBranch branch;
        branch.line = line.points;
        const QString given = fields.name >= 0 ? line.values.value(fields.name).trimmed() : QString();
        branch.name = FreeName(given.isEmpty() ? ImportBranches::tr("Branch") : given, taken);
        if (!given.isEmpty() && branch.name != given)
            notes << ImportBranches::tr("\"%1\" is taken and becomes \"%2\".").arg(given, branch.name);
        taken << KsBranchKey(branch.name);
        const auto start = Number(line, fields.start), end = Number(line, fields.end);
        const bool both = start && end && *start != *end;
        if (!both && fields.start >= 0)
            notes << ImportBranches::tr("\"%1\": no two different chainages; it goes from 0 to its length.")
                         .arg(branch.name);
        branch.start = both ? *start : 0;
        branch.end = both ? *end : branch.Length();
        branches.push_back(std::move(branch));
    }
    return branches;
}
