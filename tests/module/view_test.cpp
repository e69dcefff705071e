// View and sheet with their pages, in a main frame as the shell has it.
#include "module_fixture.h"

#include "files/file_lock.h"
#include "files/platform_process.h"
#include "grid/gen_grid.h"
#include "grid/grid_keys.h"
#include "ks/fc/doc_template.h"
#include "ks/fc/file_bar.h"
#include "ks/fc/findings_dialog.h"
#include "ks/fc/help_window.h"
#include "module/find_field.h"
#include "module/help_chapters.h"
#include "module/kavo0_hd.h"
#include "module/sheet.h"
#include "module/view.h"
#include "pages/framework/page.h"
#include "pages/framework/page_help.h"
#include "rules/rule.h"

#include <QApplication>
#include <QCheckBox>
#include <QClipboard>
#include <QComboBox>
#include <QDialog>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QRadioButton>
#include <QStatusBar>
#include <QTableView>
#include <QTest>
#include <QTextBrowser>
#include <QTimer>
#include <QToolButton>
#include <QUndoStack>

namespace {

class OtherView : public CView
{
};

class ViewTest : public ModuleTest
{
protected:
    ViewTest()
    {
        Write(Path("river.hdkv"), SmallFile);
        frame.resize(900, 600);
        frame.show();
        frame.activateWindow();
        EXPECT_TRUE(QTest::qWaitForWindowActive(&frame));
    }

    CKavo0_hdView* Open()
    {
        documents.reset(CKavo0_hd::CreateMainDlg());
        CKsDoc* document = documents->OpenDocumentFile(&frame, Path("river.hdkv"));
        return document && !document->Views().empty() ? static_cast<CKavo0_hdView*>(document->Views()[0]) : nullptr;
    }
    std::vector<unsigned> ToolbarMessages()
    {
        std::vector<unsigned> found;
        for (const Message& message : std::exchange(messages, {})) {
            if (message.message == KsMessage::ShowToolbar() || message.message == KsMessage::HideToolbar())
                found.push_back(message.message);
        }
        return found;
    }

    CKsMDIFrameWnd frame;
    std::unique_ptr<CMultiDocTemplate> documents;
};

TEST_F(ViewTest, ShowsThePagesInOrderAndJoinsTheProject)
{
    projectHandle = 5;
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    ASSERT_GT(view->Sheet()->PageCount(), 0);
    EXPECT_EQ(view->Sheet()->tabText(0), "Initial");
    EXPECT_EQ(view->ActivePage(), view->Sheet()->PageAt(0));
    EXPECT_EQ(view->ActivePage()->GetGrid()->BranchNameColumn(), 1);
    EXPECT_EQ(view->GetDocument()->ProjectHandle(), 5);
    EXPECT_FALSE(view->GetDocument()->IsModified());
}

TEST_F(ViewTest, TheStatusBarShowsTheLineOfThePageInFront)
{
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    const auto status = [bar = frame.statusBar()] { return bar->currentMessage(); };
    view->ActivePage()->GetGrid()->SetCurrentCell(2, 1);
    const QString second = status();
    EXPECT_TRUE(second.startsWith("Line 2 of ")) << second.toStdString();
    const auto tab = [view](const char* text) {
        for (int i = 0; i < view->Sheet()->PageCount(); ++i) {
            if (view->Sheet()->tabText(i) == text)
                return i;
        }
        return -1;
    };
    ASSERT_TRUE(view->Sheet()->SetActivePage(tab("Stratification")));
    EXPECT_EQ(status(), "");
    ASSERT_TRUE(view->Sheet()->SetActivePage(0));
    EXPECT_EQ(status(), second);
}

TEST_F(ViewTest, TheStatusBarFollowsPastesUndoAndTheCurrentCell)
{
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    const auto status = [bar = frame.statusBar()] { return bar->currentMessage(); };
    CGenGrid& grid = *view->ActivePage()->GetGrid();
    grid.setFocus();
    grid.SetCurrentCell(2, 1);
    EXPECT_EQ(status(), "Line 2 of 3");
    QApplication::clipboard()->setText("A\t1.25\t1\t1\nB\t2\t1\t1\nC\t3\t1\t1");
    QTest::keyClick(&grid, Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(status(), "Line 2 of 4");
    QTest::keyClick(&grid, Qt::Key_Tab);
    EXPECT_EQ(status(), "Line 2 of 4, Chainage: 1.25 m");
    KsUnits::Instance().SetAllDigits(true);
    EXPECT_EQ(status(), "Line 2 of 4") << "the cell tells it all";
    KsUnits::Instance().SetAllDigits(false);
    QTest::keyClick(&grid, Qt::Key_Z, Qt::ControlModifier);
    EXPECT_TRUE(status().startsWith("Line 2 of 3")) << status().toStdString();
    QTest::keyClick(&grid, Qt::Key_Y, Qt::ControlModifier);
    EXPECT_TRUE(status().startsWith("Line 4 of 4")) << "where the last line came in again";
}

TEST_F(ViewTest, TheHelpCommandReachesThePage)
{
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    EXPECT_TRUE(view->IsCommandEnabled(KsCommand::Help));
    EXPECT_TRUE(frame.SendCommand(KsCommand::Help));
    auto* help = frame.findChild<CKsHelpWindow*>();
    ASSERT_TRUE(help && help->isVisible());
    const auto text = [help] { return help->findChild<QTextBrowser*>()->toPlainText(); };
    auto* chapters = help->findChild<QListWidget*>();
    EXPECT_EQ(chapters->count(), view->Sheet()->PageCount() + 2);
    EXPECT_EQ(chapters->currentItem()->text(), "Initial");
    EXPECT_TRUE(text().contains("G_waterlevel") && text().contains("InitList")) << text().toStdString();
    help->findChild<QLineEdit*>()->setText("G_wind_factor shelter");
    ASSERT_EQ(chapters->count(), 1);
    EXPECT_EQ(chapters->item(0)->text(), "Wind");
    chapters->setCurrentRow(0);
    EXPECT_TRUE(text().contains("shear stress of the wind"));
    QTest::keyClick(help, Qt::Key_Escape);
    EXPECT_FALSE(help->isVisible());
    // Every value that a page edits is in one of the chapters.
    QString all;
    for (const KsHelpChapter& chapter : HelpChapters(*view->Sheet(), *view->GetDocument()))
        all += chapter.html;
    for (const ListEntry& entry : HDLists())
        EXPECT_TRUE(all.contains(entry.section) || entry.section == std::string("WaterList")) << entry.section;
    for (const char* keyword :
         {"delta", "Latitude", "MapOutputFiles/data", "BRTools", "MarkTitles", "wind_shear_stress"})
        EXPECT_TRUE(all.contains(keyword)) << keyword;
    for (const Rule& rule : HDRules())
        EXPECT_TRUE(all.contains(rule.code)) << rule.code;
    const QString tables = PageHelpText(true);
    for (const GridKey& key : GridKeys())
        EXPECT_TRUE(tables.contains(key.Text().toHtmlEscaped()));
    EXPECT_TRUE(tables.contains("Ctrl+Ins")) << tables.toStdString();
    EXPECT_FALSE(PageHelpText(false).contains("Ctrl+Ins"));
}

TEST_F(ViewTest, APageIsNeverSmallerThanWhatItShows)
{
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    auto* window = qobject_cast<QMdiSubWindow*>(view->parentWidget());
    ASSERT_NE(window, nullptr);
    window->showNormal();
    window->resize(300, 200);
    QTest::qWait(50); // every page is made
    for (int tab = 0; tab < view->Sheet()->PageCount(); ++tab) {
        SCOPED_TRACE(view->Sheet()->tabText(tab).toStdString());
        ASSERT_TRUE(view->Sheet()->SetActivePage(tab));
        const QWidget& page = *view->ActivePage();
        EXPECT_TRUE(QTest::qWaitFor(
            [&] { // layouts answer to new texts one after the other
                return page.size() == page.size().expandedTo(page.minimumSizeHint());
            },
            1000));
    }
}

TEST_F(ViewTest, AChangeIsToldToTheProjectAndLeavingIsToo)
{
    projectHandle = 5;
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    auto* grid = view->ActivePage()->GetGrid();
    const auto changes = [&] {
        return std::count_if(messages.begin(), messages.end(),
                             [](const Message& m) { return m.request == KsRequest::DataChanged; });
    };
    const auto edit = [&](int column, const char* text) {
        grid->SetCurrentCell(1, column);
        for (const char* c = text; *c; ++c) // the first one opens the cell's editor
            QTest::keyClick(QApplication::focusWidget(), *c);
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    };
    grid->setFocus();
    edit(3, "7.5");
    QTest::qWait(1);
    EXPECT_EQ(changes(), 1);
    EXPECT_EQ(view->GetDocument()->Parameters().InitList.GetAt(0).InitialH, 7.5);
    edit(2, "150");
    QTest::qWait(1);
    EXPECT_EQ(changes(), 2);
    EXPECT_EQ(view->GetDocument()->Parameters().InitList.GetAt(0).Chainage, 150);

    view->GetDocument()->SetModifiedFlag(false);
    QTest::qWait(1); // news of the current line
    messages.clear();
    CKsMDIChildWnd::Of(view)->close();
    QTest::qWait(50);
    ASSERT_EQ(messages.size(), 2u);
    EXPECT_EQ(messages[0].request, KsRequest::LeaveProject);
    EXPECT_EQ(messages[1].request, KsRequest::DataChanged);
    EXPECT_TRUE(documents->findChildren<CKsDoc*>().empty());
}

TEST_F(ViewTest, ToolBarFollowsActivation)
{
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    OtherView other;
    CKavo0_hdView sibling;
    messages.clear();
    view->OnActivateView(true, view, nullptr);
    EXPECT_EQ(ToolbarMessages(), std::vector{KsMessage::ShowToolbar()});
    view->OnActivateView(false, &sibling, view);
    EXPECT_TRUE(ToolbarMessages().empty());
    view->OnActivateView(false, nullptr, view);
    EXPECT_TRUE(ToolbarMessages().empty());
    view->OnActivateView(false, &other, view);
    EXPECT_EQ(ToolbarMessages(), std::vector{KsMessage::HideToolbar()});
}

TEST_F(ViewTest, SearchGoesOnFromTheLastFindAndSaysWhenThereIsNoMore)
{
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    auto* grid = view->ActivePage()->GetGrid();
    EXPECT_FALSE(view->IsCommandEnabled(Command::SearchAgain));
    const auto search = [&](const QString& name) {
        QTimer::singleShot(20, view, [name] {
            auto* dialog = QApplication::activeModalWidget();
            ASSERT_NE(dialog, nullptr);
            for (auto* edit : dialog->findChildren<QLineEdit*>()) {
                if (edit->objectName().endsWith("_1058"))
                    edit->setText(name);
            }
            QTest::keyClick(dialog, Qt::Key_Return);
        });
        view->Execute(Command::Search);
    };
    search("NOWHERE");
    EXPECT_EQ(boxes, QStringList("Searched item not found"));
    boxes.clear();
    search("MA");
    EXPECT_EQ(grid->CurrentRow(), 1);
    view->Execute(Command::SearchAgain);
    EXPECT_EQ(grid->CurrentRow(), 3);
    EXPECT_TRUE(boxes.isEmpty());
    view->Execute(Command::SearchAgain);
    EXPECT_EQ(boxes, QStringList("The last occurence of searched item already found"));
}

TEST_F(ViewTest, AnswersNothingToMessagesItDoesNotKnow)
{
    CKavo0_hdView view;
    for (const WPARAM request : {WPARAM(0), WPARAM(2), WPARAM(41), WPARAM(522)}) {
        EXPECT_EQ(view.WindowProc(KsMessage::BetweenEditors(), request, 0), 0);
        EXPECT_EQ(view.WindowProc(KsMessage::ProjectManagement(), request, 0), 0);
    }
}

TEST_F(ViewTest, AnUnreadableFileNeverLooksLikeAnEmptyModel)
{
    Write(Path("river.hdkv"), "[KAVO0_HD]\n[InitList]\n[/WindList]\n");
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    auto* text = view->findChild<QLabel*>("fileBarText");
    ASSERT_TRUE(text && text->isVisible());
    EXPECT_TRUE(text->text().contains("river.hdkv, line 3, column 1")) << qPrintable(text->text());
    EXPECT_FALSE(view->Sheet()->isEnabled());
    view->GetDocument()->EditUnreadable();
    EXPECT_TRUE(view->Sheet()->isEnabled());
    EXPECT_TRUE(text->isVisible()) << "as long as the file is not replaced";
    answer = QMessageBox::Yes;
    EXPECT_TRUE(view->GetDocument()->DoSave(view->GetDocument()->GetPathName()));
    EXPECT_TRUE(text->text().contains("river.hdkv.unreadable-1")) << qPrintable(text->text());
}

TEST_F(ViewTest, WhatWasNotTakenIsListedOnceTheWindowIsThere)
{
    Write(Path("river.hdkv"), "[KAVO0_HD]\n[WaveList]\nDATA = \"R\", 1, 2, 2.0\nDATA = \"R\", 1, 2, \"x\"\n"
                              "[/WaveList]\n[/KAVO0_HD]\n");
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    EXPECT_EQ(view->findChild<CKsFindingsDialog*>(), nullptr) << "not before the first paint";
    ASSERT_TRUE(QTest::qWaitFor([&] { return view->findChild<CKsFindingsDialog*>() != nullptr; }));
    auto* dialog = view->findChild<CKsFindingsDialog*>();
    EXPECT_FALSE(dialog->isModal());
    auto* table = dialog->findChild<QTableView*>();
    ASSERT_EQ(table->model()->rowCount(), 2);
    QTest::keyClick(table, Qt::Key_A, Qt::ControlModifier);
    QTest::keyClick(dialog, Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(QGuiApplication::clipboard()->text(),
              "Line\tColumn\tSection\tKeyword\tParameter\tIn the file\tExpected\tUsed instead\n"
              "3\t19\tWaveList\tDATA\t4 WaveApproximation\t2.0\tan integer\t2\n"
              "4\t19\tWaveList\tDATA\t4 WaveApproximation\t\"x\"\tan integer\t0\n");
    auto* bar = view->findChild<CKsFileBar*>();
    EXPECT_TRUE(bar->isVisible());
    dialog->close();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    bar->findChild<QPushButton*>()->click();
    EXPECT_NE(view->findChild<CKsFindingsDialog*>(), nullptr) << "reachable again";
    EXPECT_TRUE(boxes.isEmpty());
    // Somebody else's notice stands above it; closing one leaves the other.
    bool isTold = true;
    view->GetDocument()->AddNoticeSource([&](std::vector<KsFileNotice>& notices) {
        if (isTold)
            notices.push_back({"<b>told</b>", {{"Do", [&](CKsFileBar&) { isTold = false; }}}});
    });
    EXPECT_EQ(bar->findChild<QLabel*>()->text(), "<b>told</b>");
    const auto closing = bar->findChildren<QToolButton*>();
    ASSERT_EQ(closing.size(), 2);
    EXPECT_FALSE(closing[0]->isVisible());
    closing[1]->click();
    EXPECT_TRUE(bar->isVisible());
    bar->findChild<QPushButton*>()->click();
    emit view->GetDocument()->FileStateChanged();
    EXPECT_FALSE(bar->isVisible());
}

/// What a user tries on a page, and finds the value as it was.
static void TryEverythingOn(CGenPropertyPage& page)
{
    QApplication::clipboard()->setText("7");
    for (auto* button : page.findChildren<QAbstractButton*>())
        if (qobject_cast<QCheckBox*>(button) || qobject_cast<QRadioButton*>(button))
            button->click();
    for (auto* list : page.findChildren<QComboBox*>())
        QTest::keyClick(list, Qt::Key_Down);
    for (auto* field : page.findChildren<QLineEdit*>()) {
        QTest::keyClicks(field, "7");
        QTest::keyClick(field, Qt::Key_V, Qt::ControlModifier);
        QTest::keyClick(field, Qt::Key_Return);
    }
    for (auto* grid : page.findChildren<CGenGrid*>()) {
        grid->SetCurrentCell(1, 1);
        QTest::keyClicks(grid, "7");
        EXPECT_FALSE(grid->IsEditing());
        QTest::keyClick(grid, Qt::Key_V, Qt::ControlModifier);
        QTest::keyClick(grid, Qt::Key_F2);
        QTest::keyClick(grid, Qt::Key_Space);
        grid->SelectLines(1, 1);
        for (const GridKey& key : GridKeys())
            if (key.action == GridAction::AppendLine || key.action == GridAction::DeleteLine)
                QTest::keyClick(grid, key.key, key.held);
        grid->InsertLine(); // however somebody comes to it
        grid->DeleteSelectedLines();
    }
    page.AppendLine();
    page.InsertLocation("R", "7");
}

TEST_F(ViewTest, AFileThatSomebodyElseHasIsLookedAtUntilHeLetsGo)
{
    FileLock other = FileLock::Try(Path("river.hdkv").toStdString(), "kvrshell");
    ASSERT_TRUE(other.IsHeld());
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    auto* bar = view->findChild<CKsFileBar*>();
    const auto* text = bar->findChild<QLabel*>();
    const auto buttons = [bar] {
        QStringList names;
        for (const auto* button : bar->findChildren<QPushButton*>())
            if (button->isVisible())
                names << button->text();
        return names;
    };
    EXPECT_TRUE(text->text().contains(QString("kvrshell, process %1").arg(ThisProcess().number)));
    EXPECT_EQ(buttons(), QStringList("Edit a Copy..."));

    CKavo0_hdDoc& document = *view->GetDocument();
    const std::string before = document.ContentText().value();
    for (int tab = 0; tab < view->Sheet()->PageCount(); ++tab) {
        ASSERT_TRUE(view->Sheet()->SetActivePage(tab)) << tab;
        TryEverythingOn(*view->ActivePage());
        QCoreApplication::processEvents();
        EXPECT_EQ(document.UndoStack().count(), 0) << view->Sheet()->tabText(tab).toStdString();
        EXPECT_EQ(document.ContentText().value(), before) << view->Sheet()->tabText(tab).toStdString();
    }
    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(boxes, QStringList()) << "the status bar says why";
    EXPECT_TRUE(frame.statusBar()->currentMessage().contains("is not changed here"));
    EXPECT_FALSE(document.DoSave(Path("river.hdkv")));
    EXPECT_EQ(boxes, QStringList()) << "there is nothing to lose";
    EXPECT_EQ(Read(Path("river.hdkv")), SmallFile);

    other.Release();
    Write(Path("river.hdkv"), QByteArray(SmallFile).replace("MAIN", "OTHER"));
    ASSERT_TRUE(QTest::qWaitFor([&] { return buttons().contains("Edit"); }));
    bar->findChild<QPushButton*>()->click();
    EXPECT_TRUE(FileLock::Try(Path("river.hdkv").toStdString(), "second").HeldBy());
    EXPECT_FALSE(document.IsReadOnly() || document.IsModified() || !document.UndoStack().isClean());
    EXPECT_EQ(document.Parameters().InitList.GetAt(0).RiverName, "OTHER");
    EXPECT_FALSE(bar->isVisible());
    ASSERT_TRUE(view->Sheet()->SetActivePage(0));
    view->ActivePage()->AppendLine();
    EXPECT_TRUE(document.IsModified());
}

TEST_F(ViewTest, ACleanFileHasNoBar)
{
    auto* view = Open();
    ASSERT_NE(view, nullptr);
    EXPECT_FALSE(view->findChild<CKsFileBar*>()->isVisible());
    QTest::qWait(50);
    EXPECT_EQ(view->findChild<CKsFindingsDialog*>(), nullptr);
}

} // namespace

TEST_F(ViewTest, FieldsAreFoundByAnyOfTheirNames)
{
    CKavo0_hdView* view = Open();
    ASSERT_TRUE(view);
    const std::vector<FoundField> fields = FieldsOf(*view->Sheet(), *view->GetDocument());
    for (const FoundField& field : fields) {
        EXPECT_FALSE(field.title.isEmpty() || field.page.isEmpty()) << field.keyword.toStdString();
        EXPECT_TRUE(!field.place.data || view->Sheet()->PageAt(field.tab)->Shows(field.place))
            << field.title.toStdString();
    }
    EXPECT_GT(fields.size(), 150u);
    const auto first = [&](const QString& text) {
        const auto found = Matching(fields, text);
        return found.empty() ? QString() : found.front()->title + u'|' + found.front()->keyword;
    };
    EXPECT_EQ(first("theta"), "Theta|theta");
    EXPECT_EQ(first("g_WATERlevel"), first("water level"));
    EXPECT_TRUE(first("manning").endsWith("|resist_num")) << first("manning").toStdString();
    EXPECT_EQ(first("初期条件"), first("initial")) << "in a program in English";
    EXPECT_EQ(first("WindList"), "Wind|WindList");
    EXPECT_EQ(first("no such thing"), "");
    EXPECT_EQ(first("流量"), "Discharge|G_discharge") << "its whole name, in another language";
    EXPECT_EQ(first("water depth"), "Water Level / Water Depth|iLevelDepth");
    // Dates, files, and columns of tables that are no lists of locations, or that no line has yet.
    for (const char* text :
         {"X Orig.", "Storing frequency", "Target level", "Width/depth", "Interpolate", "Default name", "End"})
        EXPECT_EQ(first(text).section(u'|', 0, 0), text);
    EXPECT_EQ(first("help grid"), "Help grid|GeoDb");

    // Ctrl+K as the menu has it: what is chosen is in front and has the focus.
    QTimer::singleShot(0, view, [] {
        auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
        ASSERT_TRUE(dialog);
        QTest::keyClicks(dialog->focusWidget(), "zeta_min");
        QTest::keyClick(dialog->focusWidget(), Qt::Key_Return);
        dialog->close();
    });
    EXPECT_TRUE(view->OnCommand(KsCommand::FindField));
    auto* field = qobject_cast<QLineEdit*>(view->window()->focusWidget());
    ASSERT_TRUE(field);
    EXPECT_TRUE(view->ActivePage()->isAncestorOf(field));
    EXPECT_EQ(field->selectedText(), "0.1") << "to be typed over";
}
