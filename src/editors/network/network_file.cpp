#include "editors/network/network_file.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <cmath>

namespace {

struct NetworkFile
{
    Q_DECLARE_TR_FUNCTIONS(NetworkFile)
};

// Names of the file.
constexpr const char* Target = "KVR_NETWORK";
constexpr const char* System = "CoordinateSystem";
constexpr const char* Branch = "Branch";
constexpr const char* Name = "Name";
constexpr const char* Chainage = "Chainage";
constexpr const char* Downstream = "FlowsDownstream"; // towards increasing chainage
constexpr const char* Line = "Line";
constexpr const char* Vertex = "Vertex";
constexpr const char* Channel = "Channel";
constexpr const char* Data = "DATA";

/// Reads branches until something is wrong, and then says what.
class CReader
{
public:
    explicit CReader(const QString& path) : m_path(path) {}
    const QString& Error() const { return m_error; }

    void ReadTarget(tqlHandle target, CNetwork& network)
    {
        network.kept = KeepUnknown(target, {System, Branch});
        std::string system;
        if (tqlGetNoKeywords(target, System) && !tqlGetParam(target, System, &system))
            Fail(Place(target, System),
                 NetworkFile::tr("expected the name of a coordinate system, CoordinateSystem = \"EPSG:...\"."));
        network.system = QString::fromStdString(system);
        const int count = tqlGetNoSections(target);
        for (int i = 1; i <= count && m_error.isEmpty(); ++i) {
            const tqlHandle section = tqlSectionByNum(target, i);
            if (tqlName(section) != Branch)
                continue;
            CNetworkBranch branch = ReadBranch(section);
            if (m_error.isEmpty() && network.FindBranch(branch.name) >= 0)
                Fail(tqlKeywordByNameNum(section, Name, 1),
                     NetworkFile::tr("there is a branch \"%1\" already.").arg(branch.name));
            network.branches.push_back(std::move(branch));
        }
    }

private:
    void Fail(tqlHandle node, const QString& what)
    {
        if (m_error.isEmpty())
            m_error = CParameterFile::ErrorAt(m_path, node, what);
    }

    CNetworkBranch ReadBranch(tqlHandle section)
    {
        CNetworkBranch branch;
        std::string name;
        if (!tqlGetParam(section, Name, &name) || name.empty())
            Fail(Place(section, Name), NetworkFile::tr("expected the branch's name, Name = \"...\"."));
        branch.name = QString::fromStdString(name);
        ReadNumbers(section, Chainage, 1, {&branch.start, &branch.end}, false);
        if (branch.start == branch.end)
            Fail(Place(section, Chainage), NetworkFile::tr("the chainages of the two ends have to differ."));
        if (tqlGetNoKeywords(section, Downstream) && !tqlGetParam(section, Downstream, &branch.downstream))
            Fail(Place(section, Downstream), NetworkFile::tr("expected true or false."));
        const tqlHandle line = tqlSectionByNameNum(section, Line, 1);
        for (int i = 1, count = tqlGetNoKeywords(line, Vertex); i <= count && m_error.isEmpty(); ++i) {
            double x = 0, y = 0;
            ReadNumbers(line, Vertex, i, {&x, &y}, false);
            branch.line.emplace_back(x, y);
        }
        const tqlHandle channel = tqlSectionByNameNum(section, Channel, 1);
        for (int i = 1, count = tqlGetNoKeywords(channel, Data); i <= count && m_error.isEmpty(); ++i) {
            CChannelRow row;
            ReadNumbers(channel, Data, i, {&row.chainage, &row.radius, &row.width}, true);
            branch.channel.push_back(row);
        }
        branch.SortChannel();
        branch.kept = KeepUnknown(section, {Name, Chainage, Downstream, Line, Channel});
        return branch;
    }

    /// The keyword's place; the section's when it is missing.
    static tqlHandle Place(tqlHandle section, const char* keyword)
    {
        const tqlHandle node = tqlKeywordByNameNum(section, keyword, 1);
        return node ? node : section;
    }

    /// All parameters of a keyword, each a number; behind the first they may be "nan" where `unset` is allowed.
    void ReadNumbers(tqlHandle section, const char* name, int number, const std::vector<double*>& values, bool unset)
    {
        const tqlHandle keyword = tqlKeywordByNameNum(section, name, number);
        tqlHandle param = tqlParamByNum(keyword, 1);
        bool good = keyword && tqlGetNoParams(keyword) == static_cast<int>(values.size());
        for (std::size_t i = 0; good && i < values.size(); ++i)
            good =
                tqlTake(&param, values[i]) && (std::isfinite(*values[i]) || (unset && i > 0 && std::isnan(*values[i])));
        if (!good)
            Fail(keyword ? keyword : section,
                 NetworkFile::tr("expected %1 numbers after \"%2 =\".").arg(values.size()).arg(QLatin1String(name)));
    }

    QString m_path, m_error;
};

void WriteNumbers(tqlHandle file, const char* name, std::initializer_list<double> values)
{
    tqlAddKeyword(file, name);
    for (const double value : values)
        tqlAddDouble(file, value);
}

void WriteBranch(tqlHandle file, const CNetworkBranch& branch)
{
    tqlAddSection(file, Branch);
    tqlPutParam(file, Name, std::string_view(branch.name.toStdString()));
    WriteNumbers(file, Chainage, {branch.start, branch.end});
    tqlPutParam(file, Downstream, branch.downstream);
    tqlAddSection(file, Line);
    for (const QPointF& at : branch.line)
        WriteNumbers(file, Vertex, {at.x(), at.y()});
    tqlEndSection(file);
    tqlAddSection(file, Channel);
    for (const CChannelRow& row : branch.channel)
        WriteNumbers(file, Data, {row.chainage, row.radius, row.width});
    tqlEndSection(file);
    WriteKept(file, branch.kept);
    tqlEndSection(file);
}

} // namespace

QString ReadNetwork(const QString& path, CNetwork& network)
{
    const CParameterFile file(tqlLoadFile(path.toStdString()));
    if (const QString error = file.SyntaxError(); !error.isEmpty())
        return error;
    const tqlHandle target = tqlTargetByNameNum(file.Get(), Target, 1);
    if (!target)
        return NetworkFile::tr("%1 is no river network: it has no section [%2].")
            .arg(QFileInfo(path).fileName(), QLatin1String(Target));
    CNetwork read;
    CReader reader(path);
    reader.ReadTarget(target, read);
    if (!reader.Error().isEmpty())
        return reader.Error();
    bool own = true; // the first target of the name is the network
    for (int i = 1, count = tqlGetNoSections(file.Get()); i <= count; ++i) {
        const tqlHandle other = tqlSectionByNum(file.Get(), i);
        if (tqlName(other) != Target || !std::exchange(own, false))
            read.keptTargets.push_back(KeepUnknown(other, {}));
    }
    network = std::move(read);
    return {};
}

QString WriteNetwork(const QString& path, const CNetwork& network)
{
    const CParameterFile file(tqlCreate());
    tqlAddTarget(file.Get(), Target);
    if (!network.system.isEmpty())
        tqlPutParam(file.Get(), System, std::string_view(network.system.toStdString()));
    for (const CNetworkBranch& branch : network.branches)
        WriteBranch(file.Get(), branch);
    WriteKept(file.Get(), network.kept);
    tqlEndSection(file.Get());
    for (const CKeptSection& target : network.keptTargets) {
        tqlAddTarget(file.Get(), target.name);
        WriteKept(file.Get(), target);
        tqlEndSection(file.Get());
    }
    return WriteParameterFile(path, file.Get());
}
