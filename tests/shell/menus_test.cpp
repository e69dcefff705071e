#include "ks/fc/frames.h"
#include "shell_fixture.h"

#include <QStatusBar>
#include <QStatusTipEvent>
#include <set>

TEST_F(ShellTest, ShortcutsAreUniqueInTheWindowAndTheLettersOfTheBarAreTheMenus)
{
    frame->OpenFile(Write("a.tst"));
    std::set<QString> keys;
    QList<QMenu*> menus;
    for (const QAction* action : frame->menuBar()->actions())
        menus << action->menu();
    ASSERT_EQ(menus.size(), 6);
    EXPECT_EQ(menus.at(2)->title(), "&Lines") << "the third by position";
    QString bar;
    for (const QMenu* menu : menus)
        bar += QKeySequence::mnemonic(menu->title()).toString().right(1);
    EXPECT_EQ(bar, "FELVWH") << "the letters that the editors' pages leave free";
    for (const QMenu* menu : menus)
        for (const QAction* action : menu->actions())
            for (const QKeySequence& key : action->shortcuts())
                EXPECT_TRUE(keys.insert(key.toString()).second) << key.toString().toStdString();
    for (const char* own : {"Ctrl+S", "Ctrl+O", "Ctrl+Z", "Ctrl+Y", "Ctrl+Shift+Z", "Ctrl+I"})
        EXPECT_TRUE(keys.count(own)) << own;
    EXPECT_FALSE(keys.count("Ctrl+C")) << "belongs to what has the focus";
}

TEST_F(ShellTest, TheLinesMenuBelongsToTheActiveView)
{
    QAction* lines = frame->menuBar()->actions().at(2);
    EXPECT_FALSE(lines->isEnabled());
    frame->OpenFile(Write("a.tst"));
    EXPECT_TRUE(lines->isEnabled());
    emit Menu(2)->aboutToShow();
    const auto entries = lines->menu()->actions();
    ASSERT_EQ(entries.size(), 4);
    EXPECT_TRUE(entries[1]->isSeparator());
    EXPECT_TRUE(entries[0]->isEnabled());
    EXPECT_FALSE(entries[3]->isEnabled()) << "the view cannot do it now";
    emit Menu(2)->aboutToHide();
    QTest::keyClick(frame.get(), Qt::Key_I, Qt::ControlModifier);
    EXPECT_EQ(frame->ActiveDocument()->UndoStack().count(), 1);
    answers = {QMessageBox::Discard};
    Action("actionClose")->trigger();
    EXPECT_FALSE(lines->isEnabled());
}

TEST_F(ShellTest, UndoAndRedoAreThoseOfTheActiveDocument)
{
    frame->OpenFile(Write("a.tst"));
    frame->SendCommand(1);
    EXPECT_EQ(Action("actionUndo")->text(), "&Undo insert line");
    frame->OpenFile(Write("b.tst"));
    EXPECT_FALSE(Action("actionUndo")->isEnabled());
    EXPECT_EQ(Action("actionUndo")->text(), "&Undo");
    Activate("a.tst");
    Action("actionUndo")->trigger();
    EXPECT_EQ(frame->ActiveDocument()->UndoStack().index(), 0);
    EXPECT_EQ(Action("actionRedo")->text(), "&Redo insert line");
    Action("actionRedo")->trigger();
    EXPECT_EQ(frame->ActiveDocument()->UndoStack().index(), 1);
    // By either key, whichever the desktop knows, where the view has none of its own.
    for (const auto& [key, held] : {std::pair(Qt::Key_Y, Qt::KeyboardModifiers(Qt::ControlModifier)),
                                    std::pair(Qt::Key_Z, Qt::ControlModifier | Qt::ShiftModifier)}) {
        QTest::keyClick(frame.get(), Qt::Key_Z, Qt::ControlModifier);
        EXPECT_EQ(frame->ActiveDocument()->UndoStack().index(), 0);
        QTest::keyClick(frame.get(), key, held);
        EXPECT_EQ(frame->ActiveDocument()->UndoStack().index(), 1);
    }
}

TEST_F(ShellTest, CutCopyAndPasteActOnTheFieldWithTheFocus)
{
    frame->OpenFile(Write("a.tst"));
    auto* edit = ViewOf("a.tst")->findChild<QLineEdit*>();
    edit->setFocus();
    edit->deselect();
    emit Menu(1)->aboutToShow();
    EXPECT_FALSE(Action("actionCut")->isEnabled());
    EXPECT_TRUE(Action("actionPaste")->isEnabled());
    edit->selectAll();
    emit Menu(1)->aboutToShow();
    EXPECT_TRUE(Action("actionCut")->isEnabled());
    Action("actionCut")->trigger();
    EXPECT_EQ(edit->text(), "");
    Action("actionPaste")->trigger();
    Action("actionPaste")->trigger();
    EXPECT_EQ(edit->text(), "texttext");
}

TEST_F(ShellTest, TheEditMenuHasWhatTheActiveViewAddsBelowPaste)
{
    const auto before = Menu(1)->actions();
    frame->OpenFile(Write("a.tst"));
    frame->OpenFile(Write("b.tst")); // filled again
    emit Menu(1)->aboutToShow();
    const auto entries = Menu(1)->actions();
    ASSERT_EQ(entries.size(), before.size() + 2);
    const auto paste = entries.indexOf(Action("actionPaste"));
    QAction* first = entries.value(paste + 1);
    EXPECT_EQ(first->text(), "Insert Too\tCtrl+C");
    EXPECT_TRUE(first->shortcut().isEmpty()) << "the key is that of what has the focus";
    EXPECT_TRUE(first->isEnabled());
    EXPECT_FALSE(entries.value(paste + 2)->isEnabled());
    EXPECT_TRUE(entries.value(paste + 3)->isSeparator());
    first->trigger();
    EXPECT_EQ(frame->ActiveDocument()->UndoStack().count(), 1);
    answers = {QMessageBox::Discard};
    Action("actionCloseAll")->trigger();
    Settle();
    EXPECT_EQ(Menu(1)->actions(), before);
}

TEST_F(ShellTest, TheWindowMenuListsTheWindows)
{
    frame->OpenFile(Write("a&b.tst"));
    frame->OpenFile(Write("c.tst"));
    for (int i = 0; i < 2; ++i) { // filling twice adds nothing
        emit Menu(4)->aboutToShow();
    }
    const auto entries = Menu(4)->actions();
    ASSERT_EQ(entries.last()->text(), "c.tst");
    EXPECT_TRUE(entries.last()->isChecked());
    QAction* first = entries.at(entries.size() - 2);
    EXPECT_EQ(first->text(), "a&&b.tst");
    first->trigger();
    EXPECT_EQ(frame->ActiveDocument()->GetTitle(), "a&b.tst");
    Action("actionTabs")->trigger();
    EXPECT_EQ(frame->MdiArea().viewMode(), QMdiArea::SubWindowView);
    Action("actionCloseAll")->trigger();
    Settle();
    EXPECT_TRUE(Texts().findChildren<CKsDoc*>().empty());
}

TEST_F(ShellTest, AnEditorsToolBarShowsWithItsView)
{
    EXPECT_FALSE(frame->findChild<CKsToolBarEx*>());
    frame->OpenFile(Write("a.tst"));
    auto* bar = frame->findChild<CKsToolBarEx*>();
    ASSERT_TRUE(bar);
    EXPECT_EQ(bar->windowTitle(), "Test Tools");
    EXPECT_TRUE(bar->isVisible());

    std::unique_ptr<QMenu> bars(frame->createPopupMenu());
    QAction* toggle = bars->actions().last();
    EXPECT_EQ(toggle->text(), "Test Tools");
    toggle->trigger();
    EXPECT_FALSE(bar->isVisible());
    frame->OpenFile(Write("b.tst"));
    EXPECT_FALSE(bar->isVisible()) << "the user has switched it off";
    bars.reset();
    Start();
    frame->OpenFile(Path("a.tst"));
    EXPECT_FALSE(frame->findChild<CKsToolBarEx*>()) << "for good";
}

TEST_F(ShellTest, WhatIsToldOutlastsTheTipsOfMenus)
{
    frame->OpenFile(Write("a.tst"));
    const auto look = [this](const QString& tip) { // at an entry of a menu; an empty tip is the end of it
        QStatusTipEvent event(tip);
        QApplication::sendEvent(frame.get(), &event);
        return frame->statusBar()->currentMessage();
    };
    EXPECT_EQ(look("Takes the last change back"), "Takes the last change back");
    frame->TellStatus("done");
    EXPECT_EQ(look(""), "done");
    EXPECT_EQ(look("Saves"), "Saves");
    EXPECT_EQ(look(""), "done");
    frame->OpenFile(Write("b.tst"));
    EXPECT_EQ(frame->statusBar()->currentMessage(), "") << "it was about the other window";
}
