// Encroachment set-ups: stepping through them, making and deleting them, and what a save makes of them.
#include "flow_page_fixture.h"
#include "pages/page_table.h"

#include <QAbstractButton>

class EncroachPageTest : public FlowPagesTest
{
protected:
    /// A set-up whose lines are named.
    void AddSetup(std::initializer_list<const char*> names)
    {
        auto& setup = setups.Add();
        for (const char* name : names) {
            HDEncroach& line = setup.Add();
            line.RiverName = name;
            line.Chainage = *name ? 1 : NotGiven;
        }
    }
    /// Branch names of every set-up.
    QString Content() const
    {
        QStringList content;
        for (std::size_t i = 0; i < setups.GetCount(); ++i) {
            QString names;
            for (std::size_t line = 0; line < setups.GetAt(i).GetCount(); ++line)
                names += QString::fromStdString(setups.GetAt(i).GetAt(line).RiverName) + ',';
            content << names;
        }
        return content.join(' ');
    }
    void Click(const char* button)
    {
        auto* found = view->page->findChild<QAbstractButton*>(button);
        ASSERT_TRUE(found && found->isEnabled()) << button;
        found->click();
    }
    /// Enabled buttons, and the set-up shown.
    QString Shown() const
    {
        QString shown;
        for (const char* button : {"previous_1342", "next_1343", "add_1344", "duplicate_1345", "delete_1346"})
            shown += view->page->findChild<QAbstractButton*>(button)->isEnabled() ? button[0] : '-';
        return shown + " " + view->page->findChild<QComboBox*>("setup_1341")->currentText() + " " + grid->TextAt(1, 1);
    }
    bool Warns() const { return !view->page->findChild<QLabel*>("status_1347")->text().isEmpty(); }

    CGenMetaList<HDEncroach>& setups = document.Parameters().EncroachList;
};

TEST_F(EncroachPageTest, TheMethodLocksWhatItDoesNotUse)
{
    AddSetup({"A", "B"});
    HDEncroach& line = setups.GetAt(0).GetAt(0);
    Open(MakeEncroachPage);
    const struct
    {
        int method, reduction;
        const char* open; // of the thirteen columns after name and chainage
    } cases[] = {{1, 1, "**--**-------"}, {2, 1, "****--*------"}, {3, 1, "****---**----"}, {3, 3, "****---*-**--"},
                 {4, 1, "****---*---*-"}, {5, 3, "****---*---**"}, {9, 1, "*************"}};
    for (const auto& c : cases) {
        line.EncOption1 = c.method;
        line.EncOption3 = c.reduction;
        QString open;
        for (int column = 2; column < 15; ++column)
            open += grid->model()->index(0, column).flags() & Qt::ItemIsEditable ? '*' : '-';
        EXPECT_EQ(open, c.open) << c.method << " " << c.reduction;
    }
    const auto tip = [this](int column) {
        return grid->model()->headerData(column - 1, Qt::Horizontal, Qt::ToolTipRole).toString();
    };
    for (int column : {5, 6, 7, 8, 9, 14, 15})
        EXPECT_TRUE(tip(column).contains("Unit: m\n")) << column;
    for (int column : {11, 12, 13})
        EXPECT_FALSE(tip(column).contains("Unit")) << column;
}

TEST_F(EncroachPageTest, StepAddDuplicateDelete)
{
    Open(MakeEncroachPage);
    EXPECT_EQ(Shown(), "--a--  ");
    EXPECT_FALSE(grid->isEnabled());
    view->page->AppendLine(); // nowhere to go
    view->page->InsertLocation("A", "1");
    EXPECT_EQ(document.UndoStack().count(), 0);
    EXPECT_FALSE(document.IsModified());
    Click("add_1344");
    EXPECT_EQ(Shown(), "--add Set-up 1 ");
    Enter(1, 1, "a");
    Click("add_1344");
    EXPECT_EQ(Shown(), "p-add Set-up 2 ");
    Enter(1, 1, "b");
    Click("previous_1342");
    EXPECT_EQ(Shown(), "-nadd Set-up 1 A");
    grid->setFocus();
    Type(1, 1, "C"); // what is being typed goes with the duplicate
    Click("duplicate_1345");
    EXPECT_EQ(Content(), "C,, C,, B,,");
    EXPECT_EQ(Shown(), "pnadd Set-up 2 C");
    Enter(1, 1, "D");
    EXPECT_EQ(Content(), "C,, D,, B,,") << "a copy, not the same lines";
    Click("next_1343");
    Click("delete_1346");
    EXPECT_EQ(Content(), "C,, D,,");
    EXPECT_EQ(Shown(), "p-add Set-up 2 D");

    // Undo steps back through all of it, each time with the set-up it is about in sight.
    for (const char* expected : {"C,, D,, B,,|p-add Set-up 3 B", "C,, C,, B,,|pnadd Set-up 2 C",
                                 "C,, B,,|p-add Set-up 2 B", "A,, B,,|-nadd Set-up 1 A"}) {
        document.UndoStack().undo();
        EXPECT_EQ(Content() + "|" + Shown(), expected);
    }
    while (document.UndoStack().canUndo())
        document.UndoStack().undo();
    EXPECT_EQ(Content(), "");
    while (document.UndoStack().canRedo())
        document.UndoStack().redo();
    EXPECT_EQ(Content(), "C,, D,,");
}

TEST_F(EncroachPageTest, TellsWhatASaveWouldLeaveOut)
{
    const struct
    {
        std::initializer_list<const char*> names;
        bool saved;
    } cases[] = {{{}, false}, {{"A"}, false}, {{"A", ""}, false}, {{"", "B"}, true}, {{"", "", "C"}, true}};
    for (const auto& c : cases)
        AddSetup(c.names);
    Open(MakeEncroachPage);
    QComboBox* box = view->page->findChild<QComboBox*>("setup_1341");
    int written = 0;
    for (const auto& c : cases) {
        EXPECT_EQ(!Warns(), c.saved) << box->currentText().toStdString();
        written += c.saved;
        QTest::keyClick(box, Qt::Key_Down);
    }
    EXPECT_EQ(Lines().filter("[Encroachment_Setup]").size(), written) << "as the file has it";
    // The warning goes as soon as the line is there, and comes back with undo.
    box->setFocus();
    for (int i = 0; i < 2; ++i)
        Click("previous_1342");
    ASSERT_TRUE(Warns());
    Enter(2, 1, "b");
    EXPECT_TRUE(Warns());
    Enter(2, 2, "5");
    EXPECT_FALSE(Warns());
    document.UndoStack().undo();
    EXPECT_TRUE(Warns());
}

TEST_F(EncroachPageTest, AWrongCellKeepsTheSetup)
{
    AddSetup({"A", "B"});
    AddSetup({"C", "D"});
    Open(MakeEncroachPage);
    Type(1, 7, "1."); // a position
    Click("next_1343");
    EXPECT_EQ(boxes.value(0), "Floating point number required");
    EXPECT_EQ(Shown(), "-nadd Set-up 1 A");
    QTest::qWait(0);
    Click("delete_1346");
    EXPECT_EQ(Content(), "A,B, C,D,");
    QTest::keyClick(Editor(), Qt::Key_Escape);
    Click("next_1343");
    EXPECT_EQ(Shown(), "p-add Set-up 2 C");
}
