#include "editors/network/network_file.h"

#include "ks/fc/parameter_file.h"

#include <QCoreApplication>
#include <iterator>

namespace {

struct NetworkFile
{
    Q_DECLARE_TR_FUNCTIONS(NetworkFile)
};

using U = UnitGroup;

// What the file holds, with its texts and points as fields take them.
struct Vertex
{
    double x = 0, y = 0;

    static FieldList DeclaredFields()
    {
        static constexpr auto fields =
            FieldsOf<Vertex>({Number<&Vertex::x>("x", U::Coordinate), Number<&Vertex::y>("y", U::Coordinate)});
        return fields;
    }
};
struct FileBranch
{
    std::string name;
    std::vector<Vertex> line;
    CNetworkBranch branch; // all else
};
struct FileNetwork
{
    std::string system;
    std::vector<FileBranch> branches;
    UnknownNodes kept, keptTargets;
};

// The names of the file.
constexpr const char *BranchSection = "Branch", *NameKeyword = "Name", *ChainageKeyword = "Chainage";

using B = FileBranch;
using N = CNetworkBranch;
constexpr auto name = FieldsOf<B>({Text<&B::name>("Name")});
constexpr auto ends = FieldsOf<B>({Number<&B::branch, &N::start>("first vertex", U::Chainage),
                                   Number<&B::branch, &N::end>("last vertex", U::Chainage)});
constexpr auto downstream = FieldsOf<B>({Boolean<&B::branch, &N::downstream>("FlowsDownstream")});
constexpr auto vertices = FieldsOf<B>({Group<&B::line>("Vertex")});
constexpr auto rows = FieldsOf<B>({Group<&B::branch, &N::channel>("DATA")});
constexpr DeclaredKeyword lineKeywords[] = {{"Vertex", vertices}}, channelKeywords[] = {{"DATA", rows}};
constexpr DeclaredSection branchSections[] = {
    {.name = "Line", .kept = Keeps<&B::branch, &N::keptLine>(), .keywords = lineKeywords},
    {.name = "Channel", .kept = Keeps<&B::branch, &N::keptChannel>(), .keywords = channelKeywords}};
constexpr DeclaredKeyword branchKeywords[] = {
    {NameKeyword, name}, {ChainageKeyword, ends}, {"FlowsDownstream", downstream, Presence::Optional}};

constexpr auto coordinates = FieldsOf<FileNetwork>({Text<&FileNetwork::system>("CoordinateSystem")});
constexpr Field branches = SectionGroup<&FileNetwork::branches>(BranchSection);
constexpr DeclaredKeyword networkKeywords[] = {{"CoordinateSystem", coordinates, Presence::WhenSet}};
constexpr DeclaredSection networkSections[] = {{.name = BranchSection,
                                                .kept = Keeps<&B::branch, &N::kept>(),
                                                .keywords = branchKeywords,
                                                .sections = branchSections,
                                                .sectionCount = std::size(branchSections),
                                                .each = &branches}};
constexpr DeclaredFile file{{.name = "KVR_NETWORK",
                             .kept = Keeps<&FileNetwork::kept>(),
                             .keywords = networkKeywords,
                             .sections = networkSections,
                             .sectionCount = std::size(networkSections)},
                            Keeps<&FileNetwork::keptTargets>()};

CNetworkBranch Taken(FileBranch& read)
{
    CNetworkBranch branch = std::move(read.branch);
    branch.name = QString::fromStdString(read.name);
    for (const Vertex& at : read.line)
        branch.line.emplace_back(at.x, at.y);
    branch.SortChannel();
    return branch;
}

FileBranch ForFile(const CNetworkBranch& branch)
{
    FileBranch written{branch.name.toStdString(), {}, branch};
    for (const QPointF& at : branch.line)
        written.line.push_back({at.x(), at.y()});
    return written;
}

/// What a branch of the file has to fulfil beside its declaration.
void Check(CKsParameterFile& source, tqlHandle section, const CNetworkBranch& branch, const CNetwork& before)
{
    const tqlHandle named = CKsParameterFile::PlaceOf(section, NameKeyword);
    if (branch.name.isEmpty())
        source.Fail(named, NetworkFile::tr("expected the branch's name, Name = \"...\"."));
    else if (branch.start == branch.end)
        source.Fail(CKsParameterFile::PlaceOf(section, ChainageKeyword),
                    NetworkFile::tr("the chainages of the two ends have to differ."));
    else if (before.FindBranch(branch.name) >= 0)
        source.Fail(named, NetworkFile::tr("there is a branch \"%1\" already.").arg(branch.name));
}

} // namespace

FieldList CChannelRow::DeclaredFields()
{
    using R = CChannelRow;
    static constexpr auto fields = FieldsOf<R>({Number<&R::chainage>("chainage", U::Chainage),
                                                Number<&R::radius>("radius", U::Radius).MayBeUnknown(),
                                                Number<&R::width>("width", U::Width).MayBeUnknown()});
    return fields;
}

QString ReadNetwork(const QString& path, CNetwork& network)
{
    FileNetwork read;
    CKsParameterFile source(path, file, &read);
    CNetwork taken;
    for (std::size_t i = 0; i < read.branches.size() && source.Error().isEmpty(); ++i) {
        CNetworkBranch branch = Taken(read.branches[i]);
        Check(source, tqlSectionByNameNum(source.Target(), BranchSection, int(i) + 1), branch, taken);
        taken.branches.push_back(std::move(branch));
    }
    if (!source.Error().isEmpty())
        return source.Error();
    taken.system = QString::fromStdString(read.system);
    taken.kept = std::move(read.kept);
    taken.keptTargets = std::move(read.keptTargets);
    network = std::move(taken);
    return {};
}

QString WriteNetwork(const QString& path, const CNetwork& network)
{
    FileNetwork written{network.system.toStdString(), {}, network.kept, network.keptTargets};
    for (const CNetworkBranch& branch : network.branches)
        written.branches.push_back(ForFile(branch));
    return KsWriteParameterFile(path, file, &written);
}
