#include "profile/profile_edit.h"

#include "grid/bounds.h"
#include "grid/cell_commands.h"
#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "ks/fc/doc.h"
#include "profile/profile_texts.h"

#include <algorithm>
#include <cmath>

namespace {

constexpr int ChainageColumn = 1;

CGenGrid& GridOf(const Profile& profile, const ProfileCurve& curve)
{
    return *profile.tables[std::size_t(curve.table)].grid;
}

/// The row that shows a line, which a filter may have hidden; -1 when the table has it no more.
int ShownRowOf(CGenGrid& grid, std::size_t row)
{
    CGridModel& model = *grid.Model();
    model.Sync();
    if (row >= model.Rows()->Count())
        return -1;
    if (model.ShownRow(row) < 0)
        model.Unhide(row);
    return model.ShownRow(row);
}

void SetCell(const Profile& profile, const PlotPoint& point, int column, double value, const QString& step)
{
    const ProfileCurve& source = profile.At(point);
    CGenGrid& grid = GridOf(profile, source);
    const int row = ShownRowOf(grid, source.rows[point.point]);
    if (row < 0 || !grid.MayChange())
        return;
    CCellResults results(*grid.Model(), {row, column, row, column});
    results.AddShown(row, column, value);
    const auto& kept = results.Kept();
    if (!kept.empty())
        grid.Model()->Document()->Say(ProfileTexts::tr("The point stays where it was: %1").arg(kept.front().after));
    else
        MakeResults(grid, std::move(results), step, step, step);
}

/// The lines of a curve between which a place is on the branch: how many are before it.
std::size_t LinesBefore(const PlotCurve& curve, double chainage)
{
    return std::size_t(std::ranges::upper_bound(curve.x, chainage) - curve.x.begin());
}

/// The other numbers of a new line between two others lie on straight lines between theirs: a point that is added to
/// one curve leaves the others as they run.
void Interpolate(const CGridModel& model, void* line, const void* before, const void* behind, double share, int but)
{
    for (int column = ChainageColumn + 1; column < int(model.Columns().size()); ++column) {
        const ColumnSpec& spec = model.Column(column);
        if (column == but || spec.Kind() != CellKind::Number || spec.along == Along::ReachEnd)
            continue;
        CellValue first, last;
        const double *from = spec.access->NumberIn(before, first), *to = spec.access->NumberIn(behind, last);
        if (from && to && *from != NotGiven && *to != NotGiven && std::isfinite(*to - *from))
            spec.access->set(line, KsFormatNumber(QStringLiteral("%.7lg"), std::lerp(*from, *to, share)).toDouble());
    }
}

} // namespace

void SetProfileValue(const Profile& profile, const PlotPoint& point, double value)
{
    const ProfileCurve& source = profile.At(point);
    const PlotCurve& curve = profile.plot.tracks[std::size_t(point.track)].curves[std::size_t(point.curve)];
    const double bed = source.isDepth ? profile.bedAt(curve.x[point.point]) : 0;
    SetCell(profile, point, source.column, KsFifteenDigits(value - bed, value),
            ProfileTexts::tr("Dragging of a point"));
}

void MoveProfileLine(const Profile& profile, const PlotPoint& point, double chainage)
{
    SetCell(profile, point, ChainageColumn, chainage, ProfileTexts::tr("Dragging along the branch"));
}

std::optional<std::size_t> AddProfileLine(const Profile& profile, int track, int curve, double chainage, double value)
{
    const ProfileCurve& source = profile.curves[std::size_t(track)][std::size_t(curve)];
    CGenGrid& grid = GridOf(profile, source);
    CGridModel& model = *grid.Model();
    if (!grid.MayChange())
        return {};
    model.Sync();
    const auto refuse = [&](const QString& why) {
        model.Document()->Say(ProfileTexts::tr("No line was added: %1").arg(why));
        return std::optional<std::size_t>();
    };
    if (!model.Rows()->MayGrow())
        return refuse(ProfileTexts::tr("the table takes no further lines"));
    const ColumnSpec &spec = model.Column(source.column), &along = model.Column(ChainageColumn);
    const double bed = source.isDepth ? profile.bedAt(chainage) : 0;
    if (!std::isfinite(bed))
        return refuse(ProfileTexts::tr("there is no cross section on both sides that would tell the depth"));
    const double base = spec.style.Conversion().ToBase(KsFifteenDigits(value - bed, value));
    if (!spec.bounds.Allow(base))
        return refuse(ProfileTexts::tr("%1 is expected").arg(BoundsText(spec.bounds, spec.style)));

    auto line = model.NewLines(1);
    void* const row = line->At(0);
    model.Column(0).access->set(row, profile.branch.toStdString());
    along.access->set(row, along.style.Conversion().ToBase(KsFifteenDigits(chainage)));
    spec.access->set(row, base);
    const PlotCurve& shown = profile.plot.tracks[std::size_t(track)].curves[std::size_t(curve)];
    const std::size_t before = LinesBefore(shown, chainage);
    const std::size_t at = source.rows.empty() ? model.Rows()->Count()
                           : before > 0        ? source.rows[before - 1] + 1
                                               : source.rows.front();
    if (before > 0 && before < source.rows.size()) {
        const double width = shown.x[before] - shown.x[before - 1];
        Interpolate(model, row, model.Rows()->At(source.rows[before - 1]), model.Rows()->At(source.rows[before]),
                    width > 0 ? (chainage - shown.x[before - 1]) / width : 0, source.column);
    }
    if (const QString why = model.WhyNotBetween(at, *line); !why.isEmpty())
        return refuse(why);
    const std::size_t place = model.PutLines(ProfileTexts::tr("Insertion of a line"), at, std::move(line));
    model.Document()->Say(ProfileTexts::tr("Line inserted"));
    if (grid.Host())
        grid.Host()->LineEdited(grid);
    grid.Reload();
    return place;
}

void RemoveProfileLine(const Profile& profile, const PlotPoint& point)
{
    const ProfileCurve& source = profile.At(point);
    CGenGrid& grid = GridOf(profile, source);
    const int row = ShownRowOf(grid, source.rows[point.point]);
    if (row < 0 || !grid.MayChange())
        return;
    grid.Model()->RemoveRows(row, 1);
    if (grid.Host())
        grid.Host()->LineEdited(grid);
    grid.Reload();
}
