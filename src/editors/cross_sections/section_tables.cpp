#include "editors/cross_sections/section_tables.h"

#include "editors/cross_sections/document.h"
#include "grid/field_columns.h"
#include "grid/vector_rows.h"
#include "ks/fc/branch_name.h"
#include "ks/language/language.h"

#include <map>
#include <numeric>

namespace {

struct SectionTables
{
    Q_DECLARE_TR_FUNCTIONS(SectionTables)
};

class CSectionRows : public VectorRows<CCrossSection>
{
public:
    explicit CSectionRows(CCrossSectionDoc& document) : VectorRows(document.Sections().sections), m_document(document)
    {
    }
    QString LostWhenCut() const override
    {
        return SectionTables::tr("Cut. The points are not on the clipboard; Undo brings them back.");
    }

    /// On the branch of the section above, between it and the next one; the first of all is on a branch of the project.
    void Fit(IRowBlock& rows, std::size_t at) const override
    {
        constexpr double step = 100; // metres, behind the only section of a branch
        for (std::size_t i = 0; i < rows.Count(); ++i) {
            auto& line = *static_cast<CCrossSection*>(rows.At(i));
            const auto* before = i > 0 ? static_cast<CCrossSection*>(rows.At(i - 1)) : Above(at, 1);
            if (!before) {
                line.branch = m_document.NewBranch().toStdString();
                continue;
            }
            line.branch = before->branch;
            line.topoId = before->topoId;
            const CCrossSection *next = Above(at + 1, 1), *previous = i > 0 ? Above(at, 1) : Above(at, 2);
            if (next && KsSameBranch(next->Branch(), line.Branch()))
                line.chainage = std::midpoint(before->chainage, next->chainage);
            else if (previous && KsSameBranch(previous->Branch(), line.Branch()))
                line.chainage = 2 * before->chainage - previous->chainage;
            else
                line.chainage = before->chainage + step;
            while (m_document.Sections().IsTaken(line)) // by a section that stands elsewhere in the table
                line.chainage += step;
        }
    }
    bool HasRules() const override { return true; }
    std::vector<Fault> FindFaults(std::size_t first, IRowBlock& rows, std::size_t most) const override
    {
        std::map<decltype(CCrossSection().Key()), std::optional<std::size_t>> taken; // by one of `rows`, or by another
        for (std::size_t row = 0; row < Count(); ++row) {
            if (row < first || row >= first + rows.Count())
                taken.emplace(Rows()[row].Key(), std::nullopt);
        }
        std::vector<Fault> faults;
        for (std::size_t i = 0; i < rows.Count() && faults.size() < most; ++i) {
            const auto& section = *static_cast<const CCrossSection*>(rows.At(i));
            if (section.branch.empty())
                faults.push_back({i, ::FindFault(section).text, FieldOf(&CCrossSection::branch).name});
            else if (const auto [other, isFree] = taken.emplace(section.Key(), i); !isFree)
                faults.push_back({i, WhyTaken(section), FieldOf(&CCrossSection::chainage).name, other->second});
        }
        return faults;
    }

private:
    /// The section so many lines above the place `at`; null when there is none.
    const CCrossSection* Above(std::size_t at, std::size_t lines) const
    {
        return at >= lines && at - lines < Count() ? &Rows()[at - lines] : nullptr;
    }

    CCrossSectionDoc& m_document;
};

/// Sections move in memory when others come and go, so the points are looked for by the section's place.
std::vector<CSectionPoint>& PointsOf(CCrossSectionDoc& document, std::size_t section)
{
    static std::vector<CSectionPoint> none;
    auto& sections = document.Sections().sections;
    return section < sections.size() ? sections[section].points : none;
}

class CPointRows : public VectorRows<CSectionPoint>
{
public:
    CPointRows(CCrossSectionDoc& document, std::size_t section)
        : VectorRows([&document, section]() -> std::vector<CSectionPoint>& { return PointsOf(document, section); },
                     {&document.Sections().sections, [section] { return section; }})
    {
    }

    /// Half way from the point above to the one below; behind the last one as far again.
    void Fit(IRowBlock& rows, std::size_t at) const override
    {
        constexpr double step = 1; // metres, behind the only point
        const auto& points = Rows();
        for (std::size_t i = 0; i < rows.Count(); ++i) {
            auto& point = *static_cast<CSectionPoint*>(rows.At(i));
            if (i == 0 && at == 0)
                continue;
            const CSectionPoint before = i > 0 ? *static_cast<CSectionPoint*>(rows.At(i - 1)) : points[at - 1];
            if (at < points.size())
                point = {std::midpoint(before.offset, points[at].offset),
                         std::midpoint(before.level, points[at].level)};
            else
                point = {before.offset + (at > 1 ? points[at - 1].offset - points[at - 2].offset : step), before.level};
        }
    }
    bool IsSequence() const override { return true; }
    bool HasRules() const override { return true; }
    std::vector<Fault> FindFaults(std::size_t first, IRowBlock& rows, std::size_t most) const override
    {
        const auto fault = [](std::size_t row, std::optional<std::size_t> with) {
            return Fault{row, SectionRule(CSectionFault::Point), FieldOf(&CSectionPoint::offset).name, with};
        };
        const CSectionPoint* last = first > 0 ? &Rows()[first - 1] : nullptr;
        std::optional<std::size_t> lastRow;
        std::vector<Fault> faults;
        for (std::size_t i = 0; i < rows.Count() && faults.size() < most; ++i) {
            const auto* point = static_cast<const CSectionPoint*>(rows.At(i));
            if (last && last->offset > point->offset) {
                faults.push_back(fault(i, lastRow));
                continue;
            }
            last = point;
            lastRow = i;
        }
        const std::size_t behind = first + rows.Count();
        const bool isTooFar = lastRow && behind < Count() && last->offset > Rows()[behind].offset;
        if (isTooFar && faults.size() < most)
            faults.push_back(fault(*lastRow, std::nullopt));
        return faults;
    }
};

} // namespace

std::shared_ptr<IRowSource> MakeSectionRows(CCrossSectionDoc& document)
{
    return std::make_shared<CSectionRows>(document);
}

std::shared_ptr<IRowSource> MakePointRows(CCrossSectionDoc& document, int section)
{
    return document.Section(section) ? std::make_shared<CPointRows>(document, std::size_t(section)) : nullptr;
}

static constexpr TableStyle Tables{
    .text = [](const TextLine& line) { return SectionTables::tr(line.source); },
    .inAllLanguages = [](const TextLine& line) { return KsLangInAll("Kavo0_xs", "SectionTables", line.source); },
    .besideAPicture = true};

QString TitleOf(double CSectionPoint::*value)
{
    return Tables.text(FieldOf(value).title);
}

void AddSectionColumns(CGridModel& model)
{
    using C = CCrossSection;
    FieldColumns(model, Tables)
        .Value(&C::branch, {.namesLine = true})
        .Value(&C::chainage, {.namesLine = true})
        .Value(&C::radius)
        .Value(&C::width)
        .Value(&C::topoId);
}

void AddPointColumns(CGridModel& model)
{
    using P = CSectionPoint;
    FieldColumns(model, Tables).Value(&P::offset, {.namesLine = true}).Value(&P::level);
}
