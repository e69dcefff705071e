// Texts, numbers and ranges of numbers are found, and replaced by texts, values and formulas.
#include "page_fixture.h"
#include "pages/page_table.h"

#include "grid/cell_commands.h"
#include "grid/find_replace.h"

#include <QCheckBox>
#include <QDialog>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTableWidget>
#include <QTimer>

class FindReplaceTest : public PageTest
{
protected:
    FindReplaceTest()
    {
        Add("MAIN", 0, 10, 1);
        Add("MAIN", 100, 2.5, 2);
        Add("SIDE", 50, 7, 3);
        Add("MAIN NORTH", 400, 20, 4);
        Open(MakeInitPage);
    }
    CReplaced Replaced(const ReplaceQuery& query)
    {
        return ReplaceCells(*grid->Model(), {0, Name, 99, Discharge}, query);
    }
    /// What stands there once everything found has been replaced; then that is undone.
    QString After(const ReplaceQuery& query)
    {
        CReplaced replaced = Replaced(query);
        grid->Model()->ChangeCells("step", replaced.results.FirstRow(), replaced.results.TakeChanges());
        QString after = Stored();
        if (document.UndoStack().count() > 0)
            document.UndoStack().undo();
        return after;
    }
    void InDialog(const std::function<void(QDialog&)>& act)
    {
        QTimer::singleShot(0, grid, [act] {
            auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            ASSERT_TRUE(dialog);
            act(*dialog);
            dialog->reject();
        });
        RunOnCells(*grid, GridAction::Replace);
    }
    static void Fill(QDialog& dialog, const QString& find, const QString& with, const char* where)
    {
        dialog.findChild<QLineEdit*>("find")->setText(find);
        dialog.findChild<QLineEdit*>("with")->setText(with);
        dialog.findChild<QRadioButton*>(where)->setChecked(true);
        QTest::qWait(100);
    }
    static void Press(QDialog& dialog, const char* button) { dialog.findChild<QPushButton*>(button)->click(); }

    static constexpr int Name = 0, Discharge = 3; // columns
};

TEST_F(FindReplaceTest, TextsNumbersAndRanges)
{
    EXPECT_EQ(After({"main", "trunk"}), "TRUNK 0 10 1, TRUNK 100 2.5 2, SIDE 50 7 3, TRUNK NORTH 400 20 4");
    EXPECT_EQ(After({"main", "trunk", true}), "TRUNK 0 10 1, TRUNK 100 2.5 2, SIDE 50 7 3, MAIN NORTH 400 20 4");
    EXPECT_EQ(Replaced({"main", "trunk", false, true}).found, 0u) << "in capitals";
    EXPECT_EQ(After({"2..7", "=value*2 + 0.5"}),
              "MAIN 0 10 1, MAIN 100 5.5 4.5, SIDE 50 14.5 6.5, MAIN NORTH 400 20 8.5");
    EXPECT_EQ(After({">50", "5"}), "MAIN 0 10 1, MAIN 5 2.5 2, SIDE 50 7 3, MAIN NORTH 5 20 4");
    for (const char* incomplete : {"", ">", "-"})
        EXPECT_EQ(Replaced({incomplete, "5"}).found, 0u) << incomplete;
}

TEST_F(FindReplaceTest, WhatCannotBecomeThatStaysWithTheReason)
{
    CReplaced replaced = Replaced({"7", "many"});
    EXPECT_EQ(replaced.found, 1u);
    EXPECT_EQ(replaced.results.ChangedCount(), 0u);
    ASSERT_EQ(replaced.results.KeptCount(), 1u);
    EXPECT_EQ(replaced.results.Kept()[0].row, 2);
    EXPECT_FALSE(replaced.results.Kept()[0].after.isEmpty());
    EXPECT_EQ(Replaced({"7", "=nothing*2"}).results.KeptCount(), 1u);
    EXPECT_EQ(Replaced({"SIDE", "=value*2"}).found, 0u) << "a formula is for numbers";
    EXPECT_EQ(Replaced({"7", "7"}).results.ChangedCount(), 0u);
}

TEST_F(FindReplaceTest, ReplacesAllAsOneStepAndLeavesHiddenLinesAlone)
{
    grid->ChangeView([](CGridModel& model) { model.Filter({"=MAIN"}); });
    grid->SetCurrentCell(1, 3);
    InDialog([](QDialog& dialog) {
        Fill(dialog, "1..20", "0", "inColumn");
        EXPECT_EQ(dialog.findChild<QLabel*>("summary")->text(),
                  "2 cells found; 2 would change. Lines that a filter hides are left alone.");
        EXPECT_EQ(dialog.findChild<QTableWidget*>()->item(1, 3)->text(), "2.5");
        Press(dialog, "replaceAll");
        EXPECT_FALSE(dialog.findChild<QPushButton*>("replaceAll")->isEnabled());
    });
    EXPECT_EQ(Stored(), "MAIN 0 0 1, MAIN 100 0 2, SIDE 50 7 3, MAIN NORTH 400 20 4");
    EXPECT_EQ(document.UndoStack().count(), 1);
}

TEST_F(FindReplaceTest, OneAtATimeGoesFromCellToCellAndRoundAgain)
{
    grid->SetCurrentCell(2, 1);
    InDialog([this](QDialog& dialog) {
        Fill(dialog, "2..7", "9", "inPage");
        Press(dialog, "findNext");
        EXPECT_EQ(std::pair(grid->CurrentRow(), grid->CurrentColumn()), std::pair(2, 3));
        Press(dialog, "findNext");
        Press(dialog, "replace"); // the discharge beside it
        EXPECT_EQ(std::pair(grid->CurrentRow(), grid->CurrentColumn()), std::pair(3, 3));
        for (int cell = 0; cell < 3; ++cell)
            Press(dialog, "findNext");
        EXPECT_EQ(std::pair(grid->CurrentRow(), grid->CurrentColumn()), std::pair(2, 3)) << "round again";
    });
    EXPECT_EQ(Stored(), "MAIN 0 10 1, MAIN 100 2.5 9, SIDE 50 7 3, MAIN NORTH 400 20 4");
}
