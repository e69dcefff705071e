#include "grid/date_time_text.h"

#include "grid/grid_texts.h"
#include "ks/language/date_time.h"
#include "ks/language/language.h"

#include <QDateTime>
#include <QLocale>
#include <QRegularExpression>
#include <QTimeZone>
#include <array>

namespace {

/// Years of two digits are those from 1970 to 2069.
constexpr int FirstShortYear = 70;

int FullYear(int year)
{
    return year < FirstShortYear ? 2000 + year : 1900 + year;
}

/// The locale's long time without the zone, which the values do not have.
QString TimeFormat(const QLocale& locale)
{
    static const QRegularExpression zone(QStringLiteral("\\W*t+\\W*"), QRegularExpression::UseUnicodePropertiesOption);
    QStringList parts = locale.timeFormat(QLocale::LongFormat).split(u'\''); // every other one is quoted
    for (qsizetype part = 0; part < parts.size(); part += 2)
        parts[part].remove(zone);
    return parts.join(u'\'');
}

/// One kind of digits, of blanks and of letters, whatever keyboard or input method they come from.
QString Plain(const QString& text)
{
    QString plain = text.normalized(QString::NormalizationForm_KC);
    for (QChar& c : plain) {
        if (c.digitValue() >= 0)
            c = QChar(u'0' + c.digitValue());
        else if (c.category() == QChar::Other_Format) // marks of direction
            c = u' ';
        else if (c == QChar(0x2212)) // the sign that is not the hyphen
            c = u'-';
    }
    return plain.simplified().toLower();
}

/// Halves of the day become "<a" and "<p", however the locale spells them.
QString WithPlainHalves(QString text, const QLocale& locale)
{
    const auto mark = [&text](const QString& spelling, const char* half) {
        if (spelling.isEmpty())
            return;
        const QRegularExpression word(
            QStringLiteral("(?<!\\p{L})%1(?!\\p{L})").arg(QRegularExpression::escape(Plain(spelling))));
        text.replace(word, QLatin1String(half));
    };
    for (const QString& am : {locale.amText(), QStringLiteral("a.m."), QStringLiteral("am"), QStringLiteral("午前")})
        mark(am, "<a");
    for (const QString& pm : {locale.pmText(), QStringLiteral("p.m."), QStringLiteral("pm"), QStringLiteral("午後")})
        mark(pm, "<p");
    return text;
}

/// Names of zones of time: the general ones, and those that this computer's zone has in the locale.
QString ZoneNames(const QLocale& locale)
{
    QStringList names{QStringLiteral("(?:utc|gmt)(?:[+-]\\d{1,2}(?::?\\d{2})?)?")};
    const QTimeZone zone = QTimeZone::systemTimeZone();
    for (const auto season : {QTimeZone::StandardTime, QTimeZone::DaylightTime})
        names << QRegularExpression::escape(Plain(zone.displayName(season, QTimeZone::ShortName, locale)));
    for (const int month : {1, 7})
        names << QRegularExpression::escape(Plain(zone.abbreviation({QDate(2024, month, 1), QTime(12, 0)})));
    names.removeAll(QString());
    return QStringLiteral("(?:%1)").arg(names.join(u'|'));
}

/// What may stand behind a time.
QString ZoneBehind(const QLocale& locale)
{
    return QStringLiteral(" ?\\(?(?:z|%1|[+-]\\d{2}(?::?\\d{2})?)\\)?").arg(ZoneNames(locale));
}

/// The international form that has no separators, with them: "20240531T1800" and the like.
QString WithSeparators(const QString& plain)
{
    static const QRegularExpression pattern(
        QStringLiteral("^(\\d{4})(\\d{2})(\\d{2})(?:[t ]?(\\d{2})(\\d{2})(\\d{2})?)?(?![\\d:])"));
    const auto match = pattern.match(plain);
    if (!match.hasMatch())
        return plain;
    const QStringList parts = match.capturedTexts();
    QString text = parts[1] + u'-' + parts[2] + u'-' + parts[3];
    for (qsizetype part = 4; part < parts.size(); ++part)
        text += (part == 4 ? u' ' : u':') + parts[part];
    return text + plain.mid(match.capturedLength());
}

/// Places of year, month and day among the three numbers of a date.
std::array<int, 3> DateOrder(const QLocale& locale)
{
    const QString format = locale.dateFormat(QLocale::ShortFormat);
    const auto year = format.indexOf(u'y'), month = format.indexOf(u'M'), day = format.indexOf(u'd');
    return {int(month < year) + int(day < year), int(year < month) + int(day < month),
            int(year < day) + int(month < day)};
}

/// The hour of a clock of 12 or 24 hours; -1 for one that the half of the day does not have.
int HourOf(int hour, const QString& half)
{
    if (half.isEmpty())
        return hour;
    if (half.size() > 2 || hour < 1 || hour > 12) // said twice, or no hour of a half
        return -1;
    return hour % 12 + (half == QLatin1String("<p") ? 12 : 0);
}

struct Reading
{
    std::optional<HDDateTime> value{};
    bool cutsSecond = false; // it is a time, but not to the whole second
};

/// Numbers in the locale's order, or year, month and day where the year comes first with four digits. A zone is read
/// over: the values are the model's clock, and the clock is what stands before it.
Reading ReadNumbers(const QString& text, const QLocale& locale)
{
    const QRegularExpression pattern(QStringLiteral("^(\\d{1,4}) ?[-/.年 ] ?(\\d{1,2}) ?[-/.月 ] ?(\\d{1,4}) ?[日.]?"
                                                    "(?:(?:[,t ]|(?<=日)) ?(?:%1 )?(<[ap])? ?(\\d{1,2})[:.時](\\d{1,2})"
                                                    "(?:[:.分](\\d{1,2})(?:[.,](\\d+))?秒?|分)? ?(<[ap])?(?:%2)?)?$")
                                         .arg(ZoneNames(locale), ZoneBehind(locale)));
    const auto match = pattern.match(WithPlainHalves(WithSeparators(Plain(text)), locale));
    if (!match.hasMatch())
        return {};
    const auto order = match.capturedLength(1) == 4 ? std::array{0, 1, 2} : DateOrder(locale);
    const auto number = [&match](int group) { return match.captured(group).toInt(); };
    const auto yearLength = match.capturedLength(order[0] + 1);
    if ((yearLength != 2 && yearLength != 4) || match.capturedLength(order[2] + 1) > 2)
        return {};
    const int year = number(order[0] + 1);
    const HDDateTime value{yearLength == 2 ? FullYear(year) : year,
                           number(order[1] + 1),
                           number(order[2] + 1),
                           HourOf(number(5), match.captured(4) + match.captured(9)),
                           number(6),
                           number(7)};
    if (!value.IsValid())
        return {};
    const bool cutsSecond = !match.captured(8).remove(u'0').isEmpty();
    return {cutsSecond ? std::nullopt : std::optional(value), cutsSecond};
}

/// Without the zone that stands behind its time, or before it.
QString WithoutZone(QString text, const QLocale& locale)
{
    const QRegularExpression zone(
        QStringLiteral("%1$|(?<=\\s)%2\\s+(?=\\d)").arg(ZoneBehind(locale), ZoneNames(locale)),
        QRegularExpression::CaseInsensitiveOption);
    return text.remove(zone).trimmed();
}

/// Forms with names of months and days, as the locale writes them.
std::optional<HDDateTime> ReadNames(const QString& text, const QLocale& locale)
{
    static const QRegularExpression weekday(QStringLiteral("\\W*dddd\\W*"),
                                            QRegularExpression::UseUnicodePropertiesOption);
    const QString longDate = locale.dateFormat(QLocale::LongFormat);
    const QStringList dates{locale.dateFormat(QLocale::ShortFormat), longDate, QString(longDate).remove(weekday)};
    const QStringList times{locale.timeFormat(QLocale::ShortFormat), TimeFormat(locale), QStringLiteral("H:mm"),
                            QStringLiteral("H:mm:ss")};
    QStringList formats = dates;
    for (const QString& date : dates)
        for (const QString& time : times)
            formats << date + u' ' + time << date + QLatin1String(", ") + time;
    const QString bare = WithoutZone(text, locale);
    for (const QString& format : formats) {
        const bool isDate = dates.contains(format); // which has no zone
        const QDateTime read = locale.toDateTime(isDate ? text : bare, format);
        if (!read.isValid())
            continue;
        const QDate date = read.date();
        const QTime time = read.time();
        const bool isShort = !format.contains(QLatin1String("yyyy"));
        const HDDateTime value{isShort ? FullYear(date.year() % 100) : date.year(),
                               date.month(),
                               date.day(),
                               time.hour(),
                               time.minute(),
                               time.second()};
        if (value.IsValid())
            return value;
    }
    return std::nullopt;
}

} // namespace

QString DateTimeText(const HDDateTime& time)
{
    if (time == HDDateTime{})
        return {};
    if (!time.IsValid())
        return GridTexts::tr("Invalid DateTime");
    // In UTC, so that no hour of the calendar is missing where clocks change.
    const QDateTime value(QDate(time.Year, time.Month, time.Day), QTime(time.Hour, time.Minute, time.Second), Qt::UTC);
    return KsDateTimeText(value);
}

std::optional<HDDateTime> ReadDateTime(const QString& text)
{
    const QString wanted = text.trimmed();
    if (wanted.isEmpty())
        return HDDateTime{};
    const QLocale locale = KsLangGetUserLocale();
    if (const auto numbers = ReadNumbers(wanted, locale).value)
        return numbers;
    return ReadNames(wanted, locale);
}

QString DateTimeRefusal(const QString& text)
{
    const HDDateTime example{2024, 5, 31, 18, 0, 0};
    const QString expected = DateTimeText(example);
    if (ReadNumbers(text.trimmed(), KsLangGetUserLocale()).cutsSecond)
        return GridTexts::tr(
                   "\"%1\" holds a part of a second. Times are kept to the whole second. Expected one such as %2.")
            .arg(text, expected);
    return GridTexts::tr("\"%1\" is no date and time. Expected one such as %2.").arg(text, expected);
}
