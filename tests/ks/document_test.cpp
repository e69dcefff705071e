#include "ks_fixture.h"

#include <QUndoStack>

using testing::ElementsAre;
using testing::HasSubstr;

TEST_F(KsTest, OpenGivesTheViewADocumentThatHasItsName)
{
    TextDoc* document = Open(Write("river.tst", "abc"));
    ASSERT_TRUE(document);
    EXPECT_EQ(document->text, "abc");
    EXPECT_EQ(document->GetPathName(), Path("river.tst"));
    EXPECT_FALSE(document->IsModified());
    EXPECT_EQ(LogView::log.at(0), "a initial river.tst");
    EXPECT_EQ(WindowOf(document)->windowTitle(), "river.tst[*]");
    EXPECT_EQ(frame.GetActiveView(), ViewOf(document));
}

TEST_F(KsTest, AFileThatIsOpenComesToTheFront)
{
    TextDoc* first = Open(Write("one.tst", "1"));
    Open(Write("two.tst", "2"));
    EXPECT_EQ(Open(folder.path() + "/./one.tst"), first);
    EXPECT_EQ(documents.findChildren<CKsDoc*>().size(), 2);
    EXPECT_EQ(frame.GetActiveView(), ViewOf(first));
}

TEST_F(KsTest, WhatCannotBeOpenedIsToldAndLeavesNothing)
{
    QDir(folder.path()).mkdir("dir.tst");
    for (const char* name : {"missing.tst", "dir.tst"}) {
        EXPECT_FALSE(Open(Path(name)));
        EXPECT_THAT(asked.takeLast().toStdString(), HasSubstr(name));
    }
    EXPECT_FALSE(Open(Write("no.tst", "refuse"))); // the document refuses, and has told why itself
    EXPECT_TRUE(documents.findChildren<CKsDoc*>().empty());
    EXPECT_TRUE(frame.MdiArea().subWindowList().isEmpty());
}

TEST_F(KsTest, NewDocumentsAreNumbered)
{
    EXPECT_EQ(Open({})->GetTitle(), "Text1");
    EXPECT_EQ(Open({})->GetTitle(), "Text2");
}

TEST_F(KsTest, UpdatesReachEveryViewButTheSender)
{
    TextDoc* document = Open({});
    LogView second;
    second.name = "second";
    document->AddView(&second);
    LogView::log.clear();
    CHint object;
    document->UpdateAllViews(nullptr, 1);
    document->UpdateAllViews(&second, 2, &object);
    EXPECT_THAT(LogView::log, ElementsAre("a 1", "second 1", "a 2 from another with object"));
    EXPECT_EQ(second.GetDocument(), document);
}

TEST_F(KsTest, TemplatesMatchExtensionsWhateverTheirCase)
{
    for (const char* name : {"a.tst", "A.TST", "a.b.Tst"})
        EXPECT_TRUE(documents.MatchesExtension(name)) << name;
    for (const char* name : {"a.tst2", "atst", "tst", ""})
        EXPECT_FALSE(documents.MatchesExtension(name)) << name;
    EXPECT_EQ(documents.FileDialogFilter(), "Texts (*.tst *.TST)");
    EXPECT_EQ(documents.GetDocString(CMultiDocTemplate::windowTitle), "Help.chm");
    EXPECT_EQ(documents.GetDocString(CMultiDocTemplate::regFileTypeName), "Text Document");
}

TEST_F(KsTest, TheTitleFollowsNameAndModifiedFlag)
{
    TextDoc* document = Open({});
    document->SetModifiedFlag();
    EXPECT_TRUE(WindowOf(document)->isWindowModified());
    document->SetPathName("/somewhere/x.tst");
    document->SetModifiedFlag(false);
    EXPECT_EQ(WindowOf(document)->windowTitle(), "x.tst[*]");
    EXPECT_FALSE(WindowOf(document)->isWindowModified());
}

TEST_F(KsTest, TheViewGoesBeforeItsDocument)
{
    TextDoc* document = Open(Write("river.tst", "abc"));
    const QPointer<CKsDoc> watch = document;
    QMdiSubWindow* window = WindowOf(document);
    LogView::log.clear();
    window->close();
    EXPECT_TRUE(watch) << "the window lives until control returns to the event loop";
    TextDoc* again = Open(Path("river.tst"));
    EXPECT_NE(again, document) << "a document that is being closed is not open";
    Settle();
    EXPECT_FALSE(watch);
    EXPECT_TRUE(LogView::log.contains("a gone river.tst"));
    EXPECT_EQ(documents.findChildren<CKsDoc*>().size(), 1);
}
