#include "ks/language/date_time.h"

#include "ks/language/language.h"

#include <QDateTime>

CString KsDateTimeText(const QDateTime& time)
{
    const QLocale locale = KsLangGetUserLocale();
    QString date = locale.dateFormat(QLocale::ShortFormat);
    if (!date.contains(QLatin1String("yyyy")))
        date.replace(QLatin1String("yy"), QLatin1String("yyyy"));
    QString clock = locale.timeFormat(QLocale::ShortFormat);
    if (!clock.contains(u's'))
        clock.replace(QLatin1String("mm"), QLatin1String("mm:ss"));
    return locale.toString(time, date + u' ' + clock);
}
