#include "ks/fc/findings_dialog.h"
#include "shell_fixture.h"

#include <QLabel>
#include <QTreeWidget>
#include <filesystem>

using testing::ElementsAre;

TEST_F(ShellTest, ProjectsDoNotMix)
{
    for (const char* name : {"one/a.tst", "one/b.tst", "two/c.tst", "two/d.tst", "alone.tst"})
        Write(name);
    EXPECT_TRUE(frame->OpenFile(WriteProject("one/one.kvrp", "File = <a.tst>\nFile = \"b.tst\"\n")));
    EXPECT_TRUE(frame->OpenFile(WriteProject("two.kvrp", "File = <two/c.tst>\nFile = <two\\\\d.tst>\n")));
    EXPECT_TRUE(frame->OpenFile(Path("alone.tst")));
    const auto one = ProjectOf("one/a.tst"), two = ProjectOf("two/c.tst");
    EXPECT_NE(one, 0);
    EXPECT_NE(two, 0);
    EXPECT_NE(one, two);
    EXPECT_EQ(ProjectOf("one/b.tst"), one);
    EXPECT_EQ(ProjectOf("two/d.tst"), two);
    EXPECT_EQ(ProjectOf("alone.tst"), 0);

    const char* all[] = {"one/a.tst", "one/b.tst", "two/c.tst", "two/d.tst", "alone.tst"};
    for (const char* name : all)
        TakeLog(ViewOf(name));
    Activate("one/a.tst");
    frame->SendCommand(2); // tells the project
    EXPECT_THAT(TakeLog(ViewOf("one/b.tst")), ElementsAre(QString("between 522 %1").arg(one)));
    for (const char* name : {"one/a.tst", "two/c.tst", "two/d.tst", "alone.tst"})
        EXPECT_THAT(TakeLog(ViewOf(name)), ElementsAre()) << name;
    EXPECT_TRUE(asked.isEmpty());
}

TEST_F(ShellTest, AtTheStartTheFirstFileIsThereAtOnceAndTheOthersFollow)
{
    for (const char* name : {"a.tst", "b.tst", "c.tst"})
        Write(name);
    const QString path = WriteProject("p.kvrp", "File = <a.tst>\nFile = <b.tst>\nFile = <gone.tst>\nFile = <c.tst>\n");
    EXPECT_TRUE(frame->OpenFile(path, true));
    const auto opened = [this] {
        QStringList open;
        for (const auto& document : Texts().findChildren<CKsDoc*>())
            open << QFileInfo(document->GetPathName()).fileName();
        return open.join(' ').toStdString();
    };
    EXPECT_EQ(opened(), "a.tst");
    const QRect before = ViewOf("a.tst")->parentWidget()->geometry();
    ASSERT_TRUE(QTest::qWaitFor([&] { return opened() == "a.tst b.tst c.tst"; }));
    EXPECT_EQ(ViewOf("a.tst")->parentWidget()->geometry(), before) << "it stands where it will stay";
    EXPECT_EQ(frame->ActiveDocument(), ViewOf("a.tst")->GetDocument());
    EXPECT_EQ(asked.size(), 1) << "gone.tst";
    EXPECT_EQ(frame->MdiArea().viewMode(), QMdiArea::SubWindowView);

    EXPECT_TRUE(frame->Projects().Close(ProjectOf("a.tst")));
    EXPECT_TRUE(frame->OpenFile(path, true));
    EXPECT_TRUE(frame->Projects().Close(ProjectOf("a.tst")));
    QTest::qWait(600);
    EXPECT_EQ(opened(), "") << "the others do not open in a project that was closed";
}

// An editor that writes its extension in capitals renames a member; the project file follows, and nothing else in it.
// Entries that are none count for nothing.
TEST_F(ShellTest, AMemberThatIsRespeltIsRespeltInTheProjectFile)
{
    for (const char* name : {"one/r\u00FC.tst", "b.tst", "c.tst"})
        Write(name);
    ASSERT_TRUE(frame->OpenFile(WriteProject("before.kvrp", "File = <c.tst>\n")));
    const QString path =
        WriteProject("p.kvrp", "File = 7\n  // main river\n  File = <one\\\\r\xC3\xBC.tst> // keep\nFile=<b.tst>\n"
                               "File = true\nFile = \"one/r\xC3\xBC.tst\"\n");
    const auto content = [&path] {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll().toStdString() : std::string();
    };
    ASSERT_TRUE(frame->OpenFile(path));
    CKsDoc* document = ViewOf("one/r\u00FC.tst")->GetDocument();
    const std::string before = content();
    for (const char* other : {"one/other.TST", "two/r\u00FC.TST"}) {
        document->SetPathName(Path(other));
        EXPECT_EQ(content(), before) << "another file is no other spelling: " << other;
        document->SetPathName(Path("one/r\u00FC.tst"));
    }
    const auto rename = [&](const char* from, const char* to) {
        ASSERT_TRUE(QFile::rename(Path(from), Path(to)));
        ViewOf(from)->GetDocument()->SetPathName(Path(to));
    };
    rename("one/r\u00FC.tst", "one/r\u00FC.TST");
    EXPECT_EQ(content(),
              "[KVR_PROJECT]\n[Members]\nFile = 7\n  // main river\n  File = <one\\\\r\xC3\xBC.TST> // keep\n"
              "File=<b.tst>\nFile = true\nFile = \"one/r\xC3\xBC.TST\"\n[/Members]\n[/KVR_PROJECT]\n");
    const CProject* project = frame->Projects().Registry().Find(ProjectOf("b.tst"));
    EXPECT_EQ(project->members, (QStringList{Path("one/r\u00FC.TST"), Path("b.tst")})) << "nor does the tree keep it";
    rename("one/r\u00FC.TST", "one/r\u00FC.tst");
    EXPECT_EQ(content(), before) << "and back";
    EXPECT_TRUE(asked.isEmpty());
    const QString other = WriteProject("other.kvrp", "File = <C.tst>\n");
    ASSERT_TRUE(frame->OpenFile(other));
    rename("c.tst", "c.TST");
    EXPECT_EQ(frame->Projects().Registry().Find(ProjectOf("c.TST"))->members, QStringList{Path("c.TST")})
        << "a member that is spelt in another case is found, and follows as well";
    QFile file(other);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly) && file.readAll().contains("File = <C.TST>"));
}

TEST_F(ShellTest, AProjectFileOfSeveralNamesIsAskedAbout)
{
    const auto content = [](const QString& path) {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    };
    for (const auto answer : {QMessageBox::Cancel, QMessageBox::No, QMessageBox::Yes}) {
        SCOPED_TRACE(answer);
        Write("a.tst");
        const QString path = WriteProject("p.kvrp", "File = <a.tst>\n"), other = Path("p.other");
        std::filesystem::create_hard_link(path.toStdString(), other.toStdString());
        ASSERT_TRUE(frame->OpenFile(path));
        asked.clear();
        answers = {answer};
        ASSERT_TRUE(QFile::rename(Path("a.tst"), Path("a.TST")));
        ViewOf("a.tst")->GetDocument()->SetPathName(Path("a.TST"));
        ASSERT_EQ(asked.size(), 1);
        EXPECT_TRUE(asked.front().contains("p.kvrp is one of 2 names of the same file"));
        EXPECT_EQ(content(path).contains("a.TST"), answer != QMessageBox::Cancel);
        EXPECT_EQ(content(other).contains("a.TST"), answer == QMessageBox::Yes);
        QCoreApplication::processEvents();
        EXPECT_EQ(asked.size(), 1) << "what he does not want is no failure";
        Action("actionCloseProject")->trigger();
        Settle();
        for (const QString& each : {path, other, Path("a.TST")})
            QFile::remove(each);
    }
}

TEST_F(ShellTest, AProjectFileThatCannotFollowIsNamed)
{
    Write("a.tst");
    const QString path = WriteProject("p.kvrp", "File = <a.tst>\n");
    ASSERT_TRUE(frame->OpenFile(path));
    ASSERT_TRUE(frame->OpenFile(WriteProject("q.kvrp", "File = <b.tst>\n")));
    asked.clear(); // b.tst is not there
    QFile::remove(path);
    QDir().mkdir(path); // nobody can write that
    CKsDoc* document = ViewOf("a.tst")->GetDocument();
    ASSERT_TRUE(QFile::rename(Path("a.tst"), Path("a.TST")));
    document->SetPathName(Path("a.TST"));
    EXPECT_TRUE(asked.isEmpty()) << "not in the middle of the save";
    QCoreApplication::processEvents();
    ASSERT_EQ(asked.size(), 1);
    EXPECT_TRUE(asked[0].startsWith("The project p still names a.tst")) << qPrintable(asked[0]);
}

TEST_F(ShellTest, AProjectStandsSideBySideUnlessTheUserChoseTabs)
{
    Write("a.tst");
    Write("b.tst");
    const QString path = WriteProject("p.kvrp", "File = <a.tst>\nFile = <b.tst>\n");
    EXPECT_EQ(frame->MdiArea().viewMode(), QMdiArea::TabbedView) << "single documents";
    frame->close(); // a session in which nothing was chosen
    Start();
    frame->OpenFile(path);
    EXPECT_EQ(frame->MdiArea().viewMode(), QMdiArea::SubWindowView);
    frame->close();
    Start();
    EXPECT_EQ(frame->MdiArea().viewMode(), QMdiArea::TabbedView);
    Action("actionTabs")->trigger();
    Action("actionTabs")->trigger();
    frame->OpenFile(path);
    EXPECT_EQ(frame->MdiArea().viewMode(), QMdiArea::TabbedView) << "chosen";
    Action("actionSideBySide")->trigger();
    frame->close();
    Start();
    EXPECT_EQ(frame->MdiArea().viewMode(), QMdiArea::SubWindowView) << "chosen";
}

TEST_F(ShellTest, AClosedViewLeavesAndTheOthersHearOfIt)
{
    Write("a.tst");
    Write("b.tst");
    frame->OpenFile(WriteProject("p.kvrp", "File = <a.tst>\nFile = <b.tst>\n"));
    const auto handle = ProjectOf("a.tst");
    TakeLog(ViewOf("a.tst"));
    Activate("b.tst");
    Action("actionClose")->trigger();
    Settle();
    EXPECT_EQ(frame->Projects().Registry().Find(handle)->views.size(), 1u);
    EXPECT_THAT(TakeLog(ViewOf("a.tst")), ElementsAre(QString("between 522 %1").arg(handle)));
    frame->OpenFile(Path("b.tst"));
    EXPECT_EQ(ProjectOf("b.tst"), handle) << "it joins again";
}

TEST_F(ShellTest, AFileOpenBeforeItsProjectJoinsWhenTheProjectOpens)
{
    frame->OpenFile(Write("a.tst"));
    EXPECT_EQ(ProjectOf("a.tst"), 0);
    frame->ActiveDocument()->SetModifiedFlag();
    answers << QMessageBox::Cancel;
    const QString path = WriteProject("p.kvrp", "File = <a.tst>\n");
    frame->OpenFile(path);
    EXPECT_EQ(asked.size(), 2) << "the question, and that the file stays outside";
    EXPECT_EQ(ProjectOf("a.tst"), 0);
    asked.clear();
    answers << QMessageBox::Cancel;
    Write("b.tst");
    frame->OpenFile(WriteProject("q.kvrp", "File = <a.tst>\nFile = <b.tst>\n"));
    EXPECT_EQ(asked.size(), 2) << "nor is it tried again as the first file of several";
    frame->Projects().Close(ProjectOf("b.tst"));

    answers << QMessageBox::Save;
    frame->OpenFile(path);
    Settle();
    EXPECT_NE(ProjectOf("a.tst"), 0);
    EXPECT_EQ(Texts().findChildren<CKsDoc*>().size(), 1);
}

TEST_F(ShellTest, ClosingAProjectClosesItsWindowsOnly)
{
    Write("a.tst");
    Write("b.tst");
    frame->OpenFile(Write("alone.tst"));
    frame->OpenFile(WriteProject("p.kvrp", "File = <a.tst>\nFile = <b.tst>\n"));
    const auto handle = ProjectOf("a.tst");
    EXPECT_THAT(TakeLog(ViewOf("alone.tst")), ElementsAre(QString("project 1 %1").arg(handle)));
    ViewOf("b.tst")->GetDocument()->SetModifiedFlag();
    answers << QMessageBox::Cancel;
    EXPECT_FALSE(frame->Projects().Close(handle));
    EXPECT_TRUE(frame->Projects().Registry().Find(handle));
    answers << QMessageBox::Discard;
    EXPECT_TRUE(frame->Projects().Close(handle));
    Settle();
    EXPECT_EQ(Texts().findChildren<CKsDoc*>().size(), 1);
    EXPECT_THAT(TakeLog(ViewOf("alone.tst")), ElementsAre(QString("project 3 %1").arg(handle)));
    EXPECT_FALSE(frame->Projects().Close(handle)) << "a handle is used once";
    EXPECT_FALSE(Action("actionCloseProject")->isEnabled());
}

TEST_F(ShellTest, WhatIsWrongWithAProjectIsSaid)
{
    struct Case
    {
        QString path;
        const char* says;
    };
    const Case refused[] = {
        {Path("missing.kvrp"), "missing.kvrp"},
        {Write("syntax.kvrp", "[KVR_PROJECT]\n[Members]\n"), "syntax.kvrp, line"},
        {Write("other.kvrp", "[KAVO0_HD]\n[/KAVO0_HD]\n"), "KVR_PROJECT"},
    };
    for (const Case& c : refused) {
        EXPECT_FALSE(frame->OpenFile(c.path));
        EXPECT_TRUE(asked.takeLast().contains(c.says)) << c.says;
    }
    EXPECT_TRUE(frame->Projects().Registry().All().empty());

    Write("there.tst");
    EXPECT_TRUE(
        frame->OpenFile(WriteProject("p.kvrp", "File = <gone.tst>\nFile = <there.tst>\nFile = <p.kvrp.png>\n")));
    EXPECT_TRUE(asked.at(0).contains("gone.tst"));
    EXPECT_FALSE(asked.at(0).contains("there.tst"));
    EXPECT_NE(ProjectOf("there.tst"), 0) << "the rest opens";

    // What an editor says without a name is told with it, and once; nor is such a file shown as the first one.
    asked.clear();
    Write("odd.tst", "odd");
    Write("other.tst");
    EXPECT_TRUE(frame->OpenFile(WriteProject("odd.kvrp", "File = <odd.tst>\nFile = <other.tst>\n")));
    EXPECT_EQ(asked, QStringList("These files of the project odd could not be opened:\n" +
                                 QDir::toNativeSeparators(Path("odd.tst")) + ": This is no text."));

    EXPECT_TRUE(frame->OpenFile(Write("empty.kvrp", "[KVR_PROJECT]\n[/KVR_PROJECT]\n")));
    EXPECT_TRUE(frame->OpenFile(WriteProject("number.kvrp", "File = 7\nFile = <there.tst>\n")));
    QStringList places;
    for (const auto* model : frame->findChildren<CKsFindingsModel*>())
        places << model->index(0, 0).data().toString() + ": " + model->index(0, 6).data().toString();
    EXPECT_THAT(places, ElementsAre(QString("1: a section [Members]"), QString("3: a file name in < >")));
}

TEST_F(ShellTest, TheSwitchboardAnswersNothingElse)
{
    CKSComm_Package package;
    for (const WPARAM request : {0, 24, 25, 40, 200}) {
        package.text = request == 25 ? Path("nowhere.tst") : QString();
        EXPECT_EQ(frame->WindowProc(KsMessage::SwitchBoard(), request, reinterpret_cast<LPARAM>(&package)), 0);
        EXPECT_EQ(frame->WindowProc(KsMessage::SwitchBoard(), request, 0), 0) << "without a package";
    }
    package.project = 99;
    EXPECT_EQ(frame->WindowProc(KsMessage::BetweenEditors(), 522, reinterpret_cast<LPARAM>(&package)), 0);
}

TEST_F(ShellTest, ATreeShowsTheProjectsFiles)
{
    auto* dock = frame->findChild<CProjectTree*>();
    auto* tree = dock->findChild<QTreeWidget*>();
    EXPECT_FALSE(dock->isVisible());
    EXPECT_FALSE(Action("actionProjectTree")->isEnabled());
    Write("a.tst");
    Write("b.tst");
    answers << QMessageBox::Ok;
    frame->OpenFile(WriteProject("p.kvrp", "File = <a.tst>\nFile = <b.tst>\nFile = <gone.tst>\nFile = <p.kvrp>\n"));
    EXPECT_TRUE(dock->isVisible());
    const auto shown = [&] {
        QStringList files;
        const QTreeWidgetItem* project = tree->topLevelItem(0);
        for (int i = 0; project && i < project->childCount(); ++i)
            files << project->child(i)->text(0) + (project->child(i)->font(0).bold() ? " open" : "");
        return files.join(", ").toStdString();
    };
    EXPECT_EQ(shown(), "a.tst open, b.tst open, gone.tst (missing), p.kvrp (no editor)");
    ViewOf("a.tst")->GetDocument()->SetModifiedFlag();
    EXPECT_EQ(shown(), "a.tst* open, b.tst open, gone.tst (missing), p.kvrp (no editor)");
    ViewOf("a.tst")->GetDocument()->SetModifiedFlag(false);
    frame->MdiArea().activeSubWindow()->close();
    Settle();
    EXPECT_EQ(shown(), "a.tst, b.tst open, gone.tst (missing), p.kvrp (no editor)") << "the first file was in front";
    // Enter opens the file in its project again.
    tree->setCurrentItem(tree->topLevelItem(0)->child(0));
    tree->setFocus();
    QTest::keyClick(tree, Qt::Key_Return);
    QCoreApplication::processEvents();
    EXPECT_NE(ProjectOf("a.tst"), 0);
    EXPECT_EQ(shown(), "a.tst open, b.tst open, gone.tst (missing), p.kvrp (no editor)");
    Action("actionProjectTree")->trigger();
    EXPECT_FALSE(dock->isVisible());
    EXPECT_TRUE(frame->Projects().Close(frame->Projects().Registry().All().front()->handle));
    EXPECT_EQ(tree->topLevelItemCount(), 0);
}

TEST_F(ShellTest, AMemberIsFoundInWhateverCaseItWasSaved)
{
    Write("a.TST");
    EXPECT_TRUE(frame->OpenFile(WriteProject("p.kvrp", "File = <a.tst>\n")));
    EXPECT_EQ(asked, QStringList());
    ASSERT_TRUE(ViewOf("a.TST"));
    EXPECT_NE(ProjectOf("a.TST"), 0);
    EXPECT_EQ(ViewOf("A.tst"), ViewOf("a.TST"));
    EXPECT_TRUE(frame->OpenFile(Path("A.tst")));
    EXPECT_EQ(Texts().findChildren<CKsDoc*>().size(), 1) << "it is open already";
    EXPECT_TRUE(frame->OpenFile(Path("P.KVRP")));
    EXPECT_EQ(frame->Projects().Registry().All().size(), 1u) << "so is the project";
}

TEST_F(ShellTest, CancelInCloseProjectLeavesEverythingAsItWas)
{
    for (const char* name : {"a.tst", "b.tst", "c.tst"})
        Write(name);
    frame->OpenFile(WriteProject("p.kvrp", "File = <a.tst>\nFile = <b.tst>\nFile = <c.tst>\n"));
    const auto handle = ProjectOf("a.tst");
    for (const char* name : {"b.tst", "c.tst"})
        ViewOf(name)->GetDocument()->SetModifiedFlag();
    const CView* const front = frame->GetActiveView();
    for (const char* name : {"a.tst", "b.tst", "c.tst"})
        TakeLog(ViewOf(name));
    for (const auto first : {QMessageBox::Discard, QMessageBox::Save}) {
        answers << first << QMessageBox::Cancel;
        Action("actionCloseProject")->trigger();
        Settle();
    }
    EXPECT_EQ(asked.size(), 4);
    EXPECT_EQ(QFileInfo(Path("b.tst")).size(), 1) << "not saved";
    EXPECT_EQ(Texts().findChildren<CKsDoc*>().size(), 3);
    ASSERT_TRUE(frame->Projects().Registry().Find(handle));
    EXPECT_EQ(frame->Projects().Registry().Find(handle)->views.size(), 3u);
    EXPECT_EQ(frame->GetActiveView(), front);
    for (const char* name : {"a.tst", "b.tst", "c.tst"})
        EXPECT_THAT(TakeLog(ViewOf(name)), ElementsAre()) << name;
    EXPECT_TRUE(ViewOf("b.tst")->GetDocument()->IsModified());

    asked.clear();
    answers << QMessageBox::Save << QMessageBox::Discard;
    Action("actionCloseProject")->trigger();
    Settle();
    EXPECT_EQ(asked.size(), 2) << "each question once";
    EXPECT_EQ(QFileInfo(Path("b.tst")).size(), 5) << "saved";
    EXPECT_TRUE(Texts().findChildren<CKsDoc*>().empty());
    EXPECT_TRUE(frame->Projects().Registry().All().empty());
}

TEST_F(ShellTest, AFileOfTwoProjectsBelongsToOneAndTheUserIsTold)
{
    for (const char* name : {"both.tst", "a.tst", "b.tst"})
        Write(name);
    const auto* tree = frame->findChild<CProjectTree*>()->findChild<QTreeWidget*>();
    const auto shown = [&](int project, int file) { return tree->topLevelItem(project)->child(file)->text(0); };
    EXPECT_TRUE(frame->OpenFile(WriteProject("one.kvrp", "File = <both.tst>\nFile = <a.tst>\n")));
    const auto one = ProjectOf("both.tst");
    EXPECT_TRUE(asked.isEmpty());
    EXPECT_TRUE(frame->OpenFile(WriteProject("two.kvrp", "File = <BOTH.tst>\nFile = <b.tst>\n")));
    const auto two = ProjectOf("b.tst");
    ASSERT_EQ(asked.size(), 1);
    EXPECT_TRUE(asked[0].contains("BOTH.tst: open in the project one")) << qPrintable(asked[0]);
    EXPECT_FALSE(asked[0].contains("b.tst: "));
    EXPECT_EQ(ProjectOf("both.tst"), one);
    EXPECT_EQ(shown(0, 0), "both.tst");
    EXPECT_EQ(shown(1, 0), "BOTH.tst (in one)");

    // Where it is opened from, there it belongs.
    for (const auto& [from, project] : {std::pair(1, two), std::pair(0, one)}) {
        CKsMDIChildWnd::Of(ViewOf("both.tst"))->close();
        Settle();
        QCoreApplication::processEvents();
        EXPECT_EQ(shown(1 - from, 0).length(), 8) << "in neither";
        emit frame->findChild<CProjectTree*>()->MemberChosen(project, Path("both.tst"));
        QCoreApplication::processEvents();
        ASSERT_TRUE(ViewOf("both.tst"));
        EXPECT_EQ(ProjectOf("both.tst"), project);
        EXPECT_TRUE(shown(1 - from, 0).endsWith(from == 0 ? "(in one)" : "(in two)"));
    }
    EXPECT_TRUE(frame->Projects().Close(one));
    Settle();
    EXPECT_TRUE(ViewOf("b.tst"));
    EXPECT_FALSE(ViewOf("both.tst"));
}
