#include "grid/row_filter.h"

#include "files/read_number.h"
#include "grid/cell_text.h"
#include "grid/grid_texts.h"
#include "ks/fc/branch_name.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <memory>
#include <set>

namespace {

constexpr double Infinite = std::numeric_limits<double>::infinity();

/// From, to, and whether the ends belong to it.
struct Range
{
    double from = -Infinite, to = Infinite;
    bool open = false, inverted = false;
};

std::optional<double> Number(const QString& text)
{
    return ReadNumber(text.trimmed().toStdString());
}

/// "12.5" is what shows so with one decimal.
Range AsShown(const QString& text, double number)
{
    const QString digits = text.section(u'e', 0, 0, QString::SectionCaseInsensitiveSeps);
    const qsizetype point = digits.indexOf(u'.');
    const double power = text.size() > digits.size() ? text.mid(digits.size() + 1).toDouble() : 0;
    const double half = std::pow(10, power - double(point < 0 ? 0 : digits.size() - point - 1)) / 2;
    return {number - half, number + half};
}

/// Nothing for a text that is no condition; all numbers for one that is not complete.
std::optional<Range> ReadRange(const QString& text)
{
    static constexpr std::pair<QLatin1String, int> operators[] = {{QLatin1String(">="), 0}, {QLatin1String("<="), 1},
                                                                  {QLatin1String("!="), 2}, {QLatin1String(">"), 3},
                                                                  {QLatin1String("<"), 4},  {QLatin1String("="), 5}};
    for (const auto& [sign, which] : operators) {
        if (!text.startsWith(sign))
            continue;
        const QString rest = text.mid(sign.size()).trimmed();
        const auto number = Number(rest);
        if (!number)
            return rest.isEmpty() || rest == u'-' ? std::optional(Range()) : std::nullopt;
        switch (which) {
        case 0:
            return Range{*number, Infinite};
        case 1:
            return Range{-Infinite, *number};
        case 2:
            return Range{*number, *number, false, true};
        case 3:
            return Range{*number, Infinite, true};
        case 4:
            return Range{-Infinite, *number, true};
        default:
            return Range{*number, *number};
        }
    }
    if (const qsizetype dots = text.indexOf(QStringLiteral("..")); dots >= 0) {
        const QString left = text.left(dots).trimmed(), right = text.mid(dots + 2).trimmed();
        const auto from = left.isEmpty() ? -Infinite : Number(left), to = right.isEmpty() ? Infinite : Number(right);
        return from && to ? std::optional(Range{*from, *to}) : right == u'-' ? std::optional(Range()) : std::nullopt;
    }
    if (const auto number = Number(text))
        return AsShown(text, *number);
    return text == u'-' ? std::optional(Range()) : std::nullopt;
}

/// Plain letters of a text that is searched without regard to capitals.
bool ContainsPlain(std::string_view text, std::string_view capitals)
{
    const auto upper = [](char c) { return c >= 'a' && c <= 'z' ? char(c - 'a' + 'A') : c; };
    return std::ranges::search(text, capitals, {}, upper).begin() != text.end() || capitals.empty();
}

bool IsPlain(std::string_view text)
{
    return std::ranges::none_of(text, [](char c) { return c & 0x80; });
}

} // namespace

CCellFilter::CCellFilter(const ColumnSpec& column, const QString& typed)
{
    const QString text = typed.trimmed();
    if (text.isEmpty() || column.Kind() == CellKind::Button)
        return;
    if (text == QStringLiteral("\"\"") || text == QStringLiteral("=\"\""))
        m_passes = EmptyCells(column, true);
    else if (text == QStringLiteral("!=\"\""))
        m_passes = EmptyCells(column, false);
    else
        m_passes = column.IsNumeric() ? NumberCondition(column, text) : TextCondition(column, text);
}

CCellFilter::Condition CCellFilter::EmptyCells(const ColumnSpec& column, bool wanted)
{
    return [&column, wanted](const CellValue& value) { return IsEmptyCell(column, value) == wanted; };
}

CCellFilter::Condition CCellFilter::NumberCondition(const ColumnSpec& column, const QString& text)
{
    const auto range = ReadRange(text);
    if (!range) {
        m_refusal = GridTexts::tr("\"%1\" is no condition for numbers. Possible are 5, =5, !=5, >5, >=5, <5, <=5, 2..7 "
                                  "and \"\" for empty cells.")
                        .arg(text);
        return {};
    }
    if (range->from == -Infinite && range->to == Infinite)
        return {};
    // What the conversion of units adds in the last place tells no numbers apart.
    const auto toBase = [&column](double shown) {
        return column.Kind() == CellKind::Integer || std::isinf(shown) ? shown
                                                                       : column.style.UnitConvertFromBase(shown, 0);
    };
    const auto slack = [](double number) { return std::isinf(number) ? 0 : std::abs(number) * 1e-12; };
    const double from = toBase(range->from), to = toBase(range->to), way = range->open ? 1 : -1;
    const double low = from + way * slack(from), high = to - way * slack(to);
    return [&column, low, high, open = range->open, inverted = range->inverted](const CellValue& value) {
        if (IsEmptyCell(column, value))
            return inverted;
        const auto* integer = std::get_if<std::int32_t>(&value);
        const double number = integer ? *integer : std::get<double>(value);
        return (open ? number > low && number < high : number >= low && number <= high) != inverted;
    };
}

CCellFilter::Condition CCellFilter::TextCondition(const ColumnSpec& column, const QString& text)
{
    const bool isNot = text.startsWith(QStringLiteral("!=")), isWhole = isNot || text.startsWith(u'=');
    const QString wanted = KsBranchKey(text.mid(isNot ? 2 : isWhole ? 1 : 0));
    if (wanted.isEmpty())
        return {};
    const auto passes = [wanted, isNot, isWhole](const QString& cell) {
        const QString key = KsBranchKey(cell);
        return isWhole ? (key == wanted) != isNot : key.contains(wanted);
    };
    if (column.Kind() != CellKind::Text && column.Kind() != CellKind::TextChoice)
        return [&column, passes](const CellValue& value) { return passes(EditText(column, value)); };
    struct Seen
    {
        std::string text;
        bool passes = false;
    };
    const auto last = std::make_shared<Seen>(); // neighbours mostly are of one branch
    last->passes = passes({});
    return [passes, last, isWhole, plain = IsPlain(wanted.toStdString()),
            capitals = wanted.toStdString()](const CellValue& value) {
        const auto* cell = std::get_if<std::string>(&value);
        if (!cell)
            return false;
        if (*cell == last->text)
            return last->passes;
        last->text = *cell;
        last->passes = plain && !isWhole && IsPlain(*cell) ? ContainsPlain(*cell, capitals)
                                                           : passes(QString::fromStdString(*cell));
        return last->passes;
    };
}

std::vector<bool> HiddenRows(IRowSource& rows, const std::vector<ColumnSpec>& columns, const QStringList& texts)
{
    std::vector<bool> hidden;
    for (qsizetype i = 0; i < std::min(texts.size(), qsizetype(columns.size())); ++i) {
        const ColumnSpec& column = columns[std::size_t(i)];
        const CCellFilter filter(column, texts[i]);
        if (filter.IsForAll())
            continue;
        hidden.resize(rows.Count());
        for (std::size_t row = rows.FixedRows(); row < hidden.size(); ++row)
            if (!hidden[row] && !filter.Passes(column.access->get(rows.At(row))))
                hidden[row] = true;
    }
    return hidden;
}

QStringList TextsOf(IRowSource& rows, const ColumnSpec& column, qsizetype most)
{
    std::set<std::string> texts;
    std::string last;
    for (std::size_t row = rows.FixedRows(); row < rows.Count() && qsizetype(texts.size()) < most; ++row) {
        const CellValue value = column.access->get(rows.At(row));
        const auto* text = std::get_if<std::string>(&value);
        if (text && *text != last)
            texts.insert(last = *text);
    }
    QStringList list;
    for (const std::string& text : texts)
        list << QString::fromStdString(text);
    return list;
}
