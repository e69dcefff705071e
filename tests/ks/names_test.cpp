// Names of branches and of files: when two of them mean the same.
#include "ks/fc/branch_name.h"
#include "ks/fc/file_name.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

TEST(Names, BranchesAreTheSameWhenTheirCapitalsAre)
{
    struct Case
    {
        const char *a, *b;
        bool same;
    };
    const Case cases[] = {
        {"Inn", "INN", true},
        {"inn", "iNN", true},
        {"Inn", "Inns", false},
        {"Inn", "Ill", false},
        {"", "", true},
        {"", "A", false},
        {"Wei\u00dfe Elster", "WEISSE ELSTER", true},
        {"Wei\u00dfe Elster", "weisse elster", true},
        {"Wei\u00dfe", "Weise", false},
        {"stra\u00dfe", "stras", false},
        {"K\u0131z\u0131l\u0131rmak", "KIZILIRMAK", true},
        {"K\u0131z\u0131l\u0131rmak", "kizilirmak", true},
        {"\u00d6tztaler Ache", "\u00f6tztaler ache", true},
        {"\u00d6tz", "Otz", false},
        {"\u5229\u6839\u5ddd", "\u5229\u6839\u5ddd", true},
        {"[A", "{A", false},
        {" Inn", "INN ", true}, // as a name is stored
        {"R 1", "R1", false},
        {"INN\u200e", "inn", true}, // marks that nobody sees
        {"\u202aInn\u202c \t", "Inn", true},
        {"\u2066R\u20691", "r1", true},
    };
    for (const Case& c : cases) {
        const QString a = QString::fromUtf8(c.a), b = QString::fromUtf8(c.b);
        EXPECT_EQ(KsSameBranch(a, b), c.same) << c.a << " " << c.b;
        EXPECT_EQ(KsSameBranch(b, a), c.same) << c.b << " " << c.a;
        EXPECT_EQ(KsBranchKey(a) == KsBranchKey(b), c.same) << c.a << " " << c.b;
    }
}

TEST(Names, AVeryLongFileNameIsCutInTheMiddle)
{
    EXPECT_EQ(KsShownFileName("/a/river.hdkv"), "river.hdkv");
    const QString shown = KsShownFileName("/a/" + QString(200, u'x') + "end.hdkv");
    EXPECT_LE(shown.size(), 60);
    EXPECT_TRUE(shown.startsWith("xxxx") && shown.endsWith("end.hdkv")) << qPrintable(shown);
}

TEST(Names, AFileIsFoundInWhateverCaseItsPathIsSpelt)
{
    const QTemporaryDir temporary;
    const QString folder = QDir(temporary.path()).canonicalPath();
    const auto path = [&](const char* name) { return folder + u'/' + QString::fromUtf8(name); };
    const auto write = [&](const char* name) {
        QFile file(path(name));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly)) << name;
    };
    ASSERT_TRUE(QDir(folder).mkpath("Data/Upper"));
    write("Data/Upper/River.HDKV");
    EXPECT_EQ(KsExistingSpelling(path("data/UPPER/river.hdkv")), path("Data/Upper/River.HDKV"));
    EXPECT_TRUE(KsSameFile(path("data/UPPER/river.hdkv"), path("Data/./Upper/../Upper/River.HDKV")));
    EXPECT_EQ(KsExistingSpelling(path("data/UPPER/stream.hdkv")), path("data/UPPER/stream.hdkv")) << "nothing fits";
    EXPECT_EQ(KsExistingSpelling(""), "");
    EXPECT_FALSE(KsSameFile("", ""));

    write("Data/Upper/river.hdkv"); // now there are two
    EXPECT_FALSE(KsSameFile(path("Data/Upper/river.hdkv"), path("Data/Upper/River.HDKV")));
    EXPECT_EQ(KsExistingSpelling(path("Data/Upper/river.hdkv")), path("Data/Upper/river.hdkv"));
    ASSERT_TRUE(QFile::link(path("Data/Upper/River.HDKV"), path("link.hdkv")));
    EXPECT_TRUE(KsSameFile(path("LINK.hdkv"), path("Data/Upper/River.HDKV")));
    EXPECT_TRUE(KsSameFile(path("gone.hdkv"), path("./gone.hdkv")));
    EXPECT_FALSE(KsSameFile(path("gone.hdkv"), path("river.hdkv")));
}

} // namespace
