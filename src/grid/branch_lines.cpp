#include "grid/branch_lines.h"

#include "base/not_given.h"
#include "ks/fc/branch_name.h"

#include <QSet>
#include <algorithm>
#include <cmath>

namespace {

constexpr int BranchColumn = 0, ChainageColumn = 1;
constexpr double SamePlace = 1e-6; // metres: what conversions of units leave

/// Calls `visit` with the row of the source, the branch and the chainage, if it is given, of each line.
template <typename Visit>
void ForLines(const CTableRows& rows, const Visit& visit)
{
    IRowSource& source = *rows.Rows();
    const CellAccess &names = *rows.Column(BranchColumn).access, &chainages = *rows.Column(ChainageColumn).access;
    std::string last; // lines of one branch mostly follow each other
    QString branch;
    for (std::size_t row = source.FixedRows(), end = source.Count(); row < end; ++row) {
        const void* const object = source.At(row);
        const CellValue name = names.get(object), chainage = chainages.get(object);
        if (const auto& text = std::get<std::string>(name); text != last || branch.isNull()) {
            last = text;
            branch = KsBranchKey(QString::fromStdString(text));
        }
        const auto* number = std::get_if<double>(&chainage);
        visit(row, branch, number && *number != NotGiven && std::isfinite(*number) ? number : nullptr);
    }
}

} // namespace

std::optional<std::vector<double>> ChainagesEvery(const ColumnSpec& column, double from, double to, double step)
{
    const auto shown = [&](double base) { return KsFifteenDigits(column.style.UnitConvertFromBase(base, 1)); };
    const double first = shown(from), every = shown(step);
    const double count = std::floor((shown(to) - first) / every * (1 + 1e-12)) + 1;
    if (!(count <= double(MostLinesAtOnce)))
        return std::nullopt;
    std::vector<double> chainages;
    for (double i = 0; i < count; ++i)
        chainages.push_back(KsFifteenDigits(column.style.UnitConvertFromBase(first + i * every, 0)));
    return chainages;
}

BranchInTable FindBranch(const CTableRows& rows, const QString& branch)
{
    const QString key = KsBranchKey(branch);
    BranchInTable found{.behind = rows.Rows()->Count()};
    ForLines(rows, [&](std::size_t row, const QString& name, const double* chainage) {
        if (name != key)
            return;
        found.behind = row + 1;
        if (chainage)
            found.chainages.push_back(*chainage);
    });
    std::ranges::sort(found.chainages);
    return found;
}

std::vector<double> WithoutKnown(std::vector<double> chainages, const BranchInTable& known)
{
    const auto isSame = [](double a, double b) { return std::abs(a - b) < SamePlace; };
    std::ranges::sort(chainages);
    const auto twins = std::ranges::unique(chainages, isSame);
    chainages.erase(twins.begin(), twins.end());
    std::erase_if(chainages, [&](double chainage) {
        const auto next = std::ranges::lower_bound(known.chainages, chainage - SamePlace);
        return next != known.chainages.end() && isSame(*next, chainage);
    });
    return chainages;
}

CPlacesInTable::CPlacesInTable(const CTableRows& rows)
{
    ForLines(rows, [this](std::size_t row, const QString& branch, const double* chainage) {
        if (chainage)
            m_rows[branch].emplace(*chainage, row); // behind those that are there already
    });
}

std::optional<std::size_t> CPlacesInTable::Take(const QString& branch, double chainage)
{
    const auto lines = m_rows.find(KsBranchKey(branch));
    if (lines == m_rows.end())
        return std::nullopt;
    const auto next = lines->second.lower_bound(chainage - SamePlace);
    if (next == lines->second.end() || !(next->first - chainage < SamePlace))
        return std::nullopt;
    const std::size_t row = next->second;
    lines->second.erase(next);
    return row;
}

void CPlacedLines::Add(std::size_t line, const QString& branch, double chainage, bool hasFound)
{
    const auto number = m_branches.try_emplace(KsBranchKey(branch), int(m_branches.size())).first->second;
    m_lines.push_back({number, chainage, line, hasFound});
}

std::vector<std::vector<std::size_t>> CPlacedLines::Crowds()
{
    std::ranges::stable_sort(m_lines, {}, [](const Line& line) { return std::pair(line.branch, line.chainage); });
    const auto isElsewhere = [](const Line& a, const Line& b) {
        return a.branch != b.branch || !(b.chainage - a.chainage < SamePlace);
    };
    std::vector<std::vector<std::size_t>> crowds;
    for (auto first = m_lines.begin(); first != m_lines.end();) {
        auto end = std::adjacent_find(first, m_lines.end(), isElsewhere);
        end += end != m_lines.end();
        if (end - first > 1 && !std::all_of(first, end, [](const Line& line) { return line.hasFound; })) {
            auto& crowd = crowds.emplace_back();
            for (; first != end; ++first)
                crowd.push_back(first->line);
        }
        first = end;
    }
    return crowds;
}

QStringList BranchesIn(const CTableRows& rows)
{
    QStringList branches;
    QSet<QString> met;
    ForLines(rows, [&](std::size_t, const QString& branch, const double*) {
        if (branch.isEmpty() || met.contains(branch))
            return;
        met.insert(branch);
        branches << branch;
    });
    return branches;
}

std::unique_ptr<IRowBlock> LinesAt(const CTableRows& rows, const PlacesOfBranch& places)
{
    auto lines = rows.NewLines(int(places.chainages.size()));
    const std::string branch = places.branch.toStdString();
    for (std::size_t i = 0; i < lines->Count(); ++i) {
        rows.Column(BranchColumn).access->set(lines->At(i), branch);
        rows.Column(ChainageColumn).access->set(lines->At(i), places.chainages[i]);
    }
    return lines;
}
