#include "module_fixture.h"

#include <QDir>
#include <filesystem>
#include <QUndoStack>

namespace {

class DocumentTest : public ModuleTest
{
protected:
    CKavo0_hdDoc document;
};

TEST_F(DocumentTest, OpensTheTwoSpellingsOfTheExtensionOnly)
{
    const std::pair<const char*, bool> cases[] = {
        {"a.hdkv", true}, {"b.HDKV", true}, {"c.Hdkv", false}, {"d.txt", false}, {"hdkv", false}};
    for (const auto& [name, opens] : cases) {
        Write(Path(name), SmallFile);
        boxes.clear();
        EXPECT_EQ(bool(document.OnOpenDocument(Path(name))), opens) << name;
        EXPECT_EQ(boxes, opens ? QStringList() : QStringList("Unsupported file format")) << name;
        document.DeleteContents();
    }
    EXPECT_FALSE(document.OnOpenDocument(Path("missing.hdkv")));
}

TEST_F(DocumentTest, SavePurgesWritesUpperCaseAndUndoBringsTheLinesBack)
{
    Write(Path("river.hdkv"), SmallFile);
    ASSERT_TRUE(document.OnOpenDocument(Path("river.hdkv")));
    document.SetPathName(Path("river.hdkv"));
    document.Parameters().LeakageList.Add(); // lists that are not cleaned keep incomplete lines
    document.UpdateAll(nullptr, CKsDoc::ReloadHint, nullptr);
    ASSERT_TRUE(document.IsModified());

    ASSERT_TRUE(document.OnSaveDocument(Path("river.hdkv")));
    EXPECT_TRUE(boxes.isEmpty());
    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(QDir(folder.path()).entryList(QDir::Files), QStringList("river.HDKV"));
    EXPECT_EQ(document.GetPathName(), Path("river.HDKV"));
    EXPECT_EQ(document.Parameters().InitList.GetCount(), 1u);
    EXPECT_EQ(document.Parameters().LeakageList.GetCount(), 1u);

    CKavo0_hdDoc again;
    ASSERT_TRUE(again.OnOpenDocument(Path("river.HDKV")));
    EXPECT_EQ(again.Parameters().InitList.GetCount(), 1u);
    EXPECT_EQ(again.Parameters().LeakageList.GetCount(), 1u);
    EXPECT_EQ(again.Parameters().Global.G_waterlevel, 1.5);
    EXPECT_TRUE(Read(Path("river.HDKV")).contains("DATA = \"MAIN\", 7, \"kept\""));

    document.UndoStack().undo();
    ASSERT_EQ(document.Parameters().InitList.GetCount(), 3u);
    EXPECT_EQ(document.Parameters().InitList.GetAt(1).Chainage, 200);
    EXPECT_TRUE(document.IsModified());
    document.UndoStack().redo();
    EXPECT_EQ(document.Parameters().InitList.GetCount(), 1u);
}

TEST_F(DocumentTest, SavingUnderAnotherExtensionWritesHDKVAndKeepsTheOldFile)
{
    Write(Path("river.hdkv"), SmallFile);
    ASSERT_TRUE(document.OnOpenDocument(Path("river.hdkv")));
    ASSERT_TRUE(document.OnSaveDocument(Path("copy.txt")));
    EXPECT_EQ(QDir(folder.path()).entryList(QDir::Files), (QStringList{"copy.HDKV", "river.hdkv"}));
    EXPECT_EQ(Read(Path("river.hdkv")), SmallFile);
}

TEST_F(DocumentTest, AFileThatCannotBeParsedOpensEmptyAndIsKeptWhenSavedOver)
{
    const QByteArray broken = "[KAVO0_HD]\n  [InitList]\n    DATA = \"A\", 1, 2, 3\n  [/WindList]\n";
    Write(Path("river.HDKV"), broken);
    ASSERT_TRUE(document.OnOpenDocument(Path("river.HDKV")));
    EXPECT_TRUE(boxes.isEmpty()) << "the bar of the view says it";
    EXPECT_EQ(document.File().Error(), "river.HDKV, line 4, column 3: expected [/InitList], found [/WindList]");
    EXPECT_TRUE(document.Parameters().InitList.IsEmpty());

    EXPECT_TRUE(document.IsReadOnly());

    answer = QMessageBox::No;
    EXPECT_FALSE(document.OnSaveDocument(Path("river.HDKV")));
    ASSERT_EQ(boxes.size(), 1);
    EXPECT_TRUE(boxes[0].contains("river.HDKV.unreadable-1")) << qPrintable(boxes[0]);
    EXPECT_EQ(Read(Path("river.HDKV")), broken);
    answer = QMessageBox::Yes;
    ASSERT_TRUE(document.OnSaveDocument(Path("river.HDKV")));
    EXPECT_EQ(boxes.size(), 2);
    EXPECT_EQ(Read(Path("river.HDKV.unreadable-1")), broken);
    EXPECT_FALSE(document.IsReadOnly());
    ASSERT_TRUE(document.OnSaveDocument(Path("river.HDKV")));
    CKavo0_hdDoc again;
    EXPECT_TRUE(again.OnOpenDocument(Path("river.HDKV")));
    EXPECT_EQ(boxes.size(), 2) << "nothing is left to ask";
    EXPECT_EQ(QDir(folder.path()).entryList(QDir::Files), (QStringList{"river.HDKV", "river.HDKV.unreadable-1"}));
}

TEST_F(DocumentTest, ValuesThatWereNotTakenAreListedAskedAboutOnceAndKeptInACopy)
{
    const QByteArray text = "[KAVO0_HD]\n[Global_Variables]\n[Global_Values]\nG_wave = 2.0\nG_f = \"x\"\n"
                            "[/Global_Values]\n[/Global_Variables]\n[/KAVO0_HD]\n";
    Write(Path("river.HDKV"), text);
    ASSERT_TRUE(document.OnOpenDocument(Path("river.HDKV")));
    document.SetPathName(Path("river.HDKV"));
    EXPECT_TRUE(boxes.isEmpty());
    EXPECT_FALSE(document.IsReadOnly() || document.IsModified());
    ASSERT_EQ(document.File().Findings().size(), 2u);
    EXPECT_EQ(document.Parameters().Global.G_wave, 2);

    answer = QMessageBox::No;
    EXPECT_FALSE(document.OnSaveDocument(Path("river.HDKV")));
    EXPECT_EQ(Read(Path("river.HDKV")), text);
    ASSERT_EQ(boxes.size(), 1);
    EXPECT_TRUE(boxes[0].contains("river.HDKV.original-1")) << qPrintable(boxes[0]);
    answer = QMessageBox::Yes;
    ASSERT_TRUE(document.OnSaveDocument(Path("river.HDKV")));
    EXPECT_EQ(Read(Path("river.HDKV.original-1")), text);
    EXPECT_TRUE(Read(Path("river.HDKV")).contains("G_wave = 2\n"));
    EXPECT_TRUE(document.File().Findings().empty());
    EXPECT_EQ(document.File().KeptCopy(), Path("river.HDKV.original-1"));
    ASSERT_TRUE(document.OnSaveDocument(Path("river.HDKV")));
    EXPECT_EQ(boxes.size(), 2) << "asked once";

    Write(Path("river.HDKV"), text);
    ASSERT_TRUE(document.OnOpenDocument(Path("river.HDKV")));
    ASSERT_TRUE(document.OnSaveDocument(Path("other.HDKV")));
    EXPECT_EQ(boxes.size(), 2) << "a save elsewhere leaves the file alone";
    EXPECT_EQ(Read(Path("river.HDKV")), text);

    ASSERT_TRUE(document.OnOpenDocument(Path("river.HDKV")));
    ASSERT_TRUE(QDir(folder.path()).mkdir("sub"));
    ASSERT_TRUE(document.OnSaveDocument(Path("sub/../river.HDKV")));
    EXPECT_EQ(boxes.size(), 3) << "it is that file, whichever way leads to it";
    EXPECT_EQ(Read(Path("river.HDKV.original-2")), text);
}

#ifndef _WIN32
// The extension in capitals is another name of the same entry.
TEST_F(DocumentTest, ALinkStaysALinkAndAFileKeepsItsMode)
{
    QDir(folder.path()).mkdir("shared");
    Write(Path("shared/a.hdkv"), SmallFile);
    ASSERT_TRUE(QFile::link("shared/a.hdkv", Path("a.hdkv")));
    ASSERT_TRUE(document.OnOpenDocument(Path("a.hdkv")));
    document.SetPathName(Path("a.hdkv"));
    ASSERT_TRUE(document.OnSaveDocument(Path("a.hdkv")));
    EXPECT_EQ(QDir(folder.path()).entryList(QDir::Files), QStringList("a.HDKV"));
    EXPECT_EQ(QFile::symLinkTarget(Path("a.HDKV")), Path("shared/a.hdkv"));
    EXPECT_TRUE(Read(Path("shared/a.hdkv")).startsWith("// KVR")) << "the target is written";
    EXPECT_EQ(document.File().Renamed(), "a.hdkv is now a.HDKV");
    ASSERT_TRUE(document.OnSaveDocument(Path("a.HDKV")));
    EXPECT_EQ(document.File().Renamed(), "") << "done once";

    Write(Path("b.hdkv"), SmallFile);
    const auto mode = QFile::ReadOwner | QFile::WriteOwner | QFile::ReadGroup;
    ASSERT_TRUE(QFile::setPermissions(Path("b.hdkv"), mode));
    ASSERT_TRUE(document.OnOpenDocument(Path("b.hdkv")));
    ASSERT_TRUE(document.OnSaveDocument(Path("b.hdkv")));
    const auto every = QFile::Permissions(0x7077);
    EXPECT_EQ(QFile::permissions(Path("b.HDKV")) & every, (mode & every)) << "0640";
    EXPECT_FALSE(QFile::exists(Path("b.hdkv")));
}

// A save under a new name replaces the file that the user was asked about, and leaves no twin of it.
TEST_F(DocumentTest, ASaveUnderTheNameOfAnotherFileTakesItsPlaceWhateverItsCase)
{
    Write(Path("a.HDKV"), SmallFile);
    ASSERT_TRUE(document.OnOpenDocument(Path("a.HDKV")));
    document.SetPathName(Path("a.HDKV"));
    const auto every = QFile::Permissions(0x7077), mode = QFile::ReadOwner | QFile::WriteOwner | QFile::ReadGroup;
    for (const char* chosen : {"b.hdkv", "b.HDKV"}) { // in the dialog, or typed
        QFile::remove(Path("b.HDKV"));
        Write(Path("b.hdkv"), "[Other]\n[/Other]\n");
        ASSERT_TRUE(QFile::setPermissions(Path("b.hdkv"), mode));
        ASSERT_TRUE(document.OnSaveDocument(Path(chosen)));
        EXPECT_EQ(QDir(folder.path()).entryList(QDir::Files), (QStringList{"a.HDKV", "b.HDKV"}));
        EXPECT_TRUE(Read(Path("b.HDKV")).startsWith("// KVR"));
        EXPECT_EQ(QFile::permissions(Path("b.HDKV")) & every, mode & every);
        EXPECT_EQ(document.File().Renamed(), "b.hdkv is now b.HDKV");
    }
    QDir(folder.path()).mkdir("shared");
    Write(Path("shared/c.hdkv"), SmallFile);
    ASSERT_TRUE(QFile::link("shared/c.hdkv", Path("c.hdkv")));
    ASSERT_TRUE(document.OnSaveDocument(Path("c.hdkv")));
    EXPECT_EQ(QFile::symLinkTarget(Path("c.HDKV")), Path("shared/c.hdkv"));
    EXPECT_TRUE(Read(Path("shared/c.hdkv")).startsWith("// KVR"));

    // Of two files that differ in case the one that is written goes, and the other stays.
    Write(Path("b.hdkv"), "[Other]\n[/Other]\n");
    ASSERT_TRUE(document.OnSaveDocument(Path("b.HDKV")));
    EXPECT_EQ(Read(Path("b.hdkv")), "[Other]\n[/Other]\n");
}
#endif

// A save replaces what the document was read from or last saved as, and asks about anything else.
TEST_F(DocumentTest, WhatAnotherProgramHasWrittenIsAskedAboutAndKept)
{
    Write(Path("river.HDKV"), SmallFile);
    ASSERT_TRUE(document.OnOpenDocument(Path("river.HDKV")));
    ASSERT_TRUE(document.OnSaveDocument(Path("river.HDKV")));
    ASSERT_TRUE(document.OnSaveDocument(Path("river.HDKV")));
    EXPECT_TRUE(boxes.isEmpty());
    Write(Path("river.HDKV"), "theirs");
    answer = QMessageBox::No;
    EXPECT_FALSE(document.OnSaveDocument(Path("river.HDKV")));
    ASSERT_EQ(boxes.size(), 1) << "who says no needs no reason";
    EXPECT_TRUE(boxes[0].contains("river.HDKV.displaced-1")) << qPrintable(boxes[0]);
    EXPECT_EQ(Read(Path("river.HDKV")), "theirs");
    answer = QMessageBox::Yes;
    EXPECT_TRUE(document.OnSaveDocument(Path("river.HDKV")));
    EXPECT_EQ(Read(Path("river.HDKV.displaced-1")), "theirs");
    EXPECT_EQ(document.File().SaveNotes(),
              "What another program had written to river.HDKV is kept in river.HDKV.displaced-1.");
    EXPECT_TRUE(document.OnSaveDocument(Path("river.HDKV")));
    EXPECT_EQ(boxes.size(), 2);
    EXPECT_EQ(document.File().SaveNotes(), "");

    // Who has been told may go on, that once.
    document.SetPathName(Path("river.HDKV"));
    Write(Path("river.HDKV"), "theirs again");
    EXPECT_TRUE(document.SaveOverOthers());
    EXPECT_EQ(Read(Path("river.HDKV.displaced-2")), "theirs again");
    EXPECT_EQ(boxes.size(), 2);
    Write(Path("river.HDKV"), "theirs once more");
    answer = QMessageBox::No;
    EXPECT_FALSE(document.OnSaveDocument(Path("river.HDKV")));
    EXPECT_EQ(boxes.size(), 3);
}

// The default values that stand there for a file that cannot be read are nothing that undo could bring back.
TEST_F(DocumentTest, AFileThatWasMendedIsReadAndNotUndone)
{
    Write(Path("river.HDKV"), "[KAVO0_HD]\n[broken");
    ASSERT_TRUE(document.OnOpenDocument(Path("river.HDKV")));
    document.SetPathName(Path("river.HDKV"));
    ASSERT_TRUE(document.IsReadOnly());
    CString why;
    EXPECT_FALSE(document.Reload(why));
    EXPECT_FALSE(why.isEmpty());
    Write(Path("river.HDKV"), SmallFile);
    ASSERT_TRUE(document.Reload(why));
    EXPECT_FALSE(document.IsReadOnly() || document.IsModified() || document.UndoStack().canUndo());
    EXPECT_EQ(document.Parameters().InitList.GetCount(), 3u);
    Write(Path("river.HDKV"), "[KAVO0_HD]\n[/KAVO0_HD]\n");
    ASSERT_TRUE(document.Reload(why));
    document.UndoStack().undo();
    EXPECT_EQ(document.Parameters().InitList.GetCount(), 3u);
}

#ifndef _WIN32
TEST_F(DocumentTest, OtherNamesOfAFileAreAskedAboutOnce)
{
    for (const auto choice : {QMessageBox::Cancel, QMessageBox::No, QMessageBox::Yes}) {
        Write(Path("river.HDKV"), SmallFile);
        QFile::remove(Path("other"));
        std::filesystem::create_hard_link(Path("river.HDKV").toStdString(), Path("other").toStdString());
        ASSERT_TRUE(document.OnOpenDocument(Path("river.HDKV")));
        boxes.clear();
        answer = choice;
        EXPECT_EQ(bool(document.OnSaveDocument(Path("river.HDKV"))), choice != QMessageBox::Cancel);
        EXPECT_EQ(boxes.size(), 1);
        EXPECT_EQ(Read(Path("other")) == SmallFile, choice != QMessageBox::Yes);
    }
    document.Parameters().Global.G_waterlevel = 4.5;
    EXPECT_TRUE(document.OnSaveDocument(Path("river.HDKV")));
    EXPECT_EQ(boxes.size(), 1);
    EXPECT_TRUE(Read(Path("other")).contains("G_waterlevel = 4.5"));
}
#endif

TEST_F(DocumentTest, AFailedSaveLeavesFileAndMemoryAsTheyWere)
{
    Write(Path("river.HDKV"), SmallFile);
    ASSERT_TRUE(document.OnOpenDocument(Path("river.HDKV")));
    document.UpdateAll(nullptr, CKsDoc::ReloadHint, nullptr);
    const CString target = Path("missing folder/river.HDKV");
    EXPECT_FALSE(document.OnSaveDocument(target));
    ASSERT_EQ(boxes.size(), 1);
    EXPECT_TRUE(boxes[0].contains("missing folder")) << qPrintable(boxes[0]);
    EXPECT_TRUE(document.IsModified());
    EXPECT_EQ(document.Parameters().InitList.GetCount(), 3u);
    EXPECT_EQ(Read(Path("river.HDKV")), SmallFile);
}

TEST_F(DocumentTest, AsksBeforeReplacingAnotherFileThatDiffersInCaseOnly)
{
    Write(Path("river.hdkv"), SmallFile);
    Write(Path("river.HDKV"), "[Other]\n[/Other]\n");
    if (QDir(folder.path()).entryList(QDir::Files).size() == 1)
        GTEST_SKIP() << "the file system ignores case";
    ASSERT_TRUE(document.OnOpenDocument(Path("river.hdkv")));
    document.SetPathName(Path("river.hdkv"));
    answer = QMessageBox::No;
    EXPECT_FALSE(document.OnSaveDocument(Path("river.hdkv")));
    EXPECT_EQ(boxes.size(), 1);
    EXPECT_EQ(Read(Path("river.HDKV")), "[Other]\n[/Other]\n");
    answer = QMessageBox::Yes;
    EXPECT_TRUE(document.OnSaveDocument(Path("river.hdkv")));
    EXPECT_EQ(QDir(folder.path()).entryList(QDir::Files), QStringList("river.HDKV"));

    // A folder is none of those that are spelt otherwise.
    ASSERT_TRUE(QDir(folder.path()).mkdir("sub"));
    Write(Path("sub/river.HDKV"), "[Other]\n[/Other]\n");
    EXPECT_FALSE(document.OnSaveDocument(Path("SUB/river.HDKV")));
    EXPECT_TRUE(boxes.back().contains("SUB")) << qPrintable(boxes.back());
    EXPECT_EQ(Read(Path("sub/river.HDKV")), "[Other]\n[/Other]\n");
}

TEST_F(DocumentTest, AFileThatCannotBeRenamedKeepsItsNameAndHoldsWhatWasSaved)
{
    const CString path = Path("b.hdkv");
    Write(path, SmallFile);
    if (!QDir(folder.path()).mkdir("b.HDKV"))
        GTEST_SKIP() << "the file system ignores case";
    ASSERT_TRUE(document.OnOpenDocument(path));
    document.SetPathName(path);
    document.Parameters().Global.G_waterlevel = 4.5;
    document.SetModifiedFlag(true);
    answer = QMessageBox::Yes;
    EXPECT_TRUE(document.OnSaveDocument(path));
    EXPECT_EQ(document.GetPathName(), path);
    EXPECT_FALSE(document.IsModified()) << "nothing is left to discard";
    EXPECT_TRUE(Read(path).contains("G_waterlevel = 4.5"));
    EXPECT_TRUE(boxes.back().contains("could not be renamed to b.HDKV")) << qPrintable(boxes.back());
}

TEST_F(DocumentTest, DeleteContentsKeepsTheGlobalValues)
{
    Write(Path("river.hdkv"), SmallFile);
    ASSERT_TRUE(document.OnOpenDocument(Path("river.hdkv")));
    document.DeleteContents();
    EXPECT_TRUE(document.Parameters().InitList.IsEmpty());
    EXPECT_EQ(document.Parameters().Global.G_waterlevel, 1.5);
}

TEST_F(DocumentTest, TalksToTheShellOnlyInsideAProject)
{
    CView view;
    document.SetPathName("p");
    EXPECT_FALSE(document.JoinProject(&view));
    document.LeaveProject(&view);
    document.DataChanged();
    ASSERT_EQ(messages.size(), 1u);
    EXPECT_EQ(messages[0].request, 25u);

    projectHandle = 77;
    messages.clear();
    EXPECT_TRUE(document.JoinProject(&view));
    document.DataChanged();
    document.LeaveProject(&view);
    ASSERT_EQ(messages.size(), 3u);
    const std::pair<unsigned, WPARAM> expected[] = {
        {KsMessage::SwitchBoard(), 25}, {KsMessage::BetweenEditors(), 522}, {KsMessage::SwitchBoard(), 24}};
    for (std::size_t i = 0; i < 3; ++i) {
        EXPECT_EQ(messages[i].message, expected[i].first);
        EXPECT_EQ(messages[i].request, expected[i].second);
        EXPECT_EQ(messages[i].text, "p");
        EXPECT_EQ(messages[i].kind, 8);
        EXPECT_EQ(messages[i].project, i == 0 ? 0 : 77);
    }
    EXPECT_EQ(messages[1].view, nullptr);
    EXPECT_EQ(messages[2].view, &view);
}

} // namespace
