#include "grid/date_time_text.h"

#include "ks/language/language.h"
#include "grid/grid_texts.h"

#include <QDateTime>
#include <QLocale>
#include <QRegularExpression>
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
    static const QRegularExpression zone(QStringLiteral("\\W*t+\\W*"));
    QString format = locale.timeFormat(QLocale::LongFormat);
    if (format.contains(u'\'')) // quoted words hold letters that are no zone
        return QStringLiteral("HH:mm:ss");
    return format.remove(zone);
}

/// The locale's short form, made exact: a year of four digits, and seconds.
QString ExactFormat(const QLocale& locale)
{
    QString date = locale.dateFormat(QLocale::ShortFormat);
    if (!date.contains(QLatin1String("yyyy")))
        date.replace(QLatin1String("yy"), QLatin1String("yyyy"));
    QString time = locale.timeFormat(QLocale::ShortFormat);
    if (!time.contains(u's'))
        time.replace(QLatin1String("mm"), QLatin1String("mm:ss"));
    return date + u' ' + time;
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

/// Numbers in the locale's order, or year, month and day where the year comes first with four digits.
std::optional<HDDateTime> ReadNumbers(const QString& text, const QLocale& locale)
{
    static const QRegularExpression pattern(QStringLiteral(
        "^(\\d{1,4}) ?[-/.年 ] ?(\\d{1,2}) ?[-/.月 ] ?(\\d{1,4}) ?[日.]?"
        "(?:(?:[,t ]|(?<=日)) ?(<[ap])? ?(\\d{1,2})[:.時](\\d{1,2})(?:[:.分](\\d{1,2})秒?|分)? ?(<[ap])?)?$"));
    const auto match = pattern.match(WithPlainHalves(Plain(text), locale));
    if (!match.hasMatch())
        return std::nullopt;
    const auto order = match.capturedLength(1) == 4 ? std::array{0, 1, 2} : DateOrder(locale);
    const auto number = [&match](int group) { return match.captured(group).toInt(); };
    const auto yearLength = match.capturedLength(order[0] + 1);
    if ((yearLength != 2 && yearLength != 4) || match.capturedLength(order[2] + 1) > 2)
        return std::nullopt;
    const int year = number(order[0] + 1);
    const HDDateTime value{yearLength == 2 ? FullYear(year) : year,
                           number(order[1] + 1),
                           number(order[2] + 1),
                           HourOf(number(5), match.captured(4) + match.captured(8)),
                           number(6),
                           number(7)};
    return value.IsValid() ? std::optional(value) : std::nullopt;
}

/// Forms with names of months and days, as the locale writes them.
std::optional<HDDateTime> ReadNames(const QString& text, const QLocale& locale)
{
    static const QRegularExpression weekday(QStringLiteral("\\W*dddd\\W*"));
    const QString longDate = locale.dateFormat(QLocale::LongFormat);
    const QStringList dates{locale.dateFormat(QLocale::ShortFormat), longDate, QString(longDate).remove(weekday)};
    const QStringList times{locale.timeFormat(QLocale::ShortFormat), TimeFormat(locale), QStringLiteral("H:mm"),
                            QStringLiteral("H:mm:ss")};
    QStringList formats = dates;
    for (const QString& date : dates)
        for (const QString& time : times)
            formats << date + u' ' + time << date + QLatin1String(", ") + time;
    for (const QString& format : formats) {
        const QDateTime read = locale.toDateTime(text, format);
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
    const QLocale locale = KsLangGetUserLocale();
    return locale.toString(value, ExactFormat(locale));
}

std::optional<HDDateTime> ReadDateTime(const QString& text)
{
    const QString wanted = text.trimmed();
    if (wanted.isEmpty())
        return HDDateTime{};
    const QLocale locale = KsLangGetUserLocale();
    if (const auto numbers = ReadNumbers(wanted, locale))
        return numbers;
    return ReadNames(wanted, locale);
}

QString DateTimeRefusal(const QString& text)
{
    const HDDateTime example{2024, 5, 31, 18, 0, 0};
    return GridTexts::tr("\"%1\" is no date and time. Expected one such as %2.").arg(text, DateTimeText(example));
}
