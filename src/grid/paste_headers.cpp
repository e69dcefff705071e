// What the first line of a copied table says of its columns, and what its texts say of their decimal sign.
#include "files/read_number.h"
#include "grid/paste_plan.h"
#include "ks/language/language.h"

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
    return QString(name).remove(u'&').simplified().toCaseFolded();
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

bool IsNumber(QStringView text, DecimalSign decimal)
{
    const QString plain = PlainNumber(text, decimal);
    return IsValidNumber(plain.section(u' ', 0, 0).toStdString());
}

bool IsSomeNumber(QStringView text)
{
    return IsNumber(text, DecimalSign::Point) || IsNumber(text, DecimalSign::Comma);
}

/// The sign with which more numbers can be read that cannot be read with the other one. "1.234" is what a cell takes,
/// unless others say that it is a thousand; "1,234" is what it is in the user's country.
DecimalSign DecimalSignOf(const CTableRows& rows, const CTextTable& texts, const PasteChoice& choice)
{
    int points = 0, commas = 0;
    bool hasPoints = false;
    for (std::size_t line = choice.hasHeaders; line < std::min(texts.Lines(), Sample); ++line)
        for (int column = 0; column < texts.Width(line); ++column) {
            const int target = choice.columns[std::size_t(column)].target;
            if (target < 0 || !rows.Column(target).IsNumeric())
                continue;
            const QStringView text = texts.At(line, column);
            const bool withPoint = IsNumber(text, DecimalSign::Point), withComma = IsNumber(text, DecimalSign::Comma);
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
            fits = separator == u'\t' || (texts.Width(line) == texts.Width(0) && lines.Width(line) == 1 &&
                                          (separator != u',' || !IsSomeNumber(lines.At(line, 0))));
        if (fits)
            return separator;
    }
    return u'\t';
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
    for (int i = 0; !hasAny && i < int(columns.size()) && column + i < int(names.size()); ++i)
        columns[std::size_t(i)].target = column + i;
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
    int known = 0, above = 0;
    for (int i = 0; i < texts.Width(0); ++i) {
        const QString text = texts.At(0, i).toString();
        if (IsSomeNumber(text))
            return false;
        const QString name = Plain(ReadHeader(text).name);
        known += std::ranges::any_of(
            names, [&](const QStringList& of) { return of.contains(name) || of.contains(Plain(text)); });
        const bool isNumeric = column + i < int(rows.Columns().size()) && rows.Column(column + i).IsNumeric();
        above += isNumeric && !text.trimmed().isEmpty() && i < texts.Width(1) && IsSomeNumber(texts.At(1, i));
    }
    return known > 0 || above > 0;
}

PasteChoice AsItSeems(const CTableRows& rows, const CopiedTable& copied, int row, int column)
{
    PasteChoice choice = AsItStands(rows, copied, row, column);
    choice.hasHeaders = SeemsToHaveHeaders(rows, copied.texts, column);
    if (choice.hasHeaders) {
        choice.columns = ColumnsByHeaders(rows, copied.texts, column);
        TakeUnits(rows, copied, choice); // surer than what headers say
    }
    choice.decimal = DecimalSignOf(rows, copied.texts, choice);
    return choice;
}
