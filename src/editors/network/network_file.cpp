#include "editors/network/network_file.h"

#include "files/declared_section.h"
#include "files/field_io.h"
#include "ks/fc/branch_name.h"

#include <QCoreApplication>
#include <algorithm>
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
    {NameKeyword, name, Presence::Optional}, // a rule asks for it
    {ChainageKeyword, ends},
    {"FlowsDownstream", downstream, Presence::Optional}};

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

FileBranch ForFile(const CNetworkBranch& branch)
{
    FileBranch written{branch.name.toStdString(), {}, branch};
    for (const QPointF& at : branch.line)
        written.line.push_back({at.x(), at.y()});
    return written;
}

/// Whether one of the file's first branches has a name.
bool HasName(const FileNetwork& network, std::size_t count, const std::string& wanted)
{
    return std::any_of(network.branches.begin(), network.branches.begin() + std::ptrdiff_t(count),
                       [&](const FileBranch& each) { return KsSameBranch(each.name, wanted); });
}

/// What a branch has to fulfil beside its declaration: it is made to, and that is reported.
void Mend(FileNetwork& network, std::size_t index, tqlHandle section, LoadReport& report)
{
    FileBranch& read = network.branches[index];
    CNetworkBranch& branch = read.branch;
    if (const std::string given = read.name; given.empty() || HasName(network, index, given)) {
        const std::string wanted = given.empty() ? "BRANCH" : given;
        std::string free = wanted;
        for (int number = 2; HasName(network, network.branches.size(), free); ++number)
            free = wanted + '-' + std::to_string(number);
        read.name = free;
        ReportRule(report, section, NameKeyword, 1, ParamsText(name, &read), [given] {
            const QString taken = NetworkFile::tr("there is a branch \"%1\" already.");
            return (given.empty() ? NetworkFile::tr("expected the branch's name, Name = \"...\".")
                                  : taken.arg(QString::fromStdString(given)))
                .toStdString();
        });
    }
    if (branch.start == branch.end) {
        branch.end += std::max(branch.Length(), 1.0);
        ReportRule(report, section, ChainageKeyword, 1, ParamsText(ends, &read),
                   [] { return NetworkFile::tr("the chainages of the two ends have to differ.").toStdString(); });
    }
}

} // namespace

KVR_FIELDS(CChannelRow,
           Number<&Self::chainage>("chainage", U::Chainage),
           Number<&Self::radius>("radius", U::Radius).MayBeUnknown(),
           Number<&Self::width>("width", U::Width).MayBeUnknown())

CNetwork LoadNetwork(tqlHandle structure, LoadReport& report)
{
    FileNetwork read;
    ReadDeclared(structure, file, &read, report);
    const tqlHandle target = tqlTargetByNameNum(structure, file.target.name, 1);
    CNetwork network{{}, QString::fromStdString(read.system), std::move(read.kept), std::move(read.keptTargets)};
    for (std::size_t i = 0; i < read.branches.size(); ++i) {
        CNetworkBranch& branch = read.branches[i].branch;
        for (const Vertex& at : read.branches[i].line)
            branch.line.emplace_back(at.x, at.y);
        branch.SortChannel();
        Mend(read, i, tqlSectionByNameNum(target, BranchSection, int(i) + 1), report);
        branch.name = QString::fromStdString(read.branches[i].name);
        network.branches.push_back(std::move(branch));
    }
    return network;
}

Result<void> SaveNetwork(const CNetwork& network, const std::string& path)
{
    FileNetwork written{network.system.toStdString(), {}, network.kept, network.keptTargets};
    for (const CNetworkBranch& branch : network.branches)
        written.branches.push_back(ForFile(branch));
    return SaveDeclared(path, file, &written);
}
