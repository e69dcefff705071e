// What the first line of a copied table says of its columns, and what its texts say of their decimal sign.
#include "grid/paste_plan.h"
#include "ks/fc/shown_text.h"
#include "ks/language/language.h"
#include "ks/units/unit_groups.h"

#include <QLocale>
#include <QRegularExpression>
#include <algorithm>

namespace {

constexpr std::size_t Sample = 10'000; // lines that are looked at

/// "Initial h [ft]".
struct Header
{
    QString name, unit;
};

QString Plain(const QString& name)
{
    return KsWithoutUnseen(name).remove(u'&').simplified().toCaseFolded();
}

Header ReadHeader(const QString& text)
{
    static const QRegularExpression withUnit(QStringLiteral("^(.*?)\\s*(?:\\[([^\\]]*)\\]|\\(([^)]*)\\))\\s*$"),
                                             QRegularExpression::DotMatchesEverythingOption);
    const auto match = withUnit.match(text);
    return match.hasMatch() ? Header{match.captured(1), (match.captured(2) + match.captured(3)).simplified()}
                            : Header{text, {}};
}

/// What a column may be called, without its unit.
QStringList NamesOf(const ColumnSpec& column)
{
    QStringList names{Plain(column.header()), Plain(ReadHeader(column.header()).name)};
    for (const QString& name : column.names ? column.names() : QStringList())
        names << Plain(name);
    return names;
}

bool SaysNothing(const QString& unit)
{
    return unit.isEmpty() || unit == u'-' || unit == u'1';
}

/// By column of the table.
std::vector<QStringList> AllNames(const CTableRows& rows)
{
    std::vector<QStringList> names;
    for (const ColumnSpec& column : rows.Columns())
        names.push_back(column.Kind() == CellKind::Button ? QStringList() : NamesOf(column));
    return names;
}

bool IsSomeNumber(QStringView text)
{
    return IsForeignNumber(text, DecimalSign::Point) || IsForeignNumber(text, DecimalSign::Comma);
}

/// What a text below a header says of the unit.
struct UnitCell
{
    bool mayBe = false; // it is no value
    QString unit{};
};

/// Below a header of a column of texts "A" is a name.
UnitCell ReadUnitCell(QStringView text, const ColumnSpec* target)
{
    const Header header = ReadHeader(text.toString());
    const bool isInBrackets = header.name.isEmpty() && !header.unit.isEmpty();
    const QString unit = isInBrackets ? header.unit : text.toString().simplified();
    if (SaysNothing(unit))
        return {unit != u'1'};
    if (!target)
        return {!IsSomeNumber(text)};
    const bool isNumeric = target->IsNumeric();
    if (isInBrackets || (isNumeric && (IsUnitOf(*target, unit) || KsIsUnit(unit))))
        return {true, isNumeric ? unit : QString()};
    return {};
}

const ColumnSpec* TargetOf(const CTableRows& rows, const std::vector<PasteChoice::Column>& columns, int column)
{
    const int target = columns[std::size_t(column)].target;
    return target < 0 ? nullptr : &rows.Column(target);
}

/// The sign with which more numbers can be read that cannot be read with the other one. "1.234" is what a cell takes,
/// unless others say that it is a thousand; "1,234" is what it is in the user's country.
DecimalSign DecimalSignOf(const CTableRows& rows, const CTextTable& texts, const PasteChoice& choice)
{
    int points = 0, commas = 0;
    bool hasPoints = false;
    for (std::size_t line = choice.hasHeaders + choice.hasUnits; line < std::min(texts.Lines(), Sample); ++line)
        for (int column = 0; column < texts.Width(line); ++column) {
            const int target = choice.columns[std::size_t(column)].target;
            if (target < 0 || !rows.Column(target).IsNumeric())
                continue;
            const QStringView text = texts.At(line, column);
            const bool withPoint = IsForeignNumber(text, DecimalSign::Point),
                       withComma = IsForeignNumber(text, DecimalSign::Comma);
            points += withPoint && !withComma;
            commas += withComma && !withPoint;
            hasPoints = hasPoints || (withPoint && text.contains(u'.'));
        }
    if (points != commas)
        return points > commas ? DecimalSign::Point : DecimalSign::Comma;
    return hasPoints || KsLangGetUserLocale().decimalPoint() != u"," ? DecimalSign::Point : DecimalSign::Comma;
}

} // namespace

QChar SeparatorOf(const ReadCopied& read)
{
    const CTextTable lines = read(u'\t').texts;
    for (const char16_t separator : Separators) {
        const CTextTable texts = separator == u'\t' ? lines : read(separator).texts;
        bool fits = texts.Width(0) > 1;
        for (std::size_t line = 0; fits && line < texts.Lines(); ++line)
            fits = (lines.Width(line) == 1 && lines.At(line, 0).trimmed().isEmpty()) || separator == u'\t' ||
                   (texts.Width(line) == texts.Width(0) && lines.Width(line) == 1 &&
                    (separator != u',' || !IsSomeNumber(lines.At(line, 0))));
        if (fits)
            return separator;
    }
    return u'\t';
}

bool SeemsDivided(const ReadCopied& read)
{
    const QChar separator = SeparatorOf(read);
    if (separator == u'\t')
        return false;
    const CTextTable texts = read(separator).texts;
    if (texts.Lines() > 1 || separator != u',')
        return true;
    const QStringList cells = texts.Line(0);
    return std::ranges::any_of(cells, [](const QString& cell) { return IsSomeNumber(cell); });
}

bool SeemsToHaveUnits(const CTextTable& texts, const CTableRows& rows, const std::vector<PasteChoice::Column>& columns)
{
    if (texts.Lines() < 3) // they are units of something
        return false;
    bool hasAny = false;
    for (int column = 0; column < texts.Width(1); ++column) {
        const UnitCell cell = ReadUnitCell(texts.At(1, column), TargetOf(rows, columns, column));
        if (!cell.mayBe)
            return false;
        hasAny = hasAny || !cell.unit.isEmpty();
    }
    return hasAny;
}

void TakeUnitLine(const CTextTable& texts, const CTableRows& rows, std::vector<PasteChoice::Column>& columns)
{
    for (int column = 0; column < texts.Width(1); ++column) {
        const ColumnSpec* const target = TargetOf(rows, columns, column);
        const QString unit = ReadUnitCell(texts.At(1, column), target).unit;
        if (QString& own = columns[std::size_t(column)].unit; own.isEmpty() && target && unit != target->UnitSymbol())
            own = unit;
    }
}

std::vector<PasteChoice::Column> ColumnsByHeaders(const CTableRows& rows, const CTextTable& texts, int column)
{
    const auto names = AllNames(rows);
    std::vector<PasteChoice::Column> columns(std::size_t(texts.Columns()));
    std::vector<bool> taken(names.size());
    bool hasAny = false;
    for (int i = 0; i < texts.Width(0); ++i) {
        const QString text = texts.At(0, i).toString();
        const Header header = ReadHeader(text);
        for (const QString& name : {Plain(text), Plain(header.name)}) {
            std::size_t target = 0;
            while (target < names.size() && (taken[target] || !names[target].contains(name)))
                ++target;
            if (target == names.size())
                continue;
            const ColumnSpec& spec = rows.Column(int(target));
            const bool saysUnit = name == Plain(header.name) && spec.IsNumeric() && !SaysNothing(header.unit);
            columns[std::size_t(i)] = {int(target),
                                       saysUnit && header.unit != spec.UnitSymbol() ? header.unit : QString()};
            taken[target] = hasAny = true;
            break;
        }
    }
    for (int i = 0; !hasAny && i < int(columns.size()) && column + i < int(names.size()); ++i) {
        const ColumnSpec& spec = rows.Column(column + i);
        const QString unit = i < texts.Width(0) ? ReadHeader(texts.At(0, i).toString()).unit : QString();
        const bool saysUnit = spec.IsNumeric() && unit != spec.UnitSymbol() && (IsUnitOf(spec, unit) || KsIsUnit(unit));
        columns[std::size_t(i)] = {column + i, saysUnit ? unit : QString()};
    }
    return columns;
}

bool HasHeadersInOrder(const CTableRows& rows, const CTextTable& texts, int column)
{
    if (texts.Lines() < 2 || column + texts.Width(0) > int(rows.Columns().size()))
        return false;
    for (int i = 0; i < texts.Width(0); ++i) {
        const Header header = ReadHeader(texts.At(0, i).toString());
        const ColumnSpec& spec = rows.Column(column + i);
        const QStringList names = NamesOf(spec);
        if (!names.contains(Plain(texts.At(0, i).toString())) &&
            !(names.contains(Plain(header.name)) && (SaysNothing(header.unit) || header.unit == spec.UnitSymbol())))
            return false;
    }
    return true;
}

bool SeemsToHaveHeaders(const CTableRows& rows, const CTextTable& texts, int column)
{
    if (texts.Lines() < 2)
        return false;
    const auto names = AllNames(rows);
    const bool hasUnits =
        SeemsToHaveUnits(texts, rows, ColumnsInOrder(rows, std::max(texts.Width(0), texts.Width(1)), column));
    const std::size_t below = hasUnits ? 2 : 1;
    int known = 0, above = 0;
    for (int i = 0; i < texts.Width(0); ++i) {
        const QString text = texts.At(0, i).toString();
        if (IsSomeNumber(text))
            return false;
        const QString name = Plain(ReadHeader(text).name);
        known += std::ranges::any_of(
            names, [&](const QStringList& of) { return of.contains(name) || of.contains(Plain(text)); });
        const bool isNumeric = column + i < int(rows.Columns().size()) && rows.Column(column + i).IsNumeric();
        above += isNumeric && !text.trimmed().isEmpty() && i < texts.Width(below) && IsSomeNumber(texts.At(below, i));
    }
    return known > 0 || above > 0;
}

PasteChoice AsItSeems(const CTableRows& rows, const CopiedTable& copied, int row, int column)
{
    PasteChoice choice = AsItStands(rows, copied, row, column);
    choice.hasHeaders = SeemsToHaveHeaders(rows, copied.texts, column);
    if (choice.hasHeaders) {
        choice.columns = ColumnsByHeaders(rows, copied.texts, column);
        choice.hasUnits = SeemsToHaveUnits(copied.texts, rows, choice.columns);
        if (choice.hasUnits)
            TakeUnitLine(copied.texts, rows, choice.columns);
        TakeUnits(rows, copied, choice); // surer than what headers say
    }
    choice.decimal = DecimalSignOf(rows, copied.texts, choice);
    return choice;
}
