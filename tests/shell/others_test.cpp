// What other programs do to an open file, as the bar tells it: who has it, and that it is another.
#include "files/file_lock.h"
#include "files/temporary_file.h"
#include "ks/fc/file_bar.h"
#include "ks/fc/project_doc.h"
#include "shell_fixture.h"

#include <QSignalSpy>
#include <algorithm>

namespace {

class OthersTest : public ShellTest
{
protected:
    OthersTest()
    {
        frame.reset();
        frame = std::make_unique<CMainFrame>();
        frame->LoadPlugins(QStringLiteral(KVR_BUILD_DIR "/bin/plugins"));
        frame->show();
    }
    ~OthersTest() override { frame.reset(); }

    static QByteArray TextWith(const char* level)
    {
        return QByteArray("[KAVO0_HD]\n[Global_Variables]\n[Global_Values]\nG_waterlevel = ") + level +
               "\n[/Global_Values]\n[/Global_Variables]\n[/KAVO0_HD]\n";
    }
    CKsProjectDoc* Open(const QString& path)
    {
        EXPECT_TRUE(frame->OpenFile(path));
        return qobject_cast<CKsProjectDoc*>(frame->ActiveDocument());
    }
    static bool Shows(CKsProjectDoc& document, const char* level)
    {
        return document.ContentText().value().find(std::string("G_waterlevel = ") + level) != std::string::npos;
    }
    static bool IsTold(CKsProjectDoc& document, const char* words)
    {
        return std::ranges::any_of(document.Notices(), [&](const auto& each) { return each.text.contains(words); });
    }
};

} // namespace

TEST_F(OthersTest, AFileIsTakenOverWhenNobodyHasIt)
{
    const QString path = Write("a.HDKV", TextWith("1.5"));
    FileLock theirs = FileLock::Try(path.toStdString(), "kvrshell");
    CKsProjectDoc& document = *Open(path);
    EXPECT_TRUE(document.IsInUse() && IsTold(document, "is in use by"));
    theirs.Release();
    EXPECT_TRUE(QTest::qWaitFor([&] { return IsTold(document, "can be edited now"); }));
    QSignalSpy news(&document, &CKsProjectDoc::FileStateChanged);
    theirs = FileLock::Try(path.toStdString(), "kvrshell");
    EXPECT_TRUE(QTest::qWaitFor([&] { return !news.isEmpty() && !IsTold(document, "can be edited now"); }))
        << "somebody was faster, and the bar is told";
    Write("a.HDKV", TextWith("2.5"));
    document.EditFreed();
    EXPECT_TRUE(document.IsInUse());
    EXPECT_TRUE(Shows(document, "1.5")) << "it may be half of a file";
    theirs.Release();
    document.EditFreed();
    EXPECT_FALSE(document.IsInUse());
    EXPECT_TRUE(Shows(document, "2.5"));
}

TEST_F(OthersTest, NoLockOfTheProgramsOwnKeepsItFromAFile)
{
    CKsProjectDoc& moved = *Open(Write("p/a.HDKV", TextWith("1.5")));
    CKsProjectDoc& left = *Open(Write("p/b.HDKV", TextWith("1.5")));
    const auto rename = [this](const char* from, const char* to) { EXPECT_TRUE(QDir().rename(Path(from), Path(to))); };
    rename("p", "q");
    EXPECT_TRUE(QTest::qWaitFor([&] { return moved.IsFileGone() && left.IsFileGone(); }));
    names = {Path("q/a.HDKV")};
    answers = {QMessageBox::Yes}; // it exists
    EXPECT_TRUE(moved.DoSave({})) << asked.join('\n').toStdString();
    EXPECT_EQ(moved.GetPathName(), Path("q/a.HDKV"));
    EXPECT_TRUE(FileLock::Try(Path("q/a.HDKV").toStdString(), "other").HeldBy());
    CKsProjectDoc& opened = *Open(Path("q/b.HDKV"));
    EXPECT_NE(&opened, &left);
    EXPECT_FALSE(opened.IsInUse()) << "by a window whose file is not there any more";
    EXPECT_FALSE(left.IsInUse());
    EXPECT_TRUE(FileLock::Try(Path("q/b.HDKV").toStdString(), "other").HeldBy());
    rename("q", "p");
    EXPECT_TRUE(QTest::qWaitFor([&] { return !left.IsFileGone() && opened.IsFileGone(); }));
    // At the next look the lock is that of the window whose file it is again.
    QTest::qWait(2500);
    answers = {QMessageBox::Discard};
    Action("actionClose")->trigger();
    Settle();
    EXPECT_NE(frame->ActiveDocument(), &opened);
    EXPECT_TRUE(FileLock::Try(Path("p/b.HDKV").toStdString(), "other").HeldBy());
}

TEST_F(OthersTest, ALockThatSomebodyRemovedIsTakenAgain)
{
    const QString path = Write("a.HDKV", TextWith("1.5"));
    CKsProjectDoc& document = *Open(path);
    const auto remove = [&] { EXPECT_TRUE(QFile::remove(Path(".a.hdkv.lock"))); };
    remove();
    EXPECT_TRUE(QTest::qWaitFor([&] { return QFile::exists(Path(".a.hdkv.lock")); }));
    EXPECT_TRUE(FileLock::Try(path.toStdString(), "other").HeldBy());
    EXPECT_TRUE(document.Notices().empty());
    remove();
    FileLock theirs = FileLock::Try(path.toStdString(), "kvrshell");
    ASSERT_TRUE(theirs.IsHeld());
    EXPECT_TRUE(QTest::qWaitFor([&] { return IsTold(document, "the lock that kept others out was removed"); }));
    EXPECT_FALSE(document.IsReadOnly()) << "what is typed here is typed";
    answers = {QMessageBox::No};
    EXPECT_FALSE(document.DoSave(path));
    EXPECT_THAT(asked.join(""), testing::Truly([](const QString& text) { return text.contains("is in use by"); }));
    theirs.Release();
    EXPECT_TRUE(QTest::qWaitFor([&] { return document.Notices().empty(); }));
    EXPECT_TRUE(FileLock::Try(path.toStdString(), "other").HeldBy());
}

TEST_F(OthersTest, WhatASaveThatWasCutOffDisplacedIsToldWhenTheFileIsOpened)
{
    const QString path = Write("a.HDKV", TextWith("1.5"));
    const QByteArray theirs = TextWith("2.5");
    {
        TemporaryFile left(PlatformFile::Native());
        ASSERT_FALSE(left.Create(folder.path().toStdString()));
        ASSERT_FALSE(left.Write(theirs.toStdString()) || left.Finish(false));
        ASSERT_FALSE(left.Protect({path.toStdString(), VersionOfText("a"), VersionOfText("b")}));
        left.Release();
    }
    FileLock busy = FileLock::Try(path.toStdString(), "kvrshell");
    EXPECT_FALSE(IsTold(*Open(path), "was cut off")) << "whoever has the file may be saving it";
    Action("actionClose")->trigger();
    Settle();
    busy.Release();
    EXPECT_TRUE(IsTold(*Open(path), "is kept in a.HDKV.displaced-1."));
    QFile kept(path + ".displaced-1");
    ASSERT_TRUE(kept.open(QIODevice::ReadOnly));
    EXPECT_EQ(kept.readAll(), theirs);
}

TEST_F(OthersTest, ANoticeThatWasClosedComesBackWithTheNextChange)
{
    CKsProjectDoc& document = *Open(Write("a.HDKV", TextWith("1.5")));
    const auto isTold = [&] { return IsTold(document, "was changed by another program"); };
    Write("a.HDKV", TextWith("2.5"));
    EXPECT_TRUE(QTest::qWaitFor(isTold));
    for (const KsFileNotice& notice : document.Notices())
        if (notice.close)
            notice.close();
    EXPECT_FALSE(isTold());
    Write("a.HDKV", TextWith("3.5"));
    EXPECT_TRUE(QTest::qWaitFor(isTold));
}

TEST_F(OthersTest, AReloadThatFailsSaysWhyAndKeepsWhatIsShown)
{
    CKsProjectDoc& document = *Open(Write("a.HDKV", TextWith("1.5")));
    Write("a.HDKV", "[KAVO0_HD]\n[Global_Variables]\nG_waterlevel = \n");
    EXPECT_TRUE(QTest::qWaitFor([&] { return IsTold(document, "was changed by another program"); }));
    CKsFileBar& bar = *frame->findChild<CKsFileBar*>();
    const auto reload = [&] { document.Notices().front().actions.front().run(bar); };
    reload();
    EXPECT_TRUE(Shows(document, "1.5"));
    EXPECT_TRUE(IsTold(document, "cannot be loaded as it is, and what is shown stays: "));
    Write("a.HDKV", TextWith("2.5"));
    EXPECT_TRUE(QTest::qWaitFor([&] { return !IsTold(document, "cannot be loaded"); })) << "it is another one now";
    reload();
    EXPECT_TRUE(Shows(document, "2.5"));
}
