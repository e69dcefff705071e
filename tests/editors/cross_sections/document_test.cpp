// The document: saving, the modified flag, and its place in a project.
#include "cross_sections_fixture.h"

namespace {

TEST_F(CrossSectionTest, ChangesAreTracedToldAndSaved)
{
    CCrossSectionView* view = Open();
    CCrossSectionDoc* document = view->Document();
    EXPECT_EQ(document->ProjectHandle(), 7);
    EXPECT_EQ(log, QStringList{"shell 25"}) << "nobody asked for the first section";
    EXPECT_EQ(view->CurrentSection(), 0);
    log.clear();
    EXPECT_TRUE(Edit(view->Sections(), Main1000, SectionWidth, "12"));
    EXPECT_TRUE(document->IsModified());
    document->UndoStack().undo();
    EXPECT_FALSE(document->IsModified());
    QCoreApplication::processEvents(); // news wait for the end of the event
    EXPECT_EQ(log, QStringList({"others 522", "others 522"}));
    document->UndoStack().redo();
    ASSERT_TRUE(document->DoSave(folder.filePath("saved.kvxs")));
    EXPECT_FALSE(document->IsModified());
    EXPECT_TRUE(Read(folder.filePath("saved.kvxs")).contains("Width = 12"));
    document->UndoStack().undo();
    EXPECT_TRUE(document->IsModified()) << "what is shown is not what was saved";

    EXPECT_FALSE(document->DoSave(folder.filePath("no/folder.kvxs")));
    EXPECT_EQ(boxes.size(), 1);
    EXPECT_TRUE(boxes.value(0).contains("folder.kvxs\": ")) << boxes.value(0).toStdString();
    EXPECT_TRUE(document->IsModified());
    document->SetModifiedFlag(false);
    log.clear();
    frame.reset();
    EXPECT_EQ(log, QStringList({"shell 24", "others 522"}));
}

TEST_F(CrossSectionTest, OutsideAProjectNobodyIsTold)
{
    project = 0;
    CCrossSectionView* view = Open();
    log.clear();
    Select(view->Sections(), Side300);
    EXPECT_TRUE(Edit(view->Sections(), Side300, SectionRadius, "99"));
    EXPECT_TRUE(log.isEmpty()) << log.join(' ').toStdString();
    project = 9;
    KsSendMessage(view, KsMessage::ProjectManagement(), KsRequest::ProjectOpened, 0);
    EXPECT_EQ(view->Document()->ProjectHandle(), 9) << "it joins a project that opens later";
}

TEST_F(CrossSectionTest, WhatIsBeingTypedIsSaved)
{
    CCrossSectionView* view = Open();
    Select(view->Points(), 0);
    Type(view->Points(), 0, PointLevel, "4.25");
    ASSERT_TRUE(view->Document()->DoSave(folder.filePath("typed.kvxs")));
    EXPECT_TRUE(Read(folder.filePath("typed.kvxs")).contains("Point = -5, 4.25"));
}

} // namespace
