#include "ks_fixture.h"

#include "ks/fc/file_use.h"
#include "ks/fc/file_watch.h"

#include <QDeadlineTimer>
#include <QDir>
#include <QMenuBar>
#include <QPushButton>
#include <QSignalSpy>
#include <QToolBar>
#include <filesystem>

using Button = QMessageBox;

TEST_F(KsTest, TheNameWrittenBecomesTheDocumentsName)
{
    struct Case
    {
        const char* asked;
        bool namesItself;
    };
    for (const auto& [name, namesItself] : {Case{"new.txt", false}, Case{"own.tst", true}, Case{"same.TST", false}}) {
        TextDoc* document = Open({});
        document->text = "content";
        document->namesItself = namesItself;
        QSignalSpy renamed(document, &CKsDoc::PathNameChanged);
        EXPECT_TRUE(document->DoSave(Path(name)));
        EXPECT_TRUE(document->executing);
        EXPECT_FALSE(document->IsExecuting());
        const QString written = document->SavePathFor(Path(name));
        EXPECT_EQ(document->GetPathName(), written);
        EXPECT_EQ(renamed.count(), 1);
        EXPECT_EQ(renamed.value(0).value(1).toString(), written);
        EXPECT_EQ(Read(written), "content");
        EXPECT_TRUE(document->DoSave(document->GetPathName()));
        EXPECT_EQ(renamed.count(), 1) << "no news";
    }
}

TEST_F(KsTest, ASaveThatFailedOffersAnotherName)
{
    TextDoc* document = Open(Write("a.TST", "old"));
    document->text = "new";
    document->SetModifiedFlag();
    document->canSave = false;
    document->why = "The disk is full.";
    answers = {Button::No};
    EXPECT_FALSE(document->DoSave(document->GetPathName()));
    ASSERT_EQ(asked.size(), 1);
    EXPECT_TRUE(asked[0].startsWith("The disk is full.\n")) << qPrintable(asked[0]);
    EXPECT_TRUE(questions.empty() && document->IsModified());

    answers = {Button::Yes, Button::Yes};
    names << Path("again.tst") << QString();
    EXPECT_FALSE(document->DoSave(document->GetPathName())) << "cancelled at the second attempt";
    EXPECT_EQ(questions.size(), 2u);
    EXPECT_EQ(document->GetPathName(), Path("a.TST"));

    answers = {Button::Yes};
    names << Path("elsewhere.tst");
    document->onRefused = [document] { document->canSave = true; };
    EXPECT_TRUE(document->DoSave(document->GetPathName()));
    EXPECT_EQ(document->GetPathName(), Path("elsewhere.TST"));
    EXPECT_EQ(Read(Path("elsewhere.TST")) + Read(Path("a.TST")), "newold");
}

TEST_F(KsTest, SaveAsAsksAboutTheFileThatIsReallyWritten)
{
    Write("taken.TST", "old");
    TextDoc* other = Open(Write("other.TST", "other"));
    TextDoc* document = Open({});
    document->text = "new";
    // Another window's file is refused; No asks for a name again; Yes replaces.
    names << Path("other.tst") << Path("taken.txt") << Path("taken.txt");
    answers << Button::Ok << Button::No << Button::Yes;
    EXPECT_TRUE(document->DoSave({}));
    ASSERT_EQ(asked.size(), 3);
    EXPECT_TRUE(asked[0].contains("other.TST"));
    EXPECT_TRUE(asked[1].contains("taken.TST"));
    EXPECT_EQ(Read(Path("taken.TST")), "new");
    EXPECT_EQ(Read(other->GetPathName()), "other");
    EXPECT_TRUE(questions.at(0).save);
    EXPECT_EQ(questions.at(0).extension, ".tst");
    EXPECT_EQ(questions.at(2).proposal, Path("taken.txt"));

    names << document->GetPathName();
    EXPECT_TRUE(document->DoSave({})) << "its own file needs no question";
    EXPECT_EQ(asked.size(), 3);

    // A file whose name differs in its case is asked about, however it was named; one of another extension is not
    // meant.
    Write("lower.tst", "old");
    Write("plain.txt", "old");
    names << Path("lower.tst") << Path("lower.TST") << Path("plain.txt");
    answers << Button::No << Button::No;
    EXPECT_TRUE(document->DoSave({}));
    ASSERT_EQ(asked.size(), 5);
    EXPECT_TRUE(asked[3].contains("lower.tst") && asked[4].contains("lower.tst"));
    EXPECT_EQ(Read(Path("plain.TST")), "new");
    EXPECT_FALSE(document->DoSave({})) << "cancelled";
}

TEST_F(KsTest, ClosingTheLastWindowAsks)
{
    struct Case
    {
        Button::StandardButton answer;
        bool canSave, closes;
        const char* content;
    };
    const Case cases[] = {{Button::Cancel, true, false, "old"},
                          {Button::Save, false, false, "old"},
                          {Button::Save, true, true, "new"},
                          {Button::Discard, true, true, "old"}};
    for (const Case& c : cases) {
        const QString path = Write("a.TST", "old");
        TextDoc* document = Open(path);
        document->text = "new";
        document->canSave = c.canSave;
        document->SetModifiedFlag();
        asked.clear();
        answers = {c.answer};
        EXPECT_EQ(WindowOf(document)->close(), c.closes);
        EXPECT_EQ(asked, QStringList("Save the changes to a.TST?"));
        EXPECT_EQ(Read(path), c.content);
        if (!c.closes) {
            answers = {Button::Discard};
            WindowOf(document)->close();
        }
        Settle();
        EXPECT_TRUE(documents.findChildren<CKsDoc*>().empty());
    }
}

TEST_F(KsTest, WhatIsBeingTypedCountsWhenAWindowCloses)
{
    TextDoc* document = Open(Write("a.TST", "old"));
    LogView* view = ViewOf(document);
    view->edit->setFocus();
    QTest::keyClicks(view->edit, "typed");
    EXPECT_FALSE(document->IsModified());
    LogView::log.clear();
    answers = {Button::Cancel};
    EXPECT_FALSE(WindowOf(document)->close());
    EXPECT_EQ(asked.size(), 1) << "the text was taken over before the question";
    EXPECT_EQ(LogView::log.front(), "a leaves") << "and the view was asked first";
    EXPECT_EQ(QApplication::focusWidget(), view->edit) << "the user goes on where he was";

    answers = {Button::Save};
    EXPECT_TRUE(WindowOf(document)->close());
    EXPECT_EQ(Read(Path("a.TST")), "typed");
}

TEST_F(KsTest, OneRefusalKeepsAllWindows)
{
    for (const char* name : {"a.TST", "b.TST", "c.TST"})
        Open(Write(name, "x"))->SetModifiedFlag();
    answers = {Button::Discard, Button::Cancel};
    EXPECT_FALSE(frame.CloseAllWindows());
    EXPECT_EQ(asked.size(), 2);
    Settle();
    EXPECT_EQ(documents.findChildren<CKsDoc*>().size(), 3);
    EXPECT_TRUE(documents.findChildren<CKsDoc*>()[0]->IsModified());

    // What is to be saved is saved when all is answered.
    const auto marks = [this] {
        QString each;
        for (const CKsDoc* document : documents.findChildren<CKsDoc*>())
            each += document->IsModified() ? '*' : '-';
        return each.toStdString();
    };
    const auto contents = [this] { return Read(Path("a.TST")) + Read(Path("b.TST")) + Read(Path("c.TST")); };
    const auto open = documents.findChildren<TextDoc*>();
    for (TextDoc* document : open)
        document->text = "new";
    answers = {Button::Save, Button::Discard, Button::Cancel};
    EXPECT_FALSE(frame.CloseAllWindows());
    EXPECT_EQ(marks(), "***");
    EXPECT_EQ(contents(), "xxx");
    // A save that fails stops the closing; what was saved before it stays saved.
    open[1]->canSave = false;
    asked.clear();
    answers = {Button::Save, Button::Save, Button::Save};
    EXPECT_FALSE(frame.CloseAllWindows());
    Settle();
    EXPECT_EQ(asked.size(), 3);
    EXPECT_EQ(marks(), "-**");
    EXPECT_EQ(contents(), "newxx");
    // So does an untitled document whose name is not given.
    open[1]->SetPathName({});
    open[1]->canSave = true;
    answers = {Button::Save, Button::Discard};
    EXPECT_FALSE(frame.CloseAllWindows());
    EXPECT_EQ(questions.size(), 1u);
    EXPECT_EQ(marks(), "-**");
    open[0]->SetModifiedFlag();

    asked.clear();
    answers = {Button::Discard, Button::Discard, Button::Discard};
    EXPECT_TRUE(frame.CloseAllWindows());
    EXPECT_EQ(asked.size(), 3) << "each once";
    Settle();
    EXPECT_TRUE(documents.findChildren<CKsDoc*>().empty());
}

TEST_F(KsTest, WhatCannotBeTakenStopsSavingAndClosing)
{
    TextDoc* document = Open(Write("a.TST", "old"));
    LogView* view = ViewOf(document);
    view->edit->setText("wrong");
    document->SetModifiedFlag();
    EXPECT_FALSE(document->DoSave(document->GetPathName()));
    EXPECT_FALSE(document->DoSave({})) << "before a name is asked for";
    EXPECT_FALSE(WindowOf(document)->close());
    EXPECT_FALSE(frame.CloseAllWindows());
    EXPECT_TRUE(document->IsModified());
    EXPECT_EQ(asked, QStringList());
    EXPECT_EQ(Read(Path("a.TST")), "old");

    // A click outside the view does not arrive; one inside does, and menus are left to what is chosen in them.
    auto* bar = frame.addToolBar("bar");
    int clicked = 0;
    auto* button = new QPushButton("b");
    QObject::connect(button, &QPushButton::clicked, [&] { ++clicked; });
    bar->addWidget(button);
    frame.show();
    const auto click = [this](QWidget* widget) {
        QTest::mouseClick(frame.windowHandle(), Qt::LeftButton, {}, widget->mapTo(&frame, widget->rect().center()));
    };
    click(button);
    EXPECT_EQ(clicked, 0);
    view->edit->setText("right");
    click(button);
    EXPECT_EQ(clicked, 1);
    LogView::log.clear();
    click(view->edit);
    QTest::mouseClick(frame.menuBar(), Qt::LeftButton);
    EXPECT_EQ(LogView::log, QStringList());
}

TEST_F(KsTest, AnOpenFileIsFollowedByItsContent)
{
    const QString path = Write("a.TST", "old");
    ASSERT_TRUE(QFile::link(path, Path("link.TST")));
    CKsFileWatch direct(nullptr), linked(nullptr);
    const auto expect = [&](std::string_view text) {
        direct.Expect(path, VersionOfText(text), StatusBehind(path.toStdString()));
        linked.Expect(Path("link.TST"), VersionOfText(text), StatusBehind(path.toStdString()));
    };
    const auto becomes = [&](KsFileSight::Kind kind) {
        return QTest::qWaitFor([&] { return direct.Sight().kind == kind && linked.Sight().kind == kind; });
    };
    const auto replace = [&](const QByteArray& text) {
        Write("other", text);
        std::filesystem::rename(Path("other").toStdString(), path.toStdString());
    };
    expect("old");
    QSignalSpy news(&direct, &CKsFileWatch::Changed);
    Write("a.TST", "old");
    replace("old");
    QFile::remove(path);
    Write("a.TST", "old");
    QTest::qWait(900);
    EXPECT_EQ(news.count(), 0) << "the content is the same";

    replace("new"); // of the same length
    EXPECT_TRUE(becomes(KsFileSight::Other));
    EXPECT_EQ(direct.Sight().version, VersionOfText("new"));
    Write("a.TST", "old"); // the file that took the place is followed, too
    EXPECT_TRUE(becomes(KsFileSight::Known));
    const QDeadlineTimer twoLooks(2 * 200); // each when the file has been let be for so long
    QFile::remove(path);
    EXPECT_TRUE(becomes(KsFileSight::Gone));
    EXPECT_TRUE(twoLooks.hasExpired()) << "it may be about to be replaced";
    ASSERT_TRUE(QDir().mkdir(path));
    EXPECT_TRUE(becomes(KsFileSight::Unreadable));
    QDir().rmdir(path);
    Write("a.TST", "newer");
    EXPECT_TRUE(becomes(KsFileSight::Other));

    news.clear();
    expect("newer"); // it is what the document holds from now on
    EXPECT_EQ(news.count(), 1);
    replace("ours");
    expect("ours");
    QTest::qWait(900);
    EXPECT_EQ(news.count(), 1) << "a save of ours";
    EXPECT_EQ(direct.Sight().kind, KsFileSight::Known);

    // What is too large to be read is what it was as long as nobody touches it.
    constexpr std::uint64_t huge = (std::uint64_t(1) << 31) + 1;
    ASSERT_TRUE(QFile::resize(path, qint64(huge)));
    for (CKsFileWatch* watch : {&direct, &linked})
        watch->Expect(path, FileVersion{.size = huge}, StatusBehind(path.toStdString()));
    QTest::qWait(600);
    EXPECT_EQ(direct.Sight().kind, KsFileSight::Known);
    std::filesystem::last_write_time(path.toStdString(), std::filesystem::file_time_type::clock::now());
    EXPECT_TRUE(becomes(KsFileSight::Other));
}

TEST_F(KsTest, OtherNamesOfAFileAreFreeWhenASaveHasPartedThem)
{
    for (const char* taken : {"a.TST", "b.TST"}) { // the name that is saved to is another one, or the document's own
        SCOPED_TRACE(taken);
        const std::string saved = Write("b.TST", "old").toStdString(), other = Path("c.TST").toStdString();
        for (const std::string& name : {other, other + "2"}) { // of a file with one name that alone is locked
            std::filesystem::remove(name);
            std::filesystem::create_hard_link(saved, name);
        }
        Write("a.TST", "own");
        CKsFileUse use;
        use.Take(Path(taken));
        ASSERT_TRUE(use.TakeTarget(Path("b.TST")));
        EXPECT_TRUE(FileLock::Try(other, "test").HeldBy());
        std::filesystem::rename(Write("written", "new").toStdString(), saved);
        use.TargetWritten(true, Path("b.TST"));
        EXPECT_FALSE(FileLock::Try(other, "test").HeldBy());
        EXPECT_TRUE(FileLock::Try(saved, "test").HeldBy());
    }
}
