#include "page_fixture.h"
#include "pages/page_table.h"

#include "grid/branch_lines_dlg.h"
#include "grid/grid_commands.h"
#include "grid/grid_input.h"
#include "grid/lines_view.h"

#include <QClipboard>
#include <QDialogButtonBox>
#include <QLabel>
#include <QPushButton>
#include <QTimer>

/// Lines A to D of the page of initial conditions.
class LineCommandTest : public PageTest
{
protected:
    LineCommandTest()
    {
        for (const char* name : {"A", "B", "C", "D"})
            Add(name, 1, 10);
        Open(MakeInitPage);
        grid->setFocus();
    }
    /// The branches of the file.
    QString File() const
    {
        QStringList names;
        for (std::size_t i = 0; i < init.GetCount(); ++i)
            names << (init.GetAt(i).RiverName.empty() ? QString("-") : QString::fromStdString(init.GetAt(i).RiverName));
        return names.join(' ');
    }
    /// The branches that are shown, those selected in brackets.
    QString Shown() const
    {
        QStringList names;
        for (int row = 1; row <= grid->RowCount(); ++row) {
            const QString name = grid->TextAt(row, 1).isEmpty() ? QString("-") : grid->TextAt(row, 1);
            const bool isSelected =
                grid->selectionModel()->isSelected(grid->model()->index(row - 1, grid->CurrentColumn() - 1));
            names << (isSelected ? '(' + name + ')' : name);
        }
        return names.join(' ');
    }
    void Press(Qt::Key key, Qt::KeyboardModifiers held) { QTest::keyClick(grid, key, held); }
    void Undo() { document.UndoStack().undo(); }
    void HideB()
    {
        grid->ChangeView([](CGridModel& model) { model.Filter({"!=B"}); });
    }
    static constexpr auto Ctrl = Qt::ControlModifier;
    static constexpr auto CtrlShift = Qt::ControlModifier | Qt::ShiftModifier;
};

TEST_F(LineCommandTest, ALineComesAboveOrBelow)
{
    globals.G_waterlevel = 7;
    grid->SetCurrentCell(2, 3);
    Press(Qt::Key_Return, CtrlShift);
    EXPECT_EQ(File(), "A - B C D");
    EXPECT_EQ(Current(), std::pair(2, 1));
    EXPECT_EQ(Texts(2), "||7.000|0.000");
    grid->SetCurrentCell(5, 3);
    Press(Qt::Key_Enter, CtrlShift);
    Press(Qt::Key_Return, Ctrl);
    EXPECT_EQ(File(), "A - B C - - D");
    EXPECT_EQ(Current(), std::pair(6, 1));
    SelectRows(1, 4);
    Press(Qt::Key_Return, Ctrl);
    EXPECT_EQ(File(), "A - B C - - - D") << "below all that is selected";
    EXPECT_EQ(document.UndoStack().count(), 4);
    for (int i = 0; i < 4; ++i)
        Undo();
    EXPECT_EQ(File(), "A B C D");
    SelectRows(1, 4);
    Press(Qt::Key_Delete, {});
    grid->SetCurrentCell(1, 1);
    Press(Qt::Key_Return, Ctrl);
    EXPECT_EQ(File(), "- -") << "the line that is offered becomes one";
}

TEST_F(LineCommandTest, LinesAreDuplicatedWithAllThatTheyHold)
{
    init.GetAt(1).Extra = {};
    init.GetAt(1).InitialH = 1.23456789;
    SelectRows(2, 3);
    Press(Qt::Key_U, Ctrl);
    EXPECT_EQ(File(), "A B C B C D");
    EXPECT_EQ(Shown(), "A B C (B) (C) D");
    EXPECT_TRUE(grid->HasLinesToDelete()) << "as whole lines again";
    EXPECT_EQ(init.GetAt(3).InitialH, 1.23456789);
    init.GetAt(3).InitialH = 2;
    EXPECT_EQ(init.GetAt(1).InitialH, 1.23456789) << "a line of its own";
    Undo();
    EXPECT_EQ(File(), "A B C D");
    document.UndoStack().redo();
    EXPECT_EQ(File(), "A B C B C D");
    grid->SetCurrentCell(6, 2);
    Press(Qt::Key_U, Ctrl);
    EXPECT_EQ(File(), "A B C B C D D");
    EXPECT_EQ(Current(), std::pair(7, 2));
}

TEST_F(LineCommandTest, LinesMoveAndStaySelected)
{
    SelectRows(2, 3);
    Press(Qt::Key_Up, CtrlShift);
    EXPECT_EQ(File(), "B C A D");
    EXPECT_EQ(Shown(), "(B) (C) A D");
    Press(Qt::Key_Up, CtrlShift);
    EXPECT_EQ(document.UndoStack().count(), 1) << "at the top";
    Press(Qt::Key_Down, CtrlShift);
    Press(Qt::Key_Down, CtrlShift);
    EXPECT_EQ(Shown(), "A D (B) (C)");
    EXPECT_EQ(File(), "A D B C");
    view->revealed.clear();
    Undo();
    EXPECT_EQ(File(), "A B C D");
    EXPECT_EQ(view->revealed, QList<int>{2});
    document.UndoStack().redo();
    EXPECT_EQ(view->revealed, (QList<int>{2, 3}));
    // What is being typed is stored first and goes along.
    Enter(3, 3, "5");
    grid->SetCurrentCell(3, 3);
    Press(Qt::Key_Up, CtrlShift);
    EXPECT_EQ(Shown(), "A (B) D C");
    EXPECT_EQ(Current(), std::pair(2, 3));
    EXPECT_EQ(init.GetAt(1).InitialH, 5);
}

TEST_F(LineCommandTest, InAFilteredTableTheLinesInSightAreTheNeighbours)
{
    HideB();
    grid->SetCurrentCell(2, 1);
    Press(Qt::Key_Up, CtrlShift);
    EXPECT_EQ(Shown(), "(C) A D");
    EXPECT_EQ(File(), "B C A D");
    Undo();
    grid->SetCurrentCell(1, 1);
    Press(Qt::Key_Down, CtrlShift);
    EXPECT_EQ(Shown(), "C (A) D");
    Undo();
    EXPECT_EQ(File(), "A B C D");
    grid->SetCurrentCell(1, 1);
    Press(Qt::Key_Return, Ctrl);
    EXPECT_EQ(File(), "A - B C D") << "directly below";
    EXPECT_EQ(Shown(), "A (-) C D") << "and in sight";
    Undo();
    SelectRows(1, 2);
    Press(Qt::Key_U, Ctrl);
    EXPECT_EQ(File(), "A B C A C D") << "not what is hidden between them";
}

TEST_F(LineCommandTest, SortedLinesAreNotMovedAndTheUserIsToldWhy)
{
    grid->SetCurrentCell(2, 1);
    LinesView::Run(Command::SortDescending, *grid);
    grid->SetCurrentCell(2, 1);
    QString said;
    QObject::connect(&document, &CKsDoc::Said, [&said](const QString& text) { said = text; });
    Press(Qt::Key_Up, CtrlShift);
    EXPECT_EQ(File(), "A B C D");
    EXPECT_TRUE(said.contains("Order of the File")) << said.toStdString();
    Press(Qt::Key_U, Ctrl);
    EXPECT_EQ(File(), "A B C C D");
    EXPECT_EQ(Shown(), "D C (C) B A") << "where it is looked for";
    Press(Qt::Key_Return, Ctrl);
    EXPECT_EQ(Shown(), "D C C (-) B A");
    EXPECT_EQ(File(), "A B C C - D");
}

TEST_F(LineCommandTest, CutAndClearEmptyCellsAndDeleteOnlyTakesLines)
{
    globals.G_waterlevel = 7;
    QString said;
    QObject::connect(&document, &CKsDoc::Said, [&said](const QString& text) { said = text; });
    grid->SetCurrentCell(1, 3);
    Press(Qt::Key_Down, Qt::ShiftModifier);
    EXPECT_EQ(CGridCommands::TextFor(GridAction::Clear, grid), "Clear 2 Cells");
    Press(Qt::Key_Delete, {});
    EXPECT_EQ(init.GetAt(0).InitialH, 10) << "cells are no lines";
    EXPECT_TRUE(said.contains("Ctrl+Backspace")) << said.toStdString();
    Press(Qt::Key_Backspace, Ctrl);
    EXPECT_EQ(said, "2 cells cleared");
    EXPECT_EQ(init.GetAt(1).InitialH, 7) << "as a blank cell of the page";
    Undo();
    grid->SetCurrentCell(1, 1);
    Press(Qt::Key_X, Ctrl);
    EXPECT_EQ(QGuiApplication::clipboard()->text(), "A");
    EXPECT_EQ(File(), "- B C D");
    SelectRows(2, 3);
    EXPECT_EQ(CGridCommands::DeleteText(grid, "x"), "&Delete 2 Lines");
    Press(Qt::Key_X, Ctrl);
    EXPECT_EQ(File(), "- D");
    EXPECT_TRUE(QGuiApplication::clipboard()->text().startsWith("B\t1\t10")) << "whole lines, which can be pasted";
    Undo();
    Undo();
    EXPECT_EQ(File(), "A B C D");
}

TEST_F(LineCommandTest, PlacesAlongABranch)
{
    const ColumnSpec& chainage = grid->Model()->Column(1);
    EXPECT_EQ(*ChainagesEvery(chainage, 0.1, 0.5, 0.1), (std::vector{0.1, 0.2, 0.3, 0.4, 0.5})) << "with the last one";
    EXPECT_EQ(*ChainagesEvery(chainage, 0, 250, 100), (std::vector<double>{0, 100, 200}));
    EXPECT_FALSE(ChainagesEvery(chainage, 0, 2e6, 1)) << "more than anybody means";
    EXPECT_FALSE(ChainagesEvery(chainage, 0, 1, 1e-300));
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    const auto feet = *ChainagesEvery(chainage, 0, 200 * 0.3048, 100 * 0.3048);
    EXPECT_EQ(feet, (std::vector<double>{0, 30.48, 60.96})) << "even in the unit shown";
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    HideB();
    const BranchInTable known = FindBranch(*grid->Model(), "b ");
    EXPECT_EQ(known.behind, 2u) << "hidden lines count";
    EXPECT_EQ(WithoutKnown({3, 1, 2, 1 + 1e-9, 3}, known), (std::vector<double>{2, 3})) << "and none comes twice";
    EXPECT_EQ(BranchesIn(*grid->Model()), (QStringList{"A", "B", "C", "D"}));
}

TEST_F(LineCommandTest, LinesAreInsertedAlongABranchAndNoneIsDoubled)
{
    globals.G_waterlevel = 7;
    grid->SetCurrentCell(2, 1);
    QString summary, said;
    QTimer::singleShot(0, [&] {
        auto* dialog = qobject_cast<CBranchLinesDlg*>(QApplication::activeModalWidget());
        ASSERT_TRUE(dialog);
        const auto type = [dialog](const QString& name, const char* text) {
            for (auto* field : dialog->findChildren<QLineEdit*>())
                if (field->accessibleName() == name)
                    field->setText(text);
        };
        EXPECT_EQ(dialog->findChild<QComboBox*>()->currentText(), "B") << "that of the current line";
        auto* ok = dialog->findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok);
        type("From chainage", "0");
        type("To chainage", "-3");
        EXPECT_FALSE(ok->isEnabled());
        type("To chainage", "3");
        type("Distance", "0");
        EXPECT_FALSE(ok->isEnabled());
        type("Distance", "1");
        for (const auto* label : dialog->findChildren<QLabel*>())
            summary += label->text();
        ok->click();
    });
    Press(Qt::Key_L, CtrlShift);
    EXPECT_TRUE(summary.contains("3 lines: 0, 2, 3\n1 is there already")) << summary.toStdString();
    EXPECT_TRUE(summary.contains("No cross sections are known"));
    EXPECT_EQ(Stored(), "A 1 10 0, B 1 10 0, B 0 7 0, B 2 7 0, B 3 7 0, C 1 10 0, D 1 10 0");
    EXPECT_EQ(Shown(), "A B (B) (B) (B) C D");
    EXPECT_EQ(document.UndoStack().count(), 1);
    Undo();
    EXPECT_EQ(File(), "A B C D");
}

TEST_F(LineCommandTest, KeysTakeWhatIsTypedBefore)
{
    const auto press = [this](const char* typed, Qt::Key key, Qt::KeyboardModifiers held) {
        Type(2, 3, typed);
        QTest::keyClick(Editor(), key, held);
        QCoreApplication::processEvents();
    };
    const int lines = grid->RowCount();
    press("7.5", Qt::Key_Return, Ctrl | Qt::ShiftModifier);
    EXPECT_EQ(grid->RowCount(), lines + 1);
    EXPECT_EQ(init.GetAt(2).InitialH, 7.5) << "and not in the new line";
    EXPECT_FALSE(Editor());
    press("8", Qt::Key_G, Ctrl | Qt::ShiftModifier);
    EXPECT_FALSE(Editor());
    QTimer::singleShot(0, grid, [] { qobject_cast<QDialog*>(QApplication::activeModalWidget())->reject(); });
    press("9", Qt::Key_H, Ctrl);
    EXPECT_FALSE(Editor());
    press("abc", Qt::Key_Return, Ctrl | Qt::ShiftModifier);
    EXPECT_EQ(boxes.size(), 1);
    EXPECT_EQ(grid->RowCount(), lines + 1);
    EXPECT_TRUE(Editor());
}
