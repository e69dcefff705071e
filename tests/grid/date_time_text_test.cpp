// Dates and times as users write them, in their locale's forms.
#include "grid/date_time_text.h"

#include "ks/language/language.h"

#include <QLocale>
#include <gtest/gtest.h>

namespace {

class DateTimeTextTest : public testing::Test
{
protected:
    ~DateTimeTextTest() override { Use("en_US", "en_US"); }
    void Use(const char* system, const char* program)
    {
        QLocale::setDefault(QLocale(QString::fromLatin1(system)));
        KsLanguage::Instance().SetCurrent(QString::fromLatin1(program));
    }
    const HDDateTime evening{2024, 5, 31, 18, 0, 0}, morning{2024, 5, 31, 6, 0, 0}, midnight{2024, 5, 31, 0, 0, 0};
};

void PrintTo(const HDDateTime& t)
{
    std::cout << t.Year << '-' << t.Month << '-' << t.Day << ' ' << t.Hour << ':' << t.Minute << ':' << t.Second;
}

} // namespace

TEST_F(DateTimeTextTest, TakesTheFormsThatUsersType)
{
    const struct
    {
        const char *locale, *text;
        HDDateTime value;
    } cases[] = {
        {"en_US", "5/31/24 6:00 PM", evening},
        {"en_US", "5/31/24, 6:00\u202fPM", evening},
        {"en_US", "5/31/2024 18:00", evening},
        {"en_US", "05/31/2024 6:00:07 pm", {2024, 5, 31, 18, 0, 7}},
        {"en_US", "5/31/24", midnight},
        {"en_US", "5/31/2024 12:00 AM", midnight},
        {"en_US", "May 31, 2024 6:00 PM", evening},
        {"en_US", "Friday, May 31, 2024", midnight},
        {"en_US", "2024-05-31 18:00", evening},
        {"en_US", "2024-05-31T18:00:00", evening},
        {"en_US", "2024-05-31", midnight},
        // The clock time as it is written, whatever the zone.
        {"en_US", "2024-05-31T18:00:00Z", evening},
        {"en_US", "2024-05-31 18:00+09:00", evening},
        {"en_US", "2024-05-31T06:00:00.000\u221205:30", morning},
        {"en_US", "20240531T180000+0900", evening},
        {"en_US", "20240531 1800", evening},
        {"en_US", "202405310600", morning},
        {"en_US", "20240531", midnight},
        {"en_US", "5/31/24 6:00 PM GMT+9", evening},
        {"en_US", "Friday, May 31, 2024 6:00:00 PM UTC", evening},
        {"en_US", "May 31, 2024, 18:00 GMT-05:00", evening},
        {"de_DE", "31.05.2024 18:00:00,0 UTC", evening},
        {"en_GB", "31/05/2024 18:00", evening},
        {"en_GB", "31/5/24 18:00:00", evening},
        {"ja", "2024/5/31 6:00", morning},
        {"ja", "24/05/31 18:00", evening},
        {"ja", "２０２４／０５／３１　１８：００", evening},
        {"ja", "2024年5月31日 18:00:00", evening},
        {"ja", "2024年5月31日18時00分", evening},
        {"ja", "2024/5/31 午後6:00", evening},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.text);
        Use(c.locale, c.locale);
        const auto read = ReadDateTime(QString::fromUtf8(c.text));
        EXPECT_TRUE(read == c.value);
        if (read && read != c.value)
            PrintTo(*read);
    }
    Use("de_DE", "en_US");
    for (const char* text : {"31.05.24 18:00", "31.5.2024 18:00:00", "31. Mai 2024 18:00"})
        EXPECT_TRUE(ReadDateTime(QString::fromUtf8(text)) == evening) << text;
}

TEST_F(DateTimeTextTest, YearsOfTwoDigitsAreOfThisAge)
{
    Use("en_US", "en_US");
    EXPECT_EQ(ReadDateTime("1/2/69")->Year, 2069);
    EXPECT_EQ(ReadDateTime("1/2/70")->Year, 1970);
    EXPECT_EQ(ReadDateTime("1/2/99 3:04 AM")->Year, 1999);
    EXPECT_EQ(ReadDateTime("1/2/00")->Year, 2000);
}

TEST_F(DateTimeTextTest, NothingElseIsADate)
{
    Use("en_US", "en_US");
    EXPECT_TRUE(ReadDateTime("") == HDDateTime{}) << "not set";
    EXPECT_TRUE(ReadDateTime("  ") == HDDateTime{});
    for (const char* text : {"2/30/2024",
                             "31/5/2024",
                             "5/31",
                             "5/31/2024 18",
                             "5/31/2024 24:00",
                             "5/31/2024 13:00 PM",
                             "5/31/2024 0:00 AM",
                             "5/31/124",
                             "5/31/2024 18:00 foo",
                             "yesterday",
                             "2024",
                             "18:00",
                             "1 2 3 4",
                             "5/31/2024 AM 6:00 PM",
                             "2024-05-31-18",
                             "2024-05-31Z",
                             "5/31/2024 GMT+9",
                             "2024-05-31T18:00 XYZ",
                             "2024-05-31T18:00+9",
                             "20240532",
                             "2024053118",
                             "2024-05-31T18:00:60Z"})
        EXPECT_EQ(ReadDateTime(text), std::nullopt) << text;
    EXPECT_TRUE(DateTimeRefusal("yesterday").contains("is no date and time"));
    for (const char* text : {"2024-05-31T18:00:00.5Z", "5/31/2024 6:00:07.250 PM"}) {
        EXPECT_EQ(ReadDateTime(text), std::nullopt) << "neither cut nor rounded: " << text;
        EXPECT_TRUE(DateTimeRefusal(text).contains("part of a second")) << qPrintable(DateTimeRefusal(text));
    }
}

TEST_F(DateTimeTextTest, WhatIsShownAndWhatTheLocalePrintsReadsBack)
{
    const QDateTime noon(QDate(2024, 5, 31), QTime(12, 34, 0), Qt::UTC);
    const QByteArray zoneBefore = qgetenv("TZ");
    for (const char* name : {"en_US", "en_GB", "en_AU", "ja_JP", "de_DE", "fr_FR", "es_ES", "fi_FI", "sv_SE", "pt_BR",
                             "ko_KR", "zh_CN", "ar_EG", "hi_IN", "tr_TR", "C"}) {
        SCOPED_TRACE(name);
        Use(name, QLocale(name).language() == QLocale::Japanese ? "ja" : "en_US");
        const QLocale locale = KsLangGetUserLocale();
        for (const HDDateTime& date : {HDDateTime{1999, 1, 2, 0, 0, 0}, HDDateTime{2024, 12, 31, 23, 59, 59}})
            EXPECT_TRUE(ReadDateTime(DateTimeText(date)) == date) << DateTimeText(date).toStdString();
        for (const auto form : {QLocale::ShortFormat, QLocale::LongFormat}) {
            const QString day = locale.toString(noon.date(), form);
            EXPECT_TRUE(ReadDateTime(day) == midnight) << day.toStdString();
            const QString both = day + u' ' + locale.toString(noon.time(), QLocale::ShortFormat);
            EXPECT_TRUE(ReadDateTime(both) == (HDDateTime{2024, 5, 31, 12, 34, 0})) << both.toStdString();
        }
        const QString shortForm = locale.toString(noon, QLocale::ShortFormat);
        EXPECT_TRUE(ReadDateTime(shortForm) == (HDDateTime{2024, 5, 31, 12, 34, 0})) << shortForm.toStdString();
        for (const char* zone : {"UTC", "Asia/Tokyo", "Europe/Berlin"}) { // the long form names the computer's
            qputenv("TZ", zone);
            const QString longForm = locale.toString(QDateTime(noon.date(), noon.time()), QLocale::LongFormat);
            EXPECT_TRUE(ReadDateTime(longForm) == (HDDateTime{2024, 5, 31, 12, 34, 0})) << longForm.toStdString();
        }
    }
    zoneBefore.isNull() ? qunsetenv("TZ") : qputenv("TZ", zoneBefore);
}

TEST_F(DateTimeTextTest, FormsFollowTheLanguageOfTheProgram)
{
    Use("en_US", "ja");
    EXPECT_EQ(DateTimeText(evening), "2024/05/31 18:00:00");
    Use("en_US", "en_US");
    EXPECT_EQ(DateTimeText(evening), "5/31/2024 6:00:00 PM");
    Use("ja_JP", "en_GB");
    EXPECT_EQ(DateTimeText(evening), "31/05/2024 18:00:00");
    Use("de_DE", "en_US"); // a language that the program has not
    EXPECT_EQ(DateTimeText(evening), "31.05.2024 18:00:00");
}
