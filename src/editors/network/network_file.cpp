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
constexpr auto vertices = FieldsOf<N>({GroupOf<&VertexFields, &N::line>("Vertex")});
constexpr auto rows = FieldsOf<N>({Group<&N::channel>("DATA")});
constexpr DeclaredKeyword lineKeywords[] = {{"Vertex", vertices}}, channelKeywords[] = {{"DATA", rows}};
constexpr DeclaredSection branchSections[] = {
    {.name = "Line", .kept = Keeps<&N::keptLine>(), .keywords = lineKeywords},
    {.name = "Channel", .kept = Keeps<&N::keptChannel>(), .keywords = channelKeywords}};
constexpr DeclaredKeyword branchKeywords[] = {
    {NameKeyword, FieldList(branchFields).subspan(0, 1)},
    {ChainageKeyword, FieldList(branchFields).subspan(1, 2)},
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

/// What a branch of the file has to fulfil beside its declaration.
void Check(CKsParameterFile& source, const CNetwork& network, int index)
{
    const CNetworkBranch& branch = network.branches[std::size_t(index)];
    const tqlHandle section = tqlSectionByNameNum(source.Target(), BranchSection, index + 1);
    const tqlHandle named = CKsParameterFile::PlaceOf(section, NameKeyword);
    if (branch.name.empty())
        source.Fail(named, NetworkFile::tr("expected the branch's name, Name = \"...\"."));
    else if (branch.start == branch.end)
        source.Fail(CKsParameterFile::PlaceOf(section, ChainageKeyword),
                    NetworkFile::tr("the chainages of the two ends have to differ."));
    else if (network.FindBranch(branch.Name()) < index)
        source.Fail(named, NetworkFile::tr("there is a branch \"%1\" already.").arg(branch.Name()));
}

} // namespace

FieldList CNetworkBranch::DeclaredFields()
{
    return branchFields;
}

FieldList CChannelRow::DeclaredFields()
{
    using R = CChannelRow;
    static constexpr auto fields = FieldsOf<R>(
        {Number<&R::chainage>("chainage", U::Chainage).Title(QT_TRANSLATE_NOOP("NetworkTables", "Chainage")),
         Number<&R::radius>("radius", U::Radius).MayBeUnknown().Title(QT_TRANSLATE_NOOP("NetworkTables", "Radius")),
         Number<&R::width>("width", U::Width).MayBeUnknown().Title(QT_TRANSLATE_NOOP("NetworkTables", "Width"))});
    return fields;
}

QString ReadNetwork(const QString& path, CNetwork& network)
{
    FileNetwork read;
    CKsParameterFile source(path, file, &read);
    CNetwork& taken = read.network;
    for (std::size_t i = 0; i < taken.branches.size() && source.Error().isEmpty(); ++i) {
        Check(source, taken, int(i));
        taken.branches[i].SortChannel();
    }
    if (!source.Error().isEmpty())
        return source.Error();
    taken.system = QString::fromStdString(read.system);
    network = std::move(taken);
    return {};
}

QString WriteNetwork(const QString& path, const CNetwork& network)
{
    const FileNetwork written{network.system.toStdString(), network};
    return KsWriteParameterFile(path, file, &written);
}
