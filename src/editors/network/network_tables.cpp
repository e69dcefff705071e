#include "editors/network/network_tables.h"

#include "editors/network/document.h"
#include "editors/network/network_rules.h"
#include "grid/field_columns.h"
#include "grid/vector_rows.h"
#include "ks/fc/branch_name.h"
#include "ks/language/language.h"

#include <QHash>
#include <algorithm>
#include <numeric>
#include <unordered_map>

namespace {

struct NetworkTables
{
    Q_DECLARE_TR_FUNCTIONS(NetworkTables)
};

/// What stands behind a place in a report, for a message of its own.
QString Sentence(QString text)
{
    text.front() = text.front().toUpper();
    return text;
}

class CBranchRows : public VectorRows<CNetworkBranch>
{
public:
    explicit CBranchRows(CNetworkDoc& document) : VectorRows(document.Network().branches) {}

    bool MayGrow() const override { return false; }
    QString LostWhenCut() const override
    {
        return NetworkTables::tr("Cut. Vertices and channel are not on the clipboard; Undo brings them back.");
    }
    bool HasRules() const override { return true; }
    std::vector<Fault> FindFaults(std::size_t first, IRowBlock& rows, std::size_t most) const override
    {
        CBranchKeys taken; // by the others
        for (std::size_t row = 0; row < Count(); ++row) {
            if (row < first || row >= first + rows.Count())
                taken.insert(KsBranchKey(Rows()[row].Name()));
        }
        std::unordered_map<QString, std::size_t> rowOf;
        std::vector<Fault> faults;
        for (std::size_t i = 0; i < rows.Count() && faults.size() < most; ++i) {
            const auto& branch = *static_cast<const CNetworkBranch*>(rows.At(i));
            const QString key = KsBranchKey(branch.Name());
            if (const CBranchFault fault = ::FindFault(branch, taken); fault.rule != CBranchFault::None) {
                const Field& field = fault.rule == CBranchFault::EndsDiffer ? FieldOf(&CNetworkBranch::end)
                                                                            : FieldOf(&CNetworkBranch::name);
                const auto other = rowOf.find(key);
                faults.push_back({i, Sentence(fault.Text()), field.name,
                                  other == rowOf.end() ? std::nullopt : std::optional(other->second)});
                continue;
            }
            taken.insert(key);
            rowOf.emplace(key, i);
        }
        return faults;
    }
};

/// Branches move in memory when others come and go, so the channel is looked for by the branch's place.
std::vector<CChannelRow>& ChannelOf(CNetworkDoc& document, std::size_t branch)
{
    static std::vector<CChannelRow> none;
    auto& branches = document.Network().branches;
    return branch < branches.size() ? branches[branch].channel : none;
}

class CChannelRows : public VectorRows<CChannelRow>
{
public:
    CChannelRows(CNetworkDoc& document, std::size_t branch)
        : VectorRows([&document, branch]() -> std::vector<CChannelRow>& { return ChannelOf(document, branch); },
                     {&document.Network().branches, [branch] { return branch; }}),
          m_branch([&document, branch] { return &document.Network().branches[branch]; })
    {
    }

    /// Half way from the line above to the one below, the branch's end at last; without radius and width.
    void Fit(IRowBlock& rows, std::size_t at) const override
    {
        const CNetworkBranch& branch = *m_branch();
        const auto& channel = branch.channel;
        const auto [low, high] = std::minmax(branch.start, branch.end);
        for (std::size_t i = 0; i < rows.Count(); ++i) {
            auto& row = *static_cast<CChannelRow*>(rows.At(i));
            if (i == 0 && channel.empty()) {
                row.chainage = low;
                continue;
            }
            const std::size_t above = at > 0 ? at - 1 : 0;
            const double from = i > 0 ? static_cast<CChannelRow*>(rows.At(i - 1))->chainage : channel[above].chainage;
            double to = at < channel.size() ? channel[at].chainage : high;
            if (to <= from) // the last line is at the end of the branch
                to = above > 0 ? channel[above - 1].chainage : low;
            row.chainage = std::midpoint(from, to);
        }
    }
    bool HasRules() const override { return true; }
    std::vector<Fault> FindFaults(std::size_t first, IRowBlock& rows, std::size_t most) const override
    {
        QHash<double, std::optional<std::size_t>> taken; // by one of `rows`, or by another
        for (std::size_t row = 0; row < Count(); ++row) {
            if (row < first || row >= first + rows.Count())
                taken.insert(Rows()[row].chainage, std::nullopt);
        }
        std::vector<Fault> faults;
        for (std::size_t i = 0; i < rows.Count() && faults.size() < most; ++i) {
            const double chainage = static_cast<const CChannelRow*>(rows.At(i))->chainage;
            if (const auto other = taken.constFind(chainage); other != taken.constEnd())
                faults.push_back({i, NetworkTables::tr("There is a line at this chainage already."),
                                  FieldOf(&CChannelRow::chainage).name, *other});
            else
                taken.insert(chainage, i);
        }
        return faults;
    }
    bool IsSequence() const override { return true; }
    bool MayMove() const override { return false; } // the chainage says where
    std::vector<std::size_t> Order() const override
    {
        const auto& channel = Rows();
        if (std::ranges::is_sorted(channel, {}, &CChannelRow::chainage))
            return {};
        std::vector<std::size_t> order(channel.size());
        std::iota(order.begin(), order.end(), 0);
        std::ranges::stable_sort(order, {}, [&channel](std::size_t row) { return channel[row].chainage; });
        return order;
    }

private:
    std::function<const CNetworkBranch*()> m_branch;
};

} // namespace

std::shared_ptr<IRowSource> MakeBranchRows(CNetworkDoc& document)
{
    return std::make_shared<CBranchRows>(document);
}

std::shared_ptr<IRowSource> MakeChannelRows(CNetworkDoc& document, int branch)
{
    if (branch < 0 || std::size_t(branch) >= document.Network().branches.size())
        return nullptr;
    return std::make_shared<CChannelRows>(document, std::size_t(branch));
}

static constexpr TableStyle Tables{
    .text = [](const TextLine& line) { return NetworkTables::tr(line.source); },
    .inAllLanguages = [](const TextLine& line) { return KsLangInAll("Kavo0_nw", "NetworkTables", line.source); },
    .besideAPicture = true};

void AddBranchColumns(CGridModel& model)
{
    using N = CNetworkBranch;
    const CellAccess vertices{
        [](const void* row) -> CellValue { return std::int32_t(static_cast<const N*>(row)->line.size()); },
        [](void*, const CellValue&) {}};
    static constexpr Field counted =
        Field{.name = "vertices", .kind = FieldKind::Integer}.Title(QT_TRANSLATE_NOOP("NetworkTables", "Vertices"));
    const auto hint = [] {
        return NetworkTables::tr("Whether water flows towards increasing or decreasing chainages");
    };
    FieldColumns(model, Tables)
        .Value(&N::name, {.namesLine = true})
        .Value(&N::start)
        .Value(&N::end)
        .Value(vertices, counted, {.locked = [](const void*) { return true; }})
        .Value(&N::downstream, {.choices = {.whenEmptied = true}, .hint = hint});
}

void AddChannelColumns(CGridModel& model)
{
    using R = CChannelRow;
    FieldColumns(model, Tables).Value(&R::chainage, {.namesLine = true}).Value(&R::radius).Value(&R::width);
}
