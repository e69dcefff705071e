// What is left of unsaved changes when the program ends without a save, with the three editors.
#include "shell/recovery_dialog.h"
#include "shell_fixture.h"

#include <QDirIterator>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QLabel>
#include <QPushButton>
#include <QRegularExpression>
#include <QTableView>
#include <QTableWidget>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

using namespace std::chrono_literals;

// With its dates: one that a file lacks is the time at which it is read.
constexpr const char* HDText =
    "[KAVO0_HD]\n[Global_Variables]\n[Global_Values]\nG_waterlevel = 1.5\n[/Global_Values]\n"
    "[TextOutput]\nLimitedPeriodStart = 2024, 1, 1, 0, 0, 0\nLimitedPeriodEnd = 2024, 2, 1, 0, 0, 0\n[/TextOutput]\n"
    "[/Global_Variables]\n[InitList]\nDATA = \"MAIN\", 100, 2.5, 30\nDATA = \"\", 1e10, 1, 1\n[/InitList]\n"
    "[NextVersionList]\nDATA = \"kept\"\n[/NextVersionList]\n[/KAVO0_HD]\n";

QByteArray Content(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("(no file)");
}

QString Folder()
{
    return qEnvironmentVariable("XDG_STATE_HOME") + "/KVR-test/kvr-tests/recovery";
}

/// Everything in the recovery folder but locks.
QStringList Kept()
{
    QStringList files;
    for (QDirIterator each(Folder(), QDir::Files | QDir::Hidden | QDir::System, QDirIterator::Subdirectories);
         each.hasNext();)
        files << each.next();
    files.removeIf([](const QString& file) { return file.endsWith(".lock"); });
    return files;
}

class RecoveryTest : public ShellTest
{
protected:
    RecoveryTest()
    {
        QDir(Folder()).removeRecursively();
        Restart();
        frame->Snapshots().SetDelay(10ms);
    }
    ~RecoveryTest() override { frame.reset(); }

    /// A file in the place of the folder: as long as it stands there nothing can be kept.
    static std::unique_ptr<QFile> Obstacle()
    {
        QDir().mkpath(QFileInfo(Folder()).path());
        auto file = std::make_unique<QFile>(Folder());
        EXPECT_TRUE(file->open(QIODevice::WriteOnly));
        return file;
    }
    void Restart()
    {
        frame.reset();
        frame = std::make_unique<CMainFrame>();
        frame->LoadPlugins(QStringLiteral(KVR_BUILD_DIR "/bin/plugins"));
        frame->show();
    }
    CKsDoc* Open(const QString& path)
    {
        EXPECT_TRUE(frame->OpenFile(path));
        return frame->ActiveDocument();
    }
    static std::string TextOf(const CKsDoc* document) { return document->ContentText().value(); }
    /// A step of the user's: in the text of the document one piece becomes another.
    static void Change(CKsDoc* document, const std::string& piece, const std::string& by)
    {
        std::string text = TextOf(document);
        ASSERT_NE(text.find(piece), std::string::npos) << text;
        text.replace(text.find(piece), piece.size(), by);
        ASSERT_TRUE(document->TakeContent(text, "A change"));
    }
    bool IsKept(CKsDoc* document)
    {
        const CSnapshot* snapshot = frame->Snapshots().Of(document);
        return QTest::qWaitFor([&] { return !snapshot->IsWriting() && QFile::exists(snapshot->File()); });
    }
    /// The program ends as in a crash, and starts anew: what was kept stands in a folder that nobody holds.
    std::vector<CRecoverable> Crash()
    {
        CrashUnseen();
        return Find();
    }
    void CrashUnseen()
    {
        const QString left = Folder() + "/" + QString::number(++m_crashes);
        QDir().mkpath(left);
        for (const QString& file : Kept())
            EXPECT_TRUE(QFile::copy(file, left + "/" + QFileInfo(file).fileName()));
        for (const auto* documents : CMultiDocTemplate::All())
            for (CKsDoc* document : documents->findChildren<CKsDoc*>(Qt::FindDirectChildrenOnly))
                document->SetModifiedFlag(false);
        Restart();
        frame->Snapshots().SetDelay(10ms);
    }
    /// What can be recovered, looked at.
    std::vector<CRecoverable> Find()
    {
        auto found = frame->Recovery().Find();
        for (CRecoverable& item : found)
            frame->Recovery().Examine(item);
        return found;
    }

private:
    int m_crashes = 0;
};

} // namespace

TEST_F(RecoveryTest, ChangesAreKeptAfterATimeOrManySteps)
{
    CKsDoc* document = Open(Write("a.HDKV", HDText));
    QTest::qWait(50);
    EXPECT_TRUE(Kept().isEmpty()) << "nothing was changed";
    Change(document, "1.5", "2.5");
    EXPECT_TRUE(IsKept(document));
    const QString file = frame->Snapshots().Of(document)->File();
    EXPECT_TRUE(Content(file).contains("2.5"));
    EXPECT_EQ(Kept(), QStringList(file));
    const auto rights = [](const QString& path) {
        struct stat status
        {
        };
        EXPECT_EQ(::stat(path.toUtf8(), &status), 0);
        return status.st_mode & 0777;
    };
    EXPECT_EQ(rights(file), 0600u);
    EXPECT_EQ(rights(QFileInfo(file).path()), 0700u);
    EXPECT_EQ(rights(Folder()), 0700u);
    Change(document, "2.5", "3.5");
    EXPECT_TRUE(QTest::qWaitFor([&] { return Content(file).contains("3.5"); })) << "the same file follows";

    frame->Snapshots().SetDelay(1h);
    document = Open(Write("b.HDKV", HDText));
    for (int step = 1; step < CSnapshot::Steps; ++step)
        Change(document, "100", "100");
    QTest::qWait(50);
    EXPECT_FALSE(frame->Snapshots().Of(document)->IsWriting());
    Change(document, "100", "150");
    EXPECT_TRUE(IsKept(document));
    EXPECT_TRUE(Content(frame->Snapshots().Of(document)->File()).contains("150"));
}

TEST_F(RecoveryTest, WhatIsKeptGoesWithASaveAnUndoAndAClose)
{
    const QString path = Write("a.HDKV", HDText);
    for (const bool waits : {true, false}) { // for the writer, or not
        for (const char* way : {"save", "undo", "close"}) {
            CKsDoc* document = Open(path);
            for (int step = 0; step < CSnapshot::Steps; ++step)
                Change(document, "1.5", "1.5");
            ASSERT_TRUE(waits ? IsKept(document) : frame->Snapshots().Of(document)->IsWriting());
            if (way == std::string("save")) {
                ASSERT_TRUE(document->DoSave(path));
            } else if (way == std::string("undo")) {
                document->UndoStack().setIndex(0);
            }
            answers << QMessageBox::Discard;
            if (way != std::string("close")) {
                EXPECT_TRUE(QTest::qWaitFor([] { return Kept().isEmpty(); })) << way; // a writer takes its time to end
            }
            Action("actionClose")->trigger();
            Settle();
            QTest::qWait(100);
            EXPECT_TRUE(Kept().isEmpty()) << way << waits;
            answers.clear();
        }
    }
    frame.reset();
    EXPECT_TRUE(QDir(Folder()).isEmpty());
}

TEST_F(RecoveryTest, WhatIsShownOfAFileThatIsGoneIsKeptAndAskedFor)
{
    const QString river = QStringLiteral(KVR_SOURCE_DIR "/examples/river/river.");
    const auto comes = [](const auto& what) { return QTest::qWaitFor(what); };
    for (const QString& path : {Write("a.HDKV", HDText), Write("a.kvnw", Content(river + "kvnw")),
                                Write("a.kvxs", Content(river + "kvxs"))}) {
        SCOPED_TRACE(path.toStdString());
        CKsDoc* document = Open(path);
        const std::string shown = TextOf(document);
        const QByteArray content = Content(path);
        const auto lose = [&] {
            QFile::remove(path);
            EXPECT_TRUE(comes([&] { return document->IsFileGone(); })) << "the watch sees it";
            EXPECT_TRUE(IsKept(document)) << "nobody has changed it, and it is nowhere else";
            EXPECT_FALSE(document->IsModified());
        };
        lose();
        EXPECT_TRUE(Content(frame->Snapshots().Of(document)->File()).endsWith(QByteArray::fromStdString(shown)));
        EXPECT_EQ(Write(QFileInfo(path).fileName(), content), path);
        EXPECT_TRUE(comes([&] { return !document->IsFileGone() && Kept().isEmpty(); })) << "it is there again";
        lose();
        answers = {QMessageBox::Cancel};
        EXPECT_EQ(document->AskToClose(), KsClosing::Keep);
        EXPECT_TRUE(asked.takeFirst().contains("was removed or renamed"));
        // A step, and back to what the file held: that is what has to be kept.
        if (path.endsWith(".HDKV")) {
            const auto isKept = [&](const char* level) {
                return comes([&] { return Content(frame->Snapshots().Of(document)->File()).contains(level); });
            };
            Change(document, "G_waterlevel = 1.5", "G_waterlevel = 2.5");
            EXPECT_TRUE(isKept("G_waterlevel = 2.5"));
            document->UndoStack().undo();
            EXPECT_TRUE(isKept("G_waterlevel = 1.5"));
        }
        answers = {QMessageBox::Save};
        EXPECT_TRUE(document->SaveModified());
        EXPECT_NE(Content(path), "(no file)");
        EXPECT_TRUE(comes([] { return Kept().isEmpty(); }));
        lose();
        answers = {QMessageBox::Discard};
        asked.clear();
        Action("actionClose")->trigger();
        Settle();
        EXPECT_EQ(asked.size(), 1);
        EXPECT_TRUE(comes([] { return Kept().isEmpty(); })) << "discarded";
    }
}

TEST_F(RecoveryTest, WhatStandsInAnOpenCellOrFieldIsKept)
{
    CKsDoc* document = Open(Write("a.HDKV", HDText));
    QTest::qWait(50);
    QLineEdit* field = nullptr;
    for (auto* each : frame->findChildren<QLineEdit*>())
        if (each->isVisible() && each->text() == "1.5")
            field = each;
    ASSERT_TRUE(field);
    field->setFocus();
    const auto isKept = [](const char* text) {
        return QTest::qWaitFor([&] {
            const QStringList kept = Kept();
            return kept.size() == 1 && Content(kept.front()).contains(text);
        });
    };
    const auto type = [](const char* text) {
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_A, Qt::ControlModifier);
        QTest::keyClicks(QApplication::focusWidget(), text);
    };
    type("7.25");
    EXPECT_TRUE(isKept("G_waterlevel = 7.25"));
    EXPECT_TRUE(field->hasFocus() && field->text() == "7.25" && !document->IsModified()) << "and nobody is disturbed";
    EXPECT_EQ(document->UndoStack().count(), 0);
    type("7.25.1");
    EXPECT_TRUE(isKept(": 7.25.1\"]"));
    EXPECT_TRUE(isKept("G_waterlevel = 1.5")) << "what is no value is kept as a text";
    QTest::keyClick(field, Qt::Key_Escape);
    EXPECT_TRUE(QTest::qWaitFor([] { return Kept().isEmpty(); })) << "it was taken back";

    QTableView* table = nullptr;
    for (auto* each : frame->findChildren<QTableView*>())
        if (each->isVisible())
            table = each;
    ASSERT_TRUE(table);
    table->setCurrentIndex(table->model()->index(0, 2));
    table->setFocus();
    QTest::keyClick(table, Qt::Key_F2);
    ASSERT_NE(QApplication::focusWidget(), table);
    type("8.75");
    EXPECT_TRUE(isKept("\"MAIN\", 100, 8.75, 30"));
    EXPECT_NE(QApplication::focusWidget(), table) << "the cell is open";
    const auto found = Crash();
    ASSERT_EQ(found.size(), 1u);
    EXPECT_TRUE(frame->Recovery().Open(found.front()));
    document = frame->ActiveDocument();
    EXPECT_NE(TextOf(document).find("\"MAIN\", 100, 8.75, 30"), std::string::npos);
    document->UndoStack().undo();
    EXPECT_NE(TextOf(document).find("\"MAIN\", 100, 2.5, 30"), std::string::npos);
}

TEST_F(RecoveryTest, EveryKindOfDocumentComesBackModifiedAndUndoable)
{
    const QString river = QStringLiteral(KVR_SOURCE_DIR "/examples/river/river.");
    const struct
    {
        QString path;
        const char *piece, *by;
    } cases[] = {{Write("a.HDKV", HDText), "\"MAIN\", 100", "\"MAIN\", 125.5"},
                 {Write("a.kvnw", Content(river + "kvnw")), "FlowsDownstream = true", "FlowsDownstream = false"},
                 {Write("a.kvxs", Content(river + "kvxs")), "Radius = ", "Radius = 1"}};
    std::vector<std::pair<std::string, std::string>> texts; // as in the file, and changed
    for (const auto& [path, piece, by] : cases) {
        CKsDoc* document = Open(path);
        texts.emplace_back(TextOf(document), "");
        Change(document, piece, by);
        texts.back().second = TextOf(document);
        ASSERT_NE(texts.back().first, texts.back().second);
        ASSERT_TRUE(IsKept(document));
    }
    const auto found = Crash();
    ASSERT_EQ(found.size(), std::size(cases));
    for (const CRecoverable& item : found) {
        EXPECT_EQ(item.state, CRecoverable::Same);
        EXPECT_LT(item.header.time.secsTo(QDateTime::currentDateTime()), 60);
        const auto differences = frame->Recovery().Compare(item);
        ASSERT_TRUE(differences);
        EXPECT_EQ(differences->changed, 1u) << item.Name().toStdString();
        EXPECT_EQ(differences->added + differences->removed, 0u);
        const auto which =
            std::size_t(std::ranges::find(cases, item.header.path, [](auto& c) { return c.path; }) - cases);
        const QByteArray before = Content(item.header.path);
        ASSERT_TRUE(frame->Recovery().Open(item));
        CKsDoc* document = frame->ActiveDocument();
        EXPECT_EQ(document->GetPathName(), item.header.path);
        EXPECT_EQ(TextOf(document), texts[which].second);
        EXPECT_TRUE(document->IsModified());
        EXPECT_EQ(document->UndoStack().undoText(), "Recovered changes");
        EXPECT_EQ(Content(item.header.path), before);
        EXPECT_TRUE(QFile::exists(item.file)) << "until it is saved, or kept anew";
        document->UndoStack().undo();
        EXPECT_EQ(TextOf(document), texts[which].first);
        EXPECT_FALSE(document->IsModified());
        EXPECT_FALSE(QFile::exists(item.file));
        document->UndoStack().redo();
        EXPECT_EQ(TextOf(document), texts[which].second);
    }
    EXPECT_TRUE(asked.isEmpty());
}

TEST_F(RecoveryTest, ListsOfWhatWasNotTakenWaitUntilTheDialogIsDone)
{
    const QString path = Write("a.HDKV", QByteArray(HDText).replace("100, 2.5, 30", "100, \"high\", 30"));
    Change(Open(path), "1.5", "2.5");
    ASSERT_TRUE(IsKept(frame->ActiveDocument()));
    for (const bool isListFirst : {true, false}) {
        CrashUnseen();
        ASSERT_TRUE(frame->OpenFile(path));
        const auto dialogs = [&] {
            QStringList shown;
            for (const auto* each : frame->findChildren<QDialog*>())
                if (each->isVisible())
                    shown << each->metaObject()->className();
            return shown;
        };
        const QStringList list("CKsFindingsDialog"), recovery("CRecoveryDialog");
        const auto isShown = [&](const QStringList& what) {
            return QTest::qWaitFor([&] {
                const auto* active = QApplication::activeWindow();
                return dialogs() == what && active && what.front() == active->metaObject()->className();
            });
        };
        if (isListFirst) {
            EXPECT_TRUE(isShown(list));
        }
        frame->OfferRecovery();
        EXPECT_TRUE(isShown(recovery));
        QTest::qWait(600); // the list would have come by now
        EXPECT_TRUE(isShown(recovery));
        QTest::keyClick(QApplication::activeWindow(), Qt::Key_Escape);
        EXPECT_TRUE(isShown(list));
        QTest::keyClick(QApplication::activeWindow(), Qt::Key_Escape);
        EXPECT_TRUE(QTest::qWaitFor([&] { return dialogs().isEmpty(); }));
    }
}

TEST_F(RecoveryTest, ChangesOfAFileThatIsAnotherNowOpenBesideIt)
{
    const QString changed = Write("changed.HDKV", HDText), missing = Write("missing.HDKV", HDText),
                  edited = Write("edited.HDKV", HDText), early = Write("early.HDKV", HDText),
                  twin = Write("other/changed.HDKV", HDText), used = Write("used.HDKV", HDText);
    for (const QString& path : {changed, missing, edited, early, twin, used}) {
        CKsDoc* document = Open(path);
        if (path == early)
            Write("early.HDKV", QByteArray(HDText).replace("30", "31")); // before anything is kept
        Change(document, "1.5", "2.5");
        ASSERT_TRUE(IsKept(document));
    }
    for (CMultiDocTemplate* documents : CMultiDocTemplate::All())
        if (documents->MatchesExtension("x.HDKV")) {
            CKsDoc* document = documents->OpenDocumentFile(frame.get(), {});
            Change(document, "[/KAVO0_HD]", "[Mine]\nK = 1\n[/Mine]\n[/KAVO0_HD]");
            ASSERT_TRUE(IsKept(document));
        }
    const QByteArray others = QByteArray(HDText).replace("1.5", "1.7"); // of the same length
    Write("changed.HDKV", others);
    Write("other/changed.HDKV", others);
    QFile::remove(missing);

    const auto found = Crash();
    ASSERT_EQ(found.size(), 7u);
    const FileLock lock = FileLock::Try(used.toStdString(), "kvrshell"); // another program has it now
    ASSERT_TRUE(lock.IsHeld());
    QStringList titles;
    Change(Open(edited), "1.5", "7.5");
    for (const CRecoverable& item : found) {
        const QString name = item.header.path.isEmpty() ? "new" : QFileInfo(item.header.path).completeBaseName();
        const std::map<QString, CRecoverable::State> states{
            {"changed", CRecoverable::Changed}, {"early", CRecoverable::Changed}, {"missing", CRecoverable::Missing},
            {"edited", CRecoverable::Same},     {"used", CRecoverable::Same},     {"new", CRecoverable::New}};
        EXPECT_EQ(item.state, states.at(name)) << name.toStdString();
        ASSERT_TRUE(frame->Recovery().Open(item));
        const CKsDoc* document = frame->ActiveDocument();
        EXPECT_EQ(document->GetPathName(), QString()) << name.toStdString();
        EXPECT_TRUE(document->IsModified());
        if (name != "new") {
            titles << document->GetTitle();
            EXPECT_NE(TextOf(document).find("G_waterlevel = 2.5"), std::string::npos);
        } else {
            EXPECT_NE(TextOf(document).find("[Mine]"), std::string::npos);
        }
    }
    titles.sort();
    EXPECT_EQ(titles.join(", "), "changed (recovered 2), changed (recovered), early (recovered), edited (recovered), "
                                 "missing (recovered), used (recovered)");
    EXPECT_EQ(Content(changed), others);
    // Each is saved beside the file whose changes it has, under a name that is free; of one that is gone it is its own.
    QStringList proposed;
    KsSetFileDialogHandler([&proposed](const KsFileQuestion& question) {
        proposed << question.proposal;
        return QString();
    });
    for (const CMultiDocTemplate* documents : CMultiDocTemplate::All())
        for (CKsDoc* document : documents->findChildren<CKsDoc*>(Qt::FindDirectChildrenOnly)) {
            if (document->GetTitle().contains("recovered")) {
                EXPECT_FALSE(document->DoSave({}));
            }
        }
    proposed.sort();
    EXPECT_EQ(proposed, (QStringList{Path("changed-2.HDKV"), Path("early-2.HDKV"), Path("edited-2.HDKV"),
                                     Path("missing.HDKV"), Path("other/changed-2.HDKV"), Path("used-2.HDKV")}));
}

TEST_F(RecoveryTest, ADamagedFileDoesNoHarm)
{
    CKsDoc* document = Open(Write("a.HDKV", HDText));
    Change(document, "1.5", "2.5");
    ASSERT_TRUE(IsKept(document));
    const QByteArray good = Content(frame->Snapshots().Of(document)->File());
    const qsizetype line = good.indexOf('\n');
    const auto header = [&](const char* key, const QJsonValue& by) {
        QJsonObject json = QJsonDocument::fromJson(good.left(line)).object();
        json[QLatin1String(key)] = by;
        return QJsonDocument(json).toJson(QJsonDocument::Compact) + good.mid(line);
    };
    const QByteArray cases[] = {"",
                                "\n",
                                "{}\n",
                                "[1]\n",
                                "x",
                                good.left(line),
                                good.chopped(1),
                                good + "x",
                                QByteArray(good).replace("2.5", "2.6"),
                                QByteArray(1 << 20, '{'),
                                header("format", 2),
                                header("file", 7),
                                header("file", "/etc/passwd"),
                                header("file", "a.HDKV"),
                                header("file", "/tmp/../etc/a.HDKV"),
                                header("file", Path("a.HDKV") + QChar::Null + ".HDKV"),
                                header("fileSize", "many"),
                                header("fileHash", "00"),
                                header("extension", ""),
                                header("extension", QJsonObject{{"a", QJsonArray{1}}}),
                                header("time", "yesterday"),
                                header("size", -1),
                                header("size", 9e300),
                                header("size", 1e15),
                                header("hash", QJsonValue())};
    const QString left = Folder() + "/left";
    QDir().mkpath(left);
    const auto write = [&](const QString& name, const QByteArray& text) {
        QFile file(left + "/" + name);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(text);
    };
    int number = 0;
    for (const QByteArray& text : cases)
        write(QString::number(++number) + ".recovery", text);
    const QString outside = Write("outside.recovery", good);
    ASSERT_TRUE(QFile::link(outside, left + "/link.recovery"));
    ASSERT_EQ(::mkfifo((left + "/pipe.recovery").toUtf8(), 0600), 0);
    write("unknown.recovery", header("extension", ".abc").replace("a.HDKV", "a.abc"));
    write("good.recovery", good);
    EXPECT_FALSE(WriteRecoveryFile(left + "/other.recovery",
                                   {.extension = ".HDKV", .title = "x", .time = QDateTime::currentDateTime()},
                                   "[KAVO0_HD]"));

    const auto found = Find();
    const auto windows = frame->MdiArea().subWindowList();
    EXPECT_EQ(found.size(), std::size(cases) + 5);
    for (const CRecoverable& item : found) {
        const QString name = QFileInfo(item.file).completeBaseName();
        EXPECT_EQ(item.state, name == "good"      ? CRecoverable::Same
                              : name == "unknown" ? CRecoverable::NoEditor
                              : name == "other"   ? CRecoverable::New
                                                  : CRecoverable::Damaged)
            << name.toStdString();
        if (name == "good")
            continue;
        asked.clear();
        EXPECT_FALSE(frame->Recovery().Open(item)) << name.toStdString();
        EXPECT_EQ(asked.size(), 1);
        Settle();
        EXPECT_EQ(frame->MdiArea().subWindowList(), windows) << "none is opened for nothing";
        frame->Recovery().Discard(item);
        EXPECT_FALSE(QFileInfo(item.file).isSymLink() || QFileInfo::exists(item.file)) << name.toStdString();
    }
    EXPECT_EQ(Content(outside), good);
}

TEST_F(ShellTest, ADocumentOfAnEditorWithoutRecoveryIsLeftAlone)
{
    QDir(Folder()).removeRecursively();
    frame->OpenFile(Write("a.tst"));
    CKsDoc* document = frame->ActiveDocument();
    const auto change = [&] {
        for (int step = 0; step < CSnapshot::Steps; ++step)
            document->UndoStack().push(new QUndoCommand("step"));
    };
    change();
    const CSnapshot* snapshot = frame->Snapshots().Of(document);
    EXPECT_TRUE(QTest::qWaitFor([&] { return !snapshot->IsWriting(); }));
    change();
    EXPECT_FALSE(snapshot->IsWriting());
    EXPECT_TRUE(Kept().isEmpty());
    EXPECT_TRUE(frame->Snapshots().Failures().empty());
}

TEST_F(RecoveryTest, WhatCannotBeKeptIsToldUntilItCanBe)
{
    CKsDoc* document = Open(Write("a.HDKV", HDText));
    const auto obstacle = Obstacle();
    const auto* notice = frame->findChild<QLabel*>("recoveryLabel");
    EXPECT_FALSE(notice->isVisible());
    Change(document, "1.5", "2.5");
    EXPECT_TRUE(QTest::qWaitFor([&] { return notice->isVisible(); }));
    QTest::qWait(60);
    EXPECT_TRUE(notice->isVisible());
    EXPECT_TRUE(notice->toolTip().contains("The changes to a.HDKV cannot be kept")) << notice->toolTip().toStdString();
    EXPECT_TRUE(notice->toolTip().contains("a part of the path is no folder"));
    EXPECT_EQ(notice->accessibleDescription(), notice->toolTip());
    obstacle->remove();
    EXPECT_TRUE(IsKept(document));
    EXPECT_TRUE(QTest::qWaitFor([&] { return !notice->isVisible(); }));
    // Somebody clears the folder meanwhile: it is made again, and is still this session's.
    QDir(Folder()).removeRecursively();
    Change(document, "2.5", "3.5");
    EXPECT_TRUE(IsKept(document));
    EXPECT_TRUE(CRecoveryFolder().TakeOver().isEmpty());
    EXPECT_FALSE(notice->isVisible());
}

TEST_F(RecoveryTest, WhatWasTakenBackWhileNothingCouldBeKeptIsForgotten)
{
    CKsDoc* document = Open(Write("a.HDKV", HDText));
    const auto obstacle = Obstacle();
    const auto* notice = frame->findChild<QLabel*>("recoveryLabel");
    QTest::qWait(50);
    QLineEdit* field = nullptr;
    for (auto* each : frame->findChildren<QLineEdit*>())
        if (each->isVisible() && each->text() == "1.5")
            field = each;
    ASSERT_TRUE(field);
    field->setFocus();
    QTest::keyClicks(field, "7");
    EXPECT_TRUE(QTest::qWaitFor([&] { return notice->isVisible(); }));
    QTest::keyClick(field, Qt::Key_Escape);
    EXPECT_FALSE(document->IsModified());
    EXPECT_TRUE(QTest::qWaitFor([&] { return !notice->isVisible(); })) << "there is nothing to keep any more";
    obstacle->remove();
    QTest::qWait(200);
    EXPECT_TRUE(Kept().isEmpty());
}

TEST_F(RecoveryTest, SessionsThatLiveKeepTheirOwn)
{
    auto first = std::make_unique<CRecoveryFolder>();
    CRecoveryFolder second;
    const QString file = first->NewFile().value();
    QFile kept(file);
    ASSERT_TRUE(kept.open(QIODevice::WriteOnly));
    kept.close();
    EXPECT_TRUE(second.TakeOver().isEmpty());
    first.reset(); // without removing it, as if it had crashed
    EXPECT_EQ(second.TakeOver(), QStringList(file));
    {
        CRecoveryFolder third;
        EXPECT_TRUE(third.TakeOver().isEmpty()) << "the second one has it now";
    }
    EXPECT_TRUE(QFile::exists(file));
    QDir().mkpath(Folder() + "/empty");
    {
        CRecoveryFolder third;
        EXPECT_TRUE(third.TakeOver().isEmpty());
    }
    EXPECT_FALSE(QFile::exists(Folder() + "/empty"));
    for (const char* damage : {"text", "folder", "link"}) { // what is kept beside a lock that is none is found
        const QString damaged = Folder() + "/damaged-" + damage, lock = damaged + "/.session.lock";
        QDir().mkpath(damage == std::string("folder") ? lock + "/a" : damaged);
        for (const QString& name : {damaged + "/a.recovery", damage == std::string("text") ? lock : damaged + "/b"}) {
            QFile made(name);
            ASSERT_TRUE(made.open(QIODevice::WriteOnly));
            made.write("garbage");
        }
        if (damage == std::string("link")) {
            ASSERT_TRUE(QFile::link(file, lock));
        }
        CRecoveryFolder third;
        EXPECT_EQ(third.TakeOver(), QStringList(damaged + "/a.recovery")) << damage;
        EXPECT_EQ(CRecoveryFolder().TakeOver().isEmpty(), damage != std::string("folder")) << "and held now";
        EXPECT_TRUE(QFile::exists(file));
        QDir(damaged).removeRecursively();
    }
    {
        CRecoveryFolder third; // that cannot make files
        rlimit files{}, none{};
        ASSERT_EQ(::getrlimit(RLIMIT_NOFILE, &files), 0);
        none.rlim_max = files.rlim_max;
        ::setrlimit(RLIMIT_NOFILE, &none);
        EXPECT_FALSE(third.NewFile());
        ::setrlimit(RLIMIT_NOFILE, &files);
        EXPECT_EQ(QDir(Folder()).entryList(QDir::Dirs | QDir::NoDotAndDotDot).size(), 1) << "nothing is left of it";
    }
    ASSERT_TRUE(QDir().rename(Folder(), Folder() + "-aside"));
    ASSERT_TRUE(QFile::link(folder.path(), Folder()));
    EXPECT_FALSE(CRecoveryFolder().NewFile()) << "a link is no folder of ours";
    EXPECT_TRUE(QDir(folder.path()).isEmpty());
    QFile::remove(Folder());
    QDir().rename(Folder() + "-aside", Folder());
}

TEST_F(RecoveryTest, ASaveThatWasDoneLeavesNothingToRecover)
{
    CKsDoc* document = Open(Write("a.HDKV", QByteArray(HDText).replace("DATA = \"\", 1e10, 1, 1\n", "")));
    Change(document, "1.5", "2.5");
    ASSERT_TRUE(IsKept(document));
    const QByteArray kept = Content(Kept().front());
    ASSERT_TRUE(document->DoSave(document->GetPathName()));
    EXPECT_TRUE(Kept().isEmpty());
    // Killed behind the swap, before what was kept could go.
    QDir().mkpath(Folder() + "/left");
    QFile left(Folder() + "/left/a.recovery");
    ASSERT_TRUE(left.open(QIODevice::WriteOnly));
    left.write(kept);
    left.close();
    EXPECT_TRUE(Crash().empty());
    document = Open(Path("a.HDKV"));
    Change(document, "2.5", "3.5");
    ASSERT_TRUE(IsKept(document));
    Write("a.HDKV", QByteArray::fromStdString(TextOf(document)).replace("3.5", "4.5"));
    EXPECT_EQ(Crash().size(), 1u) << "as long, and another";
}

TEST_F(RecoveryTest, DatesThatAFileLacksAreNoChangeHoweverOftenItIsRecovered)
{
    const QString path = Write("a.HDKV", QByteArray(HDText).replace("LimitedPeriod", "OtherPeriod"));
    Change(Open(path), "1.5", "2.5");
    for (int crash = 0; crash < 2; ++crash) {
        ASSERT_TRUE(IsKept(frame->ActiveDocument()));
        QTest::qSleep(1000); // dates count seconds
        CrashUnseen();
        Open(path); // which the start was asked for, and takes the time of now
        const auto found = Find();
        ASSERT_EQ(found.size(), 1u);
        const auto differences = frame->Recovery().Compare(found.front());
        ASSERT_TRUE(differences && !differences->list.empty());
        EXPECT_EQ(differences->list.size(), 1u) << differences->list.back().keyword;
        EXPECT_TRUE(frame->Recovery().Open(found.front()));
        if (crash == 0) // a change of what undo leads to has no other dates either
            frame->ActiveDocument()->UndoStack().undo();
        Change(frame->ActiveDocument(), crash == 0 ? "G_waterlevel = 1.5" : "G_waterlevel = 9.5", "G_waterlevel = 9.5");
        QTest::qWait(50);
    }
}

TEST_F(RecoveryTest, FilesOfOneNameAreToldWithTheirFolders)
{
    for (const char* name : {"a/river.HDKV", "b/river.HDKV", "b/other.HDKV"}) {
        CKsDoc* document = Open(Write(name, HDText));
        Change(document, "1.5", "2.5");
        ASSERT_TRUE(IsKept(document));
    }
    CrashUnseen();
    frame->OfferRecovery();
    auto* dialog = frame->findChild<CRecoveryDialog*>();
    ASSERT_TRUE(dialog);
    auto* table = dialog->findChild<QTableWidget*>();
    ASSERT_EQ(table->rowCount(), 3);
    const auto name = [&](int row) { return table->item(row, 0)->text(); };
    EXPECT_EQ(name(0), "other.HDKV");
    EXPECT_EQ(name(1), "river.HDKV in " + Path("b"));
    EXPECT_EQ(name(2), "river.HDKV in " + Path("a"));
    table->setCurrentCell(2, 0);
    answers = {QMessageBox::Cancel};
    for (auto* button : dialog->findChildren<QPushButton*>())
        if (button->text() == "&Discard")
            button->click();
    EXPECT_THAT(asked, testing::ElementsAre("Discard the changes to river.HDKV in " + Path("a") +
                                            "? They cannot be brought back."));
}

TEST_F(RecoveryTest, TheDialogSaysWhatDiffersAndDoesWhatIsChosen)
{
    frame->OfferRecovery();
    EXPECT_EQ(frame->findChild<CRecoveryDialog*>(), nullptr) << "nothing to offer";
    // Dates that a file lacks stand in the document as the time when it was opened, which is no change; another is one.
    const QByteArray dated = HDText, undated = QByteArray(HDText).replace("LimitedPeriod", "OtherPeriod");
    for (const auto& [name, text] : {std::pair("a.HDKV", undated), {"b.HDKV", undated}, {"c.HDKV", dated}}) {
        CKsDoc* document = Open(Write(name, text));
        Change(document, "1.5", "2.5");
        if (name == QString("b.HDKV"))
            Change(document, "LimitedPeriodEnd = 20", "LimitedPeriodEnd = 19");
        ASSERT_TRUE(IsKept(document));
    }
    QTest::qSleep(1000); // dates count seconds
    Crash();             // finds them; another session asks again
    Restart();
    frame->OfferRecovery();
    auto* dialog = frame->findChild<CRecoveryDialog*>();
    ASSERT_TRUE(dialog);
    auto* table = dialog->findChild<QTableWidget*>();
    ASSERT_EQ(table->rowCount(), 3);
    EXPECT_TRUE(QTest::qWaitFor([&] { return table->item(2, 2) && table->item(2, 2)->text() != "Comparing..."; }));
    EXPECT_EQ(table->item(0, 0)->text(), "c.HDKV") << "the latest first";
    EXPECT_TRUE(QRegularExpression("^\\d+/\\d+/\\d{4} \\d+:\\d\\d:\\d\\d").match(table->item(0, 1)->text()).hasMatch())
        << table->item(0, 1)->text().toStdString();
    EXPECT_EQ(table->item(0, 2)->text(), "Sections: 1; values changed: 1.");
    EXPECT_EQ(table->item(1, 2)->text(), "Sections: 2; values changed: 2.");
    EXPECT_EQ(table->item(2, 2)->text(), "Sections: 1; values changed: 1.");
    const auto press = [&](const char* text) {
        for (auto* button : dialog->findChildren<QPushButton*>())
            if (button->text() == text)
                button->click();
    };
    press("&Compare");
    auto* differences = dialog->findChild<QDialog*>("differences");
    ASSERT_TRUE(differences);
    const auto* values = differences->findChild<QTableWidget*>();
    QStringList cells;
    for (int column = 0; column < values->columnCount(); ++column)
        cells << values->item(0, column)->text();
    EXPECT_EQ(cells.join("|"), "Global_Variables / Global_Values|G_waterlevel|1|1|1.5|2.5");
    differences->close();
    press("&Open");
    EXPECT_EQ(frame->ActiveDocument()->GetPathName(), Path("c.HDKV"));
    EXPECT_TRUE(frame->isWindowModified());
    ASSERT_EQ(table->rowCount(), 2);
    answers << QMessageBox::Cancel << QMessageBox::Discard;
    press("&Discard");
    EXPECT_EQ(table->rowCount(), 2);
    press("&Discard");
    ASSERT_EQ(table->rowCount(), 1);
    EXPECT_EQ(table->item(0, 0)->text(), "a.HDKV");
    press("&Later");
    answers << QMessageBox::Discard;
    frame->close();
    Restart();
    EXPECT_EQ(frame->Recovery().Find().size(), 1u);
}
