#include "editors/network/network_file.h"

#include "files/declared_section.h"
#include "files/field_io.h"
#include "ks/fc/branch_name.h"

#include <QCoreApplication>
#include <QSet>
#include <algorithm>
#include <iterator>

namespace {

struct NetworkFile
{
    Q_DECLARE_TR_FUNCTIONS(NetworkFile)
};

using U = UnitGroup;

using N = CNetworkBranch;

/// A coordinate of a point, which gives it by a function.
template <auto reach>
constexpr Field Coordinate(std::string_view name)
{
    return {.name = name,
            .owner = &field_detail::Tag<QPointF>,
            .address = [](void* point) -> void* { return &(static_cast<QPointF*>(point)->*reach)(); },
            .constAddress = [](const void* point) -> const void* {
                return &(static_cast<QPointF*>(const_cast<void*>(point))->*reach)();
            },
            .unit = U::Coordinate};
}
FieldList VertexFields()
{
    static constexpr auto fields = FieldsOf<QPointF>({Coordinate<&QPointF::rx>("x"), Coordinate<&QPointF::ry>("y")});
    return fields;
}

// What the file holds.
struct FileNetwork
{
    std::string system;
    CNetwork network; // all else
};

// The names of the file.
constexpr const char *BranchSection = "Branch", *NameKeyword = "Name", *ChainageKeyword = "Chainage";

constexpr auto branchFields =
    FieldsOf<N>({Text<&N::name>("Name").Title(QT_TRANSLATE_NOOP("NetworkTables", "Branch")),
                 Number<&N::start>("first vertex", U::Chainage).Title(QT_TRANSLATE_NOOP("NetworkTables", "From")),
                 Number<&N::end>("last vertex", U::Chainage).Title(QT_TRANSLATE_NOOP("NetworkTables", "To")),
                 Boolean<&N::downstream>("FlowsDownstream").Title(QT_TRANSLATE_NOOP("NetworkTables", "Flow"))});
constexpr FieldList nameField = FieldList(branchFields).subspan(0, 1),
                    endFields = FieldList(branchFields).subspan(1, 2);
constexpr auto vertices = FieldsOf<N>({GroupOf<&VertexFields, &N::line>("Vertex")});
constexpr auto rows = FieldsOf<N>({Group<&N::channel>("DATA")});
constexpr DeclaredKeyword lineKeywords[] = {{"Vertex", vertices}}, channelKeywords[] = {{"DATA", rows}};
constexpr DeclaredSection branchSections[] = {
    {.name = "Line", .kept = Keeps<&N::keptLine>(), .keywords = lineKeywords},
    {.name = "Channel", .kept = Keeps<&N::keptChannel>(), .keywords = channelKeywords}};
constexpr DeclaredKeyword branchKeywords[] = {
    {NameKeyword, nameField, Presence::Optional}, // a rule asks for it
    {ChainageKeyword, endFields},
    {"FlowsDownstream", FieldList(branchFields).subspan(3), Presence::Optional}};

constexpr auto coordinates = FieldsOf<FileNetwork>({Text<&FileNetwork::system>("CoordinateSystem")});
constexpr Field branches = SectionGroup<&FileNetwork::network, &CNetwork::branches>(BranchSection);
constexpr DeclaredKeyword networkKeywords[] = {{"CoordinateSystem", coordinates, Presence::WhenSet}};
constexpr DeclaredSection networkSections[] = {{.name = BranchSection,
                                                .kept = Keeps<&N::kept>(),
                                                .keywords = branchKeywords,
                                                .sections = branchSections,
                                                .sectionCount = std::size(branchSections),
                                                .each = &branches}};
constexpr DeclaredFile file{{.name = "KVR_NETWORK",
                             .kept = Keeps<&FileNetwork::network, &CNetwork::kept>(),
                             .keywords = networkKeywords,
                             .sections = networkSections,
                             .sectionCount = std::size(networkSections)},
                            Keeps<&FileNetwork::network, &CNetwork::keptTargets>()};

/// Keys of the names that the file gives, and of those that branches have by now.
struct Names
{
    QSet<QString> given, taken;
};

/// What a branch has to fulfil beside its declaration: it is made to, and that is reported.
void Mend(CNetworkBranch& branch, Names& names, tqlHandle section, LoadReport& report)
{
    const QString given = branch.Name();
    if (given.isEmpty() || names.taken.contains(KsBranchKey(given))) {
        const QString wanted = given.isEmpty() ? QStringLiteral("BRANCH") : given;
        QString free = wanted;
        for (int number = 2; names.given.contains(KsBranchKey(free)) || names.taken.contains(KsBranchKey(free));
             ++number)
            free = QStringLiteral("%1-%2").arg(wanted).arg(number);
        branch.name = free.toStdString();
        ReportRule(report, section, NameKeyword, 1, ParamsText(nameField, &branch), [given] {
            const QString taken = NetworkFile::tr("there is a branch \"%1\" already.");
            return (given.isEmpty() ? NetworkFile::tr("expected the branch's name, Name = \"...\".") : taken.arg(given))
                .toStdString();
        });
    }
    names.taken.insert(KsBranchKey(branch.Name()));
    if (branch.start == branch.end) {
        branch.end += std::max(branch.Length(), 1.0);
        ReportRule(report, section, ChainageKeyword, 1, ParamsText(endFields, &branch),
                   [] { return NetworkFile::tr("the chainages of the two ends have to differ.").toStdString(); });
    }
}

} // namespace

FieldList CNetworkBranch::DeclaredFields()
{
    return branchFields;
}

KVR_FIELDS(
    CChannelRow, Number<&Self::chainage>("chainage", U::Chainage).Title(QT_TRANSLATE_NOOP("NetworkTables", "Chainage")),
    Number<&Self::radius>("radius", U::Radius).MayBeUnknown().Title(QT_TRANSLATE_NOOP("NetworkTables", "Radius")),
    Number<&Self::width>("width", U::Width).MayBeUnknown().Title(QT_TRANSLATE_NOOP("NetworkTables", "Width")))

CNetwork LoadNetwork(tqlHandle structure, LoadReport& report)
{
    FileNetwork read;
    ReadDeclared(structure, file, &read, report);
    const tqlHandle target = tqlTargetByNameNum(structure, file.target.name, 1);
    CNetwork& network = read.network;
    network.system = QString::fromStdString(read.system);
    Names names;
    for (const CNetworkBranch& branch : network.branches)
        names.given.insert(KsBranchKey(branch.Name()));
    for (std::size_t i = 0; i < network.branches.size(); ++i) {
        network.branches[i].SortChannel();
        Mend(network.branches[i], names, tqlSectionByNameNum(target, BranchSection, int(i) + 1), report);
    }
    return std::move(network);
}

Result<void> SaveNetwork(const CNetwork& network, const std::string& path)
{
    const FileNetwork written{network.system.toStdString(), network};
    return SaveDeclared(path, file, &written);
}
