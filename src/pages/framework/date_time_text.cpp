#include "pages/framework/date_time_text.h"

#include "res/strings.h"

#include <QDateTime>
#include <QLocale>

namespace {

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

} // namespace

QString DateTimeText(const HDDateTime& time)
{
    if (time == HDDateTime{})
        return {};
    if (!time.IsValid())
        return LoadString(Str::InvalidDateTime);
    // In UTC, so that no hour of the calendar is missing where clocks change.
    const QDateTime value(QDate(time.Year, time.Month, time.Day), QTime(time.Hour, time.Minute, time.Second), Qt::UTC);
    const QLocale locale;
    return locale.toString(value, ExactFormat(locale));
}

std::optional<HDDateTime> ReadDateTime(const QString& text)
{
    const QString wanted = text.simplified();
    if (wanted.isEmpty())
        return HDDateTime{};
    const QLocale locale;
    const QString exact = ExactFormat(locale);
    const QString noSeconds = QString(exact).remove(QLatin1String(":ss"));
    QDateTime read;
    for (const QString& format : {exact, noSeconds}) {
        if (!read.isValid())
            read = locale.toDateTime(wanted, QString(format).simplified());
    }
    for (const char* format : {"yyyy-MM-dd HH:mm:ss", "yyyy-MM-dd HH:mm", "yyyy-MM-ddTHH:mm:ss"}) {
        if (!read.isValid())
            read = QDateTime::fromString(wanted, QLatin1String(format));
    }
    const QDate date = read.date();
    const QTime time = read.time();
    const HDDateTime value{date.year(), date.month(), date.day(), time.hour(), time.minute(), time.second()};
    return read.isValid() && value.IsValid() ? std::optional(value) : std::nullopt;
}

QString DateTimeRefusal(const QString& text)
{
    const HDDateTime example{2024, 5, 31, 18, 0, 0};
    return LoadString(Str::DateTimeRequired).arg(text, DateTimeText(example));
}
