#include "editors/network/network_file.h"

#include "editors/network/network_rules.h"
#include "files/declared_section.h"
#include "files/field_io.h"
#include "files/network_names.h"
#include "ks/fc/branch_name.h"

#include <QCoreApplication>
#include <algorithm>
#include <cmath>
#include <iterator>

namespace {

using U = UnitGroup;

using N = CNetworkBranch;
using W = CNetwork;

/// The way from a point to a coordinate, which its class gives by a function.
template <std::size_t index>
struct CoordinateOf
{
    using Class = QPointF;
    static constexpr auto& Of(auto& point) { return get<index>(point); }
};
template <std::size_t index>
constexpr Field Coordinate(std::string_view name)
{
    return NumberBy<CoordinateOf<index>>(name, U::Coordinate);
}
FieldList VertexFields()
{
    static constexpr auto fields = FieldsOf<QPointF>({Coordinate<0>("x"), Coordinate<1>("y")});
    return fields;
}

constexpr auto branchFields =
    FieldsOf<N>({Text<&N::name>(NetworkFile::Name).Title(QT_TRANSLATE_NOOP("NetworkTables", "Branch")),
                 Number<&N::start>("first vertex", U::Chainage).Title(QT_TRANSLATE_NOOP("NetworkTables", "From")),
                 Number<&N::end>("last vertex", U::Chainage).Title(QT_TRANSLATE_NOOP("NetworkTables", "To")),
                 Boolean<&N::downstream>(NetworkFile::FlowsDownstream)
                     .Title(QT_TRANSLATE_NOOP("NetworkTables", "Flow"))
                     .Choices(QT_TRANSLATE_NOOP("NetworkTables", "decreasing\nincreasing"))});
constexpr FieldList nameField = FieldList(branchFields).subspan(0, 1),
                    endFields = FieldList(branchFields).subspan(1, 2);
constexpr auto vertices = FieldsOf<N>({GroupOf<&VertexFields, &N::line>("Vertex")});
constexpr auto rows = FieldsOf<N>({Group<&N::channel>("DATA")});
constexpr DeclaredKeyword lineKeywords[] = {{"Vertex", vertices, Presence::EachLine}},
                          channelKeywords[] = {{"DATA", rows, Presence::EachLine}};
constexpr DeclaredSection branchSections[] = {
    {.name = "Line", .kept = Keeps<&N::kept>(), .keywords = lineKeywords},
    {.name = "Channel", .kept = Keeps<&N::kept>(), .keywords = channelKeywords}};
constexpr DeclaredKeyword branchKeywords[] = {
    {NetworkFile::Name, nameField, Presence::Optional}, // a rule asks for it
    {NetworkFile::Chainage, endFields},
    {NetworkFile::FlowsDownstream, FieldList(branchFields).subspan(3), Presence::Optional}};

constexpr auto coordinates = FieldsOf<W>({Text<&W::system>("CoordinateSystem")});
constexpr Field branches = SectionGroup<&W::branches>(NetworkFile::Branch);
constexpr DeclaredKeyword networkKeywords[] = {{"CoordinateSystem", coordinates, Presence::WhenSet}};
constexpr DeclaredSection networkSections[] = {{.name = NetworkFile::Branch,
                                                .kept = Keeps<&N::kept>(),
                                                .keywords = branchKeywords,
                                                .sections = branchSections,
                                                .sectionCount = std::size(branchSections),
                                                .each = &branches}};
constexpr DeclaredSection file{.name = NetworkFile::Target,
                               .kept = Keeps<&W::kept>(),
                               .keywords = networkKeywords,
                               .sections = networkSections,
                               .sectionCount = std::size(networkSections)};
static_assert(IsOf<W>(file));

constexpr const char* NoName = "BRANCH"; // of a branch that the file does not name

/// It ends as much further as it is long; where numbers are too large to tell the two apart, it begins at 0.
void SetEndsApart(CNetworkBranch& branch)
{
    const double length = branch.Length(), room = std::isfinite(length) ? std::max(length, 1.0) : 1.0;
    branch.end = branch.start + room;
    if (branch.end == branch.start || !std::isfinite(branch.end)) {
        branch.start = 0;
        branch.end = room;
    }
}

/// What a branch has to fulfil beside its declaration: it is made to, and that is reported. `met`: the branches before.
void Mend(CNetworkBranch& branch, const CBranchKeys& met, CBranchNames& names, tqlHandle section, LoadReport& report)
{
    for (CBranchFault fault; (fault = FindFault(branch, met)).rule != CBranchFault::None;) {
        const auto rule = [fault] { return fault.Text().toStdString(); };
        if (fault.rule == CBranchFault::EndsDiffer) {
            SetEndsApart(branch);
            ReportRule(report, section, NetworkFile::Chainage, 1, ParamsText(endFields, &branch), rule);
            continue;
        }
        const QString wanted = fault.rule == CBranchFault::Named ? QString::fromLatin1(NoName) : fault.name;
        branch.name = names.Take(wanted, QStringLiteral("%1-%2")).toStdString();
        ReportRule(report, section, NetworkFile::Name, 1, ParamsText(nameField, &branch), rule);
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
    CNetwork network;
    ReadDeclaredFile(structure, file, &network, report);
    const tqlHandle target = tqlTargetByNameNum(structure, file.name, 1);
    CBranchNames names(network);
    CBranchKeys met;
    for (std::size_t i = 0; i < network.branches.size(); ++i) {
        CNetworkBranch& branch = network.branches[i];
        branch.SortChannel();
        Mend(branch, met, names, tqlSectionByNameNum(target, NetworkFile::Branch, int(i) + 1), report);
        met.insert(KsBranchKey(branch.Name()));
    }
    return network;
}

const DeclaredSection& DeclaredNetworkFile()
{
    return file;
}
