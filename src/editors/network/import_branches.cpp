#include "editors/network/import_branches.h"

#include "editors/common/quantity.h"
#include "editors/network/join_lines.h"
#include "editors/network/measured_line.h"
#include "editors/network/network_rules.h"
#include "files/read_number.h"

#include <QCoreApplication>
#include <QLibrary>
#include <cmath>
#include <numeric>
#include <optional>

int CGisLayer::Lines() const
{
    return int(std::ranges::count_if(features, [](const CGisFeature& feature) { return !feature.parts.empty(); }));
}

bool CGisLayer::IsComplete() const
{
    return errors.isEmpty() && announced <= qint64(features.size()) &&
           std::ranges::all_of(features, [](const CGisFeature& feature) { return feature.error.isEmpty(); });
}

namespace {

struct ImportBranches
{
    Q_DECLARE_TR_FUNCTIONS(ImportBranches)
};

/// `names` in the order of preference.
int FindField(const CGisLayer& layer, std::initializer_list<const char*> names)
{
    for (const char* name : names) {
        for (int i = 0; i < layer.fields.size(); ++i) {
            if (layer.fields[i].compare(QLatin1String(name), Qt::CaseInsensitive) == 0)
                return i;
        }
    }
    return -1;
}

/// Goes through the lines of a layer.
class CPlanner
{
public:
    CPlanner(const CImportOptions& options, const CNetwork& network) : m_options(options), m_names(network) {}

    void Add(const CGisFeature& feature, std::vector<CGisLine> parts)
    {
        m_name = m_options.fields.name >= 0 ? feature.values.value(m_options.fields.name).trimmed() : QString();
        m_who = m_name.isEmpty()
                    ? ImportBranches::tr("feature %1").arg(feature.number)
                    : ImportBranches::tr("\"%1\" (feature %2)").arg(m_name, QString::number(feature.number));
        if (const QString reason = WhyNot(feature); !reason.isEmpty())
            return LeaveOut(reason);
        if (!feature.error.isEmpty())
            Change(feature.error);
        TellVertices(feature);
        const auto lines = JoinLines(Usable(feature, std::move(parts)));
        if (lines.empty())
            return;
        if (lines.size() > 1)
            return AddPieces(feature, lines);
        TellJoined(lines.front());
        AddLine(feature, lines.front().line);
    }

    CImportPlan plan;

private:
    void LeaveOut(const QString& why) { plan.leftOut << m_who + QStringLiteral(": ") + why; }
    void Change(const QString& what) { plan.changed << m_who + QStringLiteral(": ") + what; }

    /// Why nothing can be made of a feature, whatever its parts are like.
    QString WhyNot(const CGisFeature& feature) const
    {
        if (feature.parts.empty()) {
            if (!feature.error.isEmpty())
                return ImportBranches::tr("could not be read: %1").arg(feature.error);
            return feature.geometry.isEmpty()
                       ? ImportBranches::tr("has no geometry.")
                       : ImportBranches::tr("is no line (%1).").arg(GeometryText(feature.geometry));
        }
        return m_name.isEmpty() && !m_options.unnamed ? ImportBranches::tr("has no name.") : QString();
    }

    void TellVertices(const CGisFeature& feature)
    {
        std::ptrdiff_t without = 0;
        for (const CGisLine& line : feature.parts)
            without += std::ranges::count_if(line, std::not_fn(&IsFinite));
        if (without > 0)
            Change(ImportBranches::tr("vertices without coordinates, left out: %1.").arg(without));
    }

    /// The parts that have a length. The others are told, and with none left the whole line is.
    std::vector<CGisLine> Usable(const CGisFeature& feature, std::vector<CGisLine> parts)
    {
        const std::size_t all = feature.parts.size(), outside = all - parts.size();
        for (CGisLine& line : parts)
            line.erase(std::unique(line.begin(), line.end()), line.end());
        const bool someVertex = std::ranges::any_of(parts, [](const CGisLine& line) { return !line.empty(); });
        const std::size_t flat = std::erase_if(parts, [](const CGisLine& line) { return line.size() < 2; });
        if (parts.empty()) {
            LeaveOut(outside > 0  ? ImportBranches::tr("lies outside the area of the coordinate system.")
                     : someVertex ? ImportBranches::tr("the line has no length.")
                                  : ImportBranches::tr("the line is empty."));
            return parts;
        }
        if (outside > 0)
            Change(ImportBranches::tr("parts outside the area of the coordinate system, left out: %1 of %2.")
                       .arg(outside)
                       .arg(all));
        if (flat > 0)
            Change(ImportBranches::tr("parts without a length, left out: %1 of %2.").arg(flat).arg(all));
        return parts;
    }

    void TellJoined(const CJoinedLine& line)
    {
        if (line.parts < 2)
            return;
        QString text = ImportBranches::tr("its %1 parts meet and become one branch.").arg(line.parts);
        if (line.turned > 0)
            text += u' ' + ImportBranches::tr("Parts that ran the other way, turned: %1.").arg(line.turned);
        Change(text);
    }

    CNetworkBranch& NewBranch(const QString& wanted, const CGisLine& line)
    {
        CNetworkBranch& branch = plan.branches.emplace_back();
        branch.name = m_names.Take(wanted, QStringLiteral("%1 (%2)")).toStdString();
        branch.line = line;
        branch.end = branch.Length();
        return branch;
    }

    void AddLine(const CGisFeature& feature, const CGisLine& line)
    {
        CNetworkBranch& branch = NewBranch(m_name.isEmpty() ? ImportBranches::tr("Branch") : m_name, line);
        if (m_name.isEmpty())
            Change(ImportBranches::tr("has no name and becomes \"%1\".").arg(branch.Name()));
        else if (branch.Name() != m_name)
            Change(ImportBranches::tr("this name is taken; the branch becomes \"%1\".").arg(branch.Name()));
        if (const auto chainages = Chainages(feature, branch.end)) {
            branch.start = chainages->first;
            branch.end = chainages->second;
        }
    }

    /// What the fields say, when they say two different numbers for a line of that length.
    std::optional<std::pair<double, double>> Chainages(const CGisFeature& feature, double length)
    {
        constexpr double tolerance = 0.1; // of the length: rivers are shorter on coarse maps, but not by more
        const CImportFields& fields = m_options.fields;
        if (fields.start < 0 && fields.end < 0)
            return {};
        const auto start = fields.start < 0 ? std::optional(0.0) : Number(feature, fields.start);
        const auto end = !start           ? std::nullopt
                         : fields.end < 0 ? std::optional(*start + length)
                                          : Number(feature, fields.end);
        if (!start || !end || *start == *end) {
            Change(ImportBranches::tr("no two different chainages; it goes from 0 to its length, %1.")
                       .arg(LengthText(length)));
            return {};
        }
        if (std::abs(std::abs(*end - *start) / length - 1) > tolerance)
            Change(ImportBranches::tr("its chainages go from %1 to %2, but the line is %3 long.")
                       .arg(LengthText(*start), LengthText(*end), LengthText(length)));
        return std::pair(*start, *end);
    }

    static std::optional<double> Number(const CGisFeature& feature, int field)
    {
        return ReadNumber(feature.values.value(field).trimmed().toStdString());
    }

    /// A line whose parts do not meet.
    void AddPieces(const CGisFeature& feature, const std::vector<CJoinedLine>& lines)
    {
        if (m_options.parts == CImportParts::LeaveOut)
            return LeaveOut(ImportBranches::tr("its parts do not meet: %1 pieces.").arg(lines.size()));
        double whole = 0;
        for (const CJoinedLine& each : lines)
            whole += LengthOf(each.line);
        const bool share = m_options.parts == CImportParts::ShareChainages;
        const auto chainages = share ? Chainages(feature, whole) : std::nullopt;
        const auto [first, last] = chainages.value_or(std::pair(0.0, whole));
        QStringList names;
        double before = 0;
        for (const CJoinedLine& each : lines) {
            const QString wanted = m_name.isEmpty() ? ImportBranches::tr("Branch") : m_name;
            CNetworkBranch& branch = NewBranch(wanted + QStringLiteral("-%1").arg(names.size() + 1), each.line);
            const double after = before + branch.end;
            if (chainages) {
                branch.start = std::lerp(first, last, before / whole);
                branch.end = std::lerp(first, last, after / whole);
            }
            before = after;
            names << ImportBranches::tr("\"%1\" (%2)").arg(branch.Name(), LengthText(LengthOf(each.line)));
        }
        const QString how = chainages ? ImportBranches::tr("The chainages of the line are shared out among them.")
                                      : ImportBranches::tr("Each goes from 0 to its length.");
        Change(
            ImportBranches::tr("its parts do not meet and become %1. %2").arg(names.join(QStringLiteral(", ")), how));
    }

    const CImportOptions& m_options;
    CBranchNames m_names;
    QString m_name, m_who; // of the line at hand
};

} // namespace

bool CanImport()
{
#ifdef KVR_GDAL
    return true;
#else
    return false;
#endif
}

const CGisLibrary* GisLibrary(QString& reason)
{
    QLibrary library(QCoreApplication::applicationDirPath() + u'/' + QLatin1String(GisLibraryName)); // stays loaded
    const auto get = reinterpret_cast<GisLibraryGetter*>(library.resolve(GisLibraryFunction));
    if (get)
        return get();
    reason = ImportBranches::tr("The library that reads GIS files could not be loaded: %1").arg(library.errorString());
    return nullptr;
}

QString GeometryText(const QString& geometry)
{
    // As the library that reads the files calls them.
    [[maybe_unused]] static const char* const words[] = {QT_TRANSLATE_NOOP("GisGeometry", "Point"),
                                                         QT_TRANSLATE_NOOP("GisGeometry", "Multi Point"),
                                                         QT_TRANSLATE_NOOP("GisGeometry", "Line String"),
                                                         QT_TRANSLATE_NOOP("GisGeometry", "Multi Line String"),
                                                         QT_TRANSLATE_NOOP("GisGeometry", "Polygon"),
                                                         QT_TRANSLATE_NOOP("GisGeometry", "Multi Polygon"),
                                                         QT_TRANSLATE_NOOP("GisGeometry", "Unknown (any)"),
                                                         QT_TRANSLATE_NOOP("GisGeometry", "None"),
                                                         QT_TRANSLATE_NOOP("GisGeometry", "Compound Curve"),
                                                         QT_TRANSLATE_NOOP("GisGeometry", "Multi Curve"),
                                                         QT_TRANSLATE_NOOP("GisGeometry", "Geometry Collection")};
    return geometry.isEmpty() ? QString() : QCoreApplication::translate("GisGeometry", geometry.toUtf8().constData());
}

QString LengthText(double metres)
{
    return WithSymbol(UnitGroup::Chainage, metres);
}

CImportFields ProposeFields(const CGisLayer& layer)
{
    CImportFields fields{
        FindField(layer,
                  {"branch", "branchname", "branch_name", "river", "rivername", "river_name", "name", "reach", "id"}),
        FindField(layer, {"start", "chainage_start", "start_chainage", "startchainage", "ch_start", "from"}),
        FindField(layer, {"end", "chainage_end", "end_chainage", "endchainage", "ch_end", "to"})};
    if (fields.start < 0 || fields.end < 0)
        fields.start = fields.end = -1;
    return fields;
}

CImportPlan PlanImport(const CGisLayer& layer, const CGisMap& map, const CImportOptions& options,
                       const CNetwork& network)
{
    CPlanner planner(options, network);
    for (std::size_t i = 0; i < layer.features.size() && i < map.parts.size(); ++i)
        planner.Add(layer.features[i], map.parts[i]);
    return std::move(planner.plan);
}
