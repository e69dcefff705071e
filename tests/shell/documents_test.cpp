#include "shell/recent_files.h"
#include "shell_fixture.h"

#include <QMimeData>

TEST_F(ShellTest, OpenSaveAndCloseByTheMenu)
{
    names << Write("a.tst");
    Action("actionOpen")->trigger();
    ASSERT_TRUE(ViewOf("a.tst"));
    EXPECT_EQ(frame->ActiveDocument()->GetPathName(), Path("a.tst"));
    EXPECT_EQ(frame->windowTitle(), QCoreApplication::applicationName() + " - [a.tst[*]]");
    frame->ActiveDocument()->SetModifiedFlag();
    EXPECT_TRUE(frame->isWindowModified());
    Action("actionSave")->trigger();
    EXPECT_FALSE(frame->isWindowModified());

    names << Path("b.tst");
    Action("actionSaveAs")->trigger();
    EXPECT_EQ(frame->ActiveDocument()->GetPathName(), Path("b.tst"));
    EXPECT_EQ(RecentFiles::All().mid(0, 1), QStringList(Path("b.tst")));
    Action("actionClose")->trigger();
    Settle();
    EXPECT_FALSE(frame->ActiveDocument());
    EXPECT_EQ(frame->windowTitle(), QCoreApplication::applicationName());
    EXPECT_FALSE(Action("actionSave")->isEnabled());
}

TEST_F(ShellTest, AMaximisedWindowDoesNotDoubleTheTitle)
{
    Action("actionTabs")->trigger(); // windows
    frame->OpenFile(Write("a.tst"));
    frame->MdiArea().currentSubWindow()->showMaximized();
    frame->ActiveDocument()->SetModifiedFlag();
    QCoreApplication::processEvents();
    EXPECT_EQ(frame->windowTitle().count("a.tst"), 1) << frame->windowTitle().toStdString();
    for (const bool tabs : {true, false, true, false}) {
        Action(tabs ? "actionTabs" : "actionSideBySide")->trigger();
        QCoreApplication::processEvents();
        EXPECT_TRUE(frame->isWindowModified()) << tabs;
    }
}

TEST_F(ShellTest, ANewDocumentIsSavedUnderTheNameAskedFor)
{
    Action("actionNew")->trigger();
    ASSERT_TRUE(frame->ActiveDocument());
    EXPECT_EQ(frame->ActiveDocument()->GetTitle(), "Test1");
    names << Path("new.tst");
    Action("actionSave")->trigger();
    EXPECT_TRUE(QFileInfo::exists(Path("new.tst")));
}

TEST_F(ShellTest, ExitAsksAndACancelKeepsEverything)
{
    frame->OpenFile(Write("a.tst"));
    frame->ActiveDocument()->SetModifiedFlag();
    answers << QMessageBox::Cancel;
    EXPECT_FALSE(frame->close());
    EXPECT_TRUE(frame->isVisible());
    ASSERT_TRUE(ViewOf("a.tst"));
    answers << QMessageBox::Discard;
    EXPECT_TRUE(frame->close());
    EXPECT_EQ(asked.size(), 2);
}

TEST_F(ShellTest, FilesAreDroppedIn)
{
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(Write("a.tst")), QUrl::fromLocalFile(Write("b.TST"))});
    QDragEnterEvent enter(QPoint(5, 5), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(frame.get(), &enter);
    EXPECT_TRUE(enter.isAccepted());
    QDropEvent drop(QPointF(5, 5), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(frame.get(), &drop);
    EXPECT_EQ(Texts().findChildren<CKsDoc*>().size(), 2);

    // What cannot be opened is told once, however many there are; the others open.
    QList<QUrl> many{QUrl::fromLocalFile(Write("last.tst"))};
    for (int i = 300; i > 0; --i)
        many.prepend(QUrl::fromLocalFile(Path(QString("gone%1.tst").arg(i))));
    data.setUrls(many);
    QDragEnterEvent enterMany(QPoint(5, 5), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(frame.get(), &enterMany);
    QDropEvent dropMany(QPointF(5, 5), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(frame.get(), &dropMany);
    EXPECT_TRUE(ViewOf("last.tst"));
    ASSERT_EQ(asked.size(), 1);
    EXPECT_TRUE(asked[0].contains("gone1.tst") && asked[0].contains("gone10.tst") && !asked[0].contains("gone11.tst"));
    EXPECT_TRUE(asked[0].endsWith("could not be opened: 290")) << asked[0].toStdString();

    data.setUrls({QUrl::fromLocalFile(Write("c.png"))});
    QDragEnterEvent other(QPoint(5, 5), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    other.ignore();
    QApplication::sendEvent(frame.get(), &other);
    EXPECT_FALSE(other.isAccepted());
}
