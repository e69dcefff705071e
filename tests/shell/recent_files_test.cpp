#include "shell_fixture.h"

TEST_F(ShellTest, RecentFilesAreTheNewestThatExist)
{
    CRecentFiles& recent = frame->RecentFiles();
    QStringList expected;
    for (int i = 0; i < CRecentFiles::Longest + 3; ++i) {
        expected.prepend(Write(QString("%1.tst").arg(i)));
        recent.Add(expected.first());
    }
    recent.Add(folder.path() + "/./5.tst"); // another spelling moves it to the front
    expected.removeAll(Path("5.tst"));
    expected.prepend(Path("5.tst"));
    EXPECT_EQ(recent.Files(), expected.mid(0, CRecentFiles::Longest));

    QFile::remove(Path("12.tst"));
    EXPECT_EQ(recent.Files().size(), CRecentFiles::Longest - 1);
    QFile::rename(Path("11.tst"), Path("renamed.TST"));
    recent.Rename(Path("11.tst"), Path("renamed.TST"));
    EXPECT_EQ(recent.Files().indexOf(Path("renamed.TST")), 1) << "in its old place";
    recent.Rename(Path("never.tst"), Path("0.tst"));
    EXPECT_FALSE(recent.Files().contains(Path("0.tst")));
}

TEST_F(ShellTest, AFileThatAnEditorOpensForAnotherIsRemembered)
{
    Texts().OpenDocumentFile(frame.get(), Write("a.tst"));
    EXPECT_EQ(frame->RecentFiles().Files(), QStringList(Path("a.tst")));
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
    EXPECT_TRUE(frame->RecentFiles().Files().isEmpty());
}
