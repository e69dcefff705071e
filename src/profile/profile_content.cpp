#include "profile/profile_content.h"

#include "grid/gen_grid.h"
#include "grid/shown_numbers.h"
#include "ks/fc/branch_name.h"
#include "profile/profile_texts.h"

#include <algorithm>
#include <cmath>
#include <map>

namespace {

constexpr int BranchColumn = 0, ChainageColumn = 1, FirstValue = 2;
constexpr double None = std::numeric_limits<double>::quiet_NaN();
constexpr double MainWeight = 2.4, LaneWeight = 0.35;

/// Whether names mean a branch, for a million of them: most are spelled as their key.
class CSameBranch
{
public:
    explicit CSameBranch(const QString& key) : m_key(key), m_spelled(key.toStdString()) {}
    bool operator()(const std::string& name)
    {
        if (name == m_spelled)
            return true;
        if (name != m_asked) {
            m_asked = name;
            m_answer = KsSameBranch(QString::fromStdString(name), m_key);
        }
        return m_answer;
    }

private:
    QString m_key;
    std::string m_spelled, m_asked{};
    bool m_answer = false;
};

/// The ground along the branch, in the units shown.
class CBed
{
public:
    CBed(IProfileHost& host, const QString& branch)
    {
        const KsUnitConversion along = CKsEditStyle(UnitGroup::Chainage).Conversion(),
                               up = CKsEditStyle(UnitGroup::WaterLevel).Conversion();
        for (const BedLevel& level : host.BedLevels(branch)) {
            m_x.push_back(along.ToShown(level.chainage));
            m_bed.push_back(up.ToShown(level.bed));
            m_left.push_back(up.ToShown(level.leftBank));
            m_right.push_back(up.ToShown(level.rightBank));
        }
    }
    double At(double x) const
    {
        const auto behind = std::ranges::lower_bound(m_x, x);
        const auto i = std::size_t(behind - m_x.begin());
        if (i == m_x.size() || (i == 0 && m_x[0] != x))
            return None;
        if (m_x[i] == x)
            return m_bed[i];
        return std::lerp(m_bed[i - 1], m_bed[i], (x - m_x[i - 1]) / (m_x[i] - m_x[i - 1]));
    }
    std::vector<PlotCurve> Curves() const
    {
        if (m_x.empty())
            return {};
        return {
            {.name = ProfileTexts::tr("Left bank"), .ink = PlotInk::LeftBank, .isDashed = true, .x = m_x, .y = m_left},
            {.name = ProfileTexts::tr("Right bank"),
             .ink = PlotInk::RightBank,
             .isDashed = true,
             .x = m_x,
             .y = m_right},
            {.name = ProfileTexts::tr("Bed"), .ink = PlotInk::Ground, .hasPoints = true, .x = m_x, .y = m_bed}};
    }
    const std::vector<double>& Places() const { return m_x; }

private:
    std::vector<double> m_x, m_bed, m_left, m_right;
};

QString HeaderOf(const ColumnSpec& column)
{
    return column.header().simplified();
}

QString WithUnitOf(const QString& name, const ColumnSpec& column)
{
    const QString unit = column.UnitSymbol();
    return unit.isEmpty() ? name : QStringLiteral("%1 [%2]").arg(name, unit);
}

bool IsCurve(const ColumnSpec& column, Along along)
{
    return column.Kind() == CellKind::Number && column.along == along;
}

class CMaker
{
public:
    CMaker(IProfileHost& host, const QString& branch, const QSet<QString>& shown)
        : m_host(host), m_shown(shown), m_bed(host, branch)
    {
        m_profile.branch = branch;
        m_profile.tables = host.ProfileTables();
        m_lines.resize(m_profile.tables.size());
        m_profile.plot.axis = WithUnitOf(ProfileTexts::tr("Chainage"), ChainageOf());
    }

    Profile Make()
    {
        AddLevels();
        for (std::size_t table = 0; table < m_profile.tables.size(); ++table)
            AddValues(int(table));
        AddReaches();
        AddGlobals();
        m_profile.bedAt = [bed = m_bed](double x) { return bed.At(x); };
        return std::move(m_profile);
    }

private:
    struct Line
    {
        double x;
        std::size_t row;
    };

    const CGridModel& Model(int table) const { return *m_profile.tables[std::size_t(table)].grid->Model(); }
    const ColumnSpec& ChainageOf() const
    {
        static const ColumnSpec none;
        return m_profile.tables.empty() ? none : Model(0).Column(ChainageColumn);
    }

    /// The lines on the branch, by increasing chainage.
    const std::vector<Line>& LinesOf(int table)
    {
        auto& lines = m_lines[std::size_t(table)];
        if (lines)
            return *lines;
        lines.emplace();
        const CGridModel& model = Model(table);
        const ColumnSpec& branch = model.Column(BranchColumn);
        const CShownNumbers chainages(model, ChainageColumn);
        CSameBranch isBranch(m_profile.branch);
        CellValue copy;
        for (std::size_t row = model.Rows()->FixedRows(); row < model.Rows()->Count(); ++row) {
            const void* object = model.Rows()->At(row);
            const std::string* name = branch.access->TextIn(object, copy);
            const double x = name && isBranch(*name) ? chainages.In(object) : None;
            if (std::isfinite(x) && x != NotGiven)
                lines->push_back({x, row});
        }
        std::ranges::stable_sort(*lines, {}, &Line::x);
        return *lines;
    }

    bool IsShown(const QString& key, int tab) const { return m_shown.contains(key) || tab == m_host.FrontTab(); }

    PlotTrack& AddTrack(const QString& label)
    {
        m_profile.curves.emplace_back();
        m_profile.units.emplace_back();
        return m_profile.plot.tracks.emplace_back(PlotTrack{.label = label});
    }

    void Put(PlotCurve curve, ProfileCurve from, const QString& unit)
    {
        m_profile.plot.tracks.back().curves.push_back(std::move(curve));
        m_profile.curves.back().push_back(std::move(from));
        m_profile.units.back().push_back(unit);
    }

    void AddColumn(int table, int column, PlotInk ink, int number)
    {
        const CGridModel& model = Model(table);
        const ColumnSpec& spec = model.Column(column);
        const bool isDepth = m_host.AreDepths(spec.name);
        PlotCurve curve{.name = HeaderOf(spec), .ink = ink, .number = number, .hasPoints = true, .isMovable = true};
        ProfileCurve from{.table = table, .column = column, .isDepth = isDepth};
        const CShownNumbers values(model, column);
        const auto& lines = LinesOf(table);
        for (auto* each : {&curve.x, &curve.y})
            each->reserve(lines.size());
        from.rows.reserve(lines.size());
        for (const Line& line : lines) {
            const double value = values.In(model.Rows()->At(line.row)), bed = isDepth ? m_bed.At(line.x) : 0;
            if (!std::isfinite(value + bed) || value == NotGiven)
                continue;
            curve.x.push_back(line.x);
            curve.y.push_back(value + bed);
            from.rows.push_back(line.row);
        }
        Put(std::move(curve), std::move(from), spec.UnitSymbol());
    }

    /// What is an elevation, with the ground.
    void AddLevels()
    {
        std::vector<std::pair<int, int>> columns;
        for (int table = 0; table < int(m_profile.tables.size()); ++table)
            for (int column = FirstValue; column < int(Model(table).Columns().size()); ++column)
                if (IsCurve(Model(table).Column(column), Along::Elevation))
                    columns.emplace_back(table, column);
        m_profile.tracks.push_back({LevelsTrack, ProfileTexts::tr("Levels")});
        const bool isFront = std::ranges::any_of(
            columns, [this](auto each) { return m_profile.tables[std::size_t(each.first)].tab == m_host.FrontTab(); });
        if (!m_shown.contains(LevelsTrack) && !isFront)
            return;
        const CKsEditStyle style(UnitGroup::WaterLevel);
        const QString unit = style.UnitSymbol();
        AddTrack(QStringLiteral("%1 [%2]").arg(ProfileTexts::tr("Level"), unit)).weight = MainWeight;
        for (PlotCurve& curve : m_bed.Curves())
            Put(std::move(curve), {}, unit);
        int marks = 0;
        for (const auto& [table, column] : columns) {
            // The water of the initial conditions; the others are marks.
            const bool isWater = bool(Model(table).Column(column).Global());
            AddColumn(table, column, isWater ? PlotInk::Water : PlotInk::Other, isWater ? 0 : marks++);
            if (!isWater && m_profile.plot.tracks.back().curves.back().x.empty()) { // a mark that is not on this branch
                m_profile.plot.tracks.back().curves.pop_back();
                m_profile.curves.back().pop_back();
                m_profile.units.back().pop_back();
            }
        }
    }

    /// A track for each quantity of the table.
    void AddValues(int table)
    {
        const CGridModel& model = Model(table);
        const ProfileTable& its = m_profile.tables[std::size_t(table)];
        std::vector<QString> units;
        std::vector<std::vector<int>> columns;
        for (int column = FirstValue; column < int(model.Columns().size()); ++column) {
            if (!IsCurve(model.Column(column), Along::Value))
                continue;
            const QString unit = model.Column(column).UnitSymbol();
            const auto at = std::size_t(std::ranges::find(units, unit) - units.begin());
            if (at == units.size()) {
                units.push_back(unit);
                columns.emplace_back();
            }
            columns[at].push_back(column);
        }
        for (const auto& group : columns) {
            const ColumnSpec& first = model.Column(group.front());
            const QString name = group.size() == 1 ? HeaderOf(first) : its.page;
            const QString key = QStringLiteral("%1/%2").arg(its.tab).arg(QString::fromUtf8(first.name));
            m_profile.tracks.push_back(
                {key, group.size() == 1 ? QStringLiteral("%1: %2").arg(its.page, name) : WithUnitOf(name, first)});
            if (!IsShown(key, its.tab))
                continue;
            AddTrack(WithUnitOf(name, first));
            int number = 0;
            for (const int column : group)
                AddColumn(table, column, PlotInk::Other, number++);
        }
    }

    void AddReaches()
    {
        std::vector<std::pair<int, int>> columns;
        bool isFront = false;
        for (int table = 0; table < int(m_profile.tables.size()); ++table)
            for (int column = FirstValue; column < int(Model(table).Columns().size()); ++column)
                if (IsCurve(Model(table).Column(column), Along::ReachEnd)) {
                    columns.emplace_back(table, column);
                    isFront = isFront || m_profile.tables[std::size_t(table)].tab == m_host.FrontTab();
                }
        if (columns.empty())
            return;
        m_profile.tracks.push_back({ReachesTrack, ProfileTexts::tr("Reaches")});
        if (!m_shown.contains(ReachesTrack) && !isFront)
            return;
        PlotTrack& track = AddTrack({});
        track.weight = LaneWeight + 0.15 * double(columns.size());
        for (const auto& [table, column] : columns)
            AddLane(table, column);
        if (m_profile.plot.tracks.back().curves.empty()) { // on this branch
            m_profile.plot.tracks.pop_back();
            m_profile.curves.pop_back();
            m_profile.units.pop_back();
        }
    }

    /// A curve for each kind of reach: where the table has a choice for them, for each of its entries.
    void AddLane(int table, int column)
    {
        const CGridModel& model = Model(table);
        const auto kind = std::ranges::find_if(model.Columns(),
                                               [](const ColumnSpec& each) { return each.Kind() == CellKind::Choice; });
        const CShownNumbers ends(model, column);
        const QString page = m_profile.tables[std::size_t(table)].page;
        QStringList& lanes = m_profile.plot.tracks.back().lanes;
        const int lane = int(lanes.size());
        lanes << page;
        std::map<QString, std::pair<PlotCurve, ProfileCurve>> curves;
        for (const Line& line : LinesOf(table)) {
            const void* object = model.Rows()->At(line.row);
            const double end = ends.In(object);
            if (!std::isfinite(end) || end == NotGiven)
                continue;
            QString name = page;
            if (kind != model.Columns().end())
                name += QStringLiteral(": ") + kind->choices.TextOf(std::get<std::int32_t>(kind->access->get(object)));
            auto& [curve, from] = curves[name];
            curve.x.push_back(line.x);
            curve.y.push_back(lane);
            curve.end.push_back(end);
            from.rows.push_back(line.row);
        }
        for (auto& [name, made] : curves) {
            auto& [curve, from] = made;
            curve.name = name;
            curve.number = m_reachKinds++;
            from.table = table;
            from.column = column;
            Put(std::move(curve), std::move(from), {});
        }
    }

    /// Where no line stands a global value counts: before the first line of the branch, behind the last one, or all
    /// along it.
    void AddGlobals()
    {
        double from = std::numeric_limits<double>::infinity(), to = -from;
        const auto widen = [&](const std::vector<double>& places) {
            for (const double x : places) {
                from = std::min(from, x);
                to = std::max(to, x);
            }
        };
        widen(m_bed.Places());
        for (const PlotTrack& track : m_profile.plot.tracks)
            for (const PlotCurve& curve : track.curves) {
                widen(curve.x);
                widen(curve.end);
            }
        if (!(from < to))
            return;
        for (std::size_t track = 0; track < m_profile.plot.tracks.size(); ++track)
            for (std::size_t i = 0, count = m_profile.curves[track].size(); i < count; ++i)
                AddGlobal(track, i, from, to);
    }

    void AddGlobal(std::size_t track, std::size_t index, double from, double to)
    {
        const ProfileCurve& source = m_profile.curves[track][index];
        if (source.table < 0 || !m_profile.plot.tracks[track].curves[index].end.empty())
            return;
        const ColumnSpec& spec = Model(source.table).Column(source.column);
        const GlobalPlace global = spec.Global();
        if (!global.number)
            return;
        const double value = spec.style.Conversion().ToShown(*global.number);
        const PlotCurve& lines = m_profile.plot.tracks[track].curves[index];
        PlotCurve curve{.name = ProfileTexts::tr("%1, global").arg(lines.name),
                        .ink = lines.ink,
                        .number = lines.number,
                        .isDashed = true};
        const bool isDepth = m_host.AreDepths(spec.name);
        const auto add = [&](double x, double y) {
            curve.x.push_back(x);
            curve.y.push_back(y + (isDepth ? m_bed.At(x) : 0));
        };
        const auto stretch = [&](double first, double last) {
            if (!(first < last))
                return;
            if (!curve.x.empty())
                add(curve.x.back(), None);
            add(first, value);
            for (const double x : m_bed.Places())
                if (isDepth && x > first && x < last)
                    add(x, value);
            add(last, value);
        };
        stretch(from, lines.x.empty() ? to : lines.x.front());
        if (!lines.x.empty())
            stretch(lines.x.back(), to);
        if (curve.x.empty())
            return;
        m_profile.plot.tracks[track].curves.push_back(std::move(curve));
        m_profile.curves[track].emplace_back();
        m_profile.units[track].push_back(m_profile.units[track][index]);
    }

    IProfileHost& m_host;
    const QSet<QString>& m_shown;
    CBed m_bed;
    int m_reachKinds = 0;
    Profile m_profile;
    std::vector<std::optional<std::vector<Line>>> m_lines; // of the tables, once they are asked for
};

} // namespace

std::vector<PlotPoint> Profile::PointsOf(int table, std::size_t row) const
{
    std::vector<PlotPoint> points;
    for (std::size_t track = 0; track < curves.size(); ++track)
        for (std::size_t curve = 0; curve < curves[track].size(); ++curve) {
            const ProfileCurve& source = curves[track][curve];
            const auto at = source.table == table ? std::ranges::find(source.rows, row) : source.rows.end();
            if (at != source.rows.end())
                points.push_back({int(track), int(curve), std::size_t(at - source.rows.begin())});
        }
    return points;
}

QStringList ProfileBranchesOf(IProfileHost& host)
{
    QSet<QString> keys;
    for (const QString& branch : host.ProfileBranches())
        keys.insert(KsBranchKey(branch));
    for (const ProfileTable& table : host.ProfileTables()) {
        const CGridModel& model = *table.grid->Model();
        const ColumnSpec& branch = model.Column(BranchColumn);
        std::string before;
        CellValue copy;
        for (std::size_t row = model.Rows()->FixedRows(); row < model.Rows()->Count(); ++row) {
            const std::string* name = branch.access->TextIn(model.Rows()->At(row), copy);
            if (name && *name != before) {
                keys.insert(KsBranchKey(QString::fromStdString(*name)));
                before = *name;
            }
        }
    }
    keys.remove(QString());
    QStringList names(keys.begin(), keys.end());
    names.sort();
    return names;
}

Profile MakeProfile(IProfileHost& host, const QString& branch, const QSet<QString>& shown)
{
    return CMaker(host, branch, shown).Make();
}
