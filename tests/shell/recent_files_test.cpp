#include "shell/recent_files.h"
#include "shell_fixture.h"

TEST_F(ShellTest, RecentFilesAreTheNewestThatExist)
{
    QStringList expected;
    for (int i = 0; i < RecentFiles::Longest + 3; ++i) {
        expected.prepend(Write(QString("%1.tst").arg(i)));
        RecentFiles::Add(expected.first());
    }
    RecentFiles::Add(folder.path() + "/./5.tst"); // another spelling moves it to the front
    expected.removeAll(Path("5.tst"));
    expected.prepend(Path("5.tst"));
    EXPECT_EQ(RecentFiles::All(), expected.mid(0, RecentFiles::Longest));

    QFile::remove(Path("12.tst"));
    EXPECT_EQ(RecentFiles::All().size(), RecentFiles::Longest - 1);
    QFile::rename(Path("11.tst"), Path("renamed.TST"));
    RecentFiles::Rename(Path("11.tst"), Path("renamed.TST"));
    EXPECT_EQ(RecentFiles::All().indexOf(Path("renamed.TST")), 1) << "in its old place";
    RecentFiles::Rename(Path("never.tst"), Path("0.tst"));
    EXPECT_FALSE(RecentFiles::All().contains(Path("0.tst")));
}

TEST_F(ShellTest, AFileThatAnEditorOpensForAnotherIsRemembered)
{
    Texts().OpenDocumentFile(frame.get(), Write("a.tst"));
    EXPECT_EQ(RecentFiles::All(), QStringList(Path("a.tst")));
}

TEST_F(ShellTest, TheMenuOpensARecentFile)
{
    frame->OpenFile(Write("a.tst"));
    Action("actionClose")->trigger();
    Settle();
    emit Menu(0)->aboutToShow();
    EXPECT_TRUE(Action("actionOpenRecent")->isEnabled());
    QMenu* recent = Action("actionOpenRecent")->menu();
    emit recent->aboutToShow();
    recent->actions().first()->trigger();
    EXPECT_TRUE(ViewOf("a.tst"));
}

TEST_F(ShellTest, WhatDidNotOpenIsNotRemembered)
{
    EXPECT_FALSE(frame->OpenFile(Path("missing.tst")));
    EXPECT_FALSE(frame->OpenFile(Write("a.unknown")));
    EXPECT_EQ(asked.size(), 2);
    EXPECT_TRUE(RecentFiles::All().isEmpty());
}
