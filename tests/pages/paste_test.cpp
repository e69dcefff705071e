// Pasting what is doubtful: how it is understood, what is shown before, and what comes of it.
#include "page_fixture.h"
#include "pages/page_table.h"

#include "files/read_number.h"
#include "grid/copied_table.h"
#include "grid/foreign_number.h"
#include "grid/grid_clipboard.h"
#include "grid/paste_plan.h"
#include "ks/language/language.h"

#include <QCheckBox>
#include <QClipboard>
#include <QDialogButtonBox>
#include <QLabel>
#include <QLocale>
#include <QMimeData>
#include <QPushButton>
#include <QTableWidget>
#include <QTimer>

TEST(ForeignNumber, AsOtherProgramsWriteIt)
{
    const auto point = [](const char* text) {
        return PlainNumber(QString::fromUtf8(text), DecimalSign::Point).toStdString();
    };
    const auto comma = [](const char* text) {
        return PlainNumber(QString::fromUtf8(text), DecimalSign::Comma).toStdString();
    };
    EXPECT_EQ(point("1,234,567.5"), "1234567.5");
    EXPECT_EQ(comma("1.234.567,5"), "1234567.5");
    EXPECT_EQ(comma("-3,5"), "-3.5");
    EXPECT_EQ(comma(",5"), ".5");
    EXPECT_EQ(comma("1,5e-3"), "1.5e-3");
    for (const char* text : {"1 234,5", "1\u00A0234,5", "1\u202F234,5", "1'234,5", "1\u2019234,5"})
        EXPECT_EQ(comma(text), "1234.5") << text;
    EXPECT_EQ(comma(" \u22121.234 "), "-1234");
    EXPECT_EQ(comma("12,5 ft"), "12.5 ft");
    EXPECT_EQ(comma("12,5m"), "12.5 m");
    EXPECT_EQ(point("1 234 ft"), "1234 ft");
    EXPECT_EQ(point("12 345"), "12345");
    // No numbers, or no thousands: whoever reads them says so.
    for (const char* text : {"12,34.5", "1.2.3", "1,23", "12 34", "abc", "", "-", "1,2345", "1234,567", "1,234 567"})
        EXPECT_FALSE(IsValidNumber(point(text))) << text;
    EXPECT_EQ(comma("1.5"), "1.5") << "is refused there";
}

class PasteTest : public PageTest
{
protected:
    PasteTest()
    {
        Add("A", 0, 10, 1);
        Add("A", 100, 20, 2);
        Add("B", 0, 30, 3);
        Open(MakeInitPage);
        grid->setFocus();
        QObject::connect(&document, &CKsDoc::Said, [this](const CString& text) { said = text; });
    }
    ~PasteTest() override { KsLanguage::Instance().SetCurrent("en_US"); }
    /// Pastes by the key; does something in the dialog that comes up, if one does, and presses a button of it.
    void Paste(int row, int column, const QString& text, const std::function<void(QDialog&)>& act = {},
               QDialogButtonBox::StandardButton button = QDialogButtonBox::Ok,
               Qt::KeyboardModifiers held = Qt::ControlModifier)
    {
        if (!text.isNull())
            QGuiApplication::clipboard()->setText(text);
        grid->SetCurrentCell(row, column);
        asked = false;
        QTimer::singleShot(0, grid, [this, act, button] {
            auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            if (!dialog)
                return;
            asked = true;
            if (act)
                act(*dialog);
            auto* pressed = dialog->findChild<QDialogButtonBox*>()->button(button);
            canPaste = pressed->isEnabled();
            pressed->click();
            if (dialog->isVisible())
                dialog->reject();
        });
        QTest::keyClick(grid, Qt::Key_V, held);
        QCoreApplication::processEvents();
    }
    static QString Summary(const QDialog& dialog) { return dialog.findChild<QLabel*>("summary")->text(); }
    static QTableView& Faults(const QDialog& dialog)
    {
        for (auto* view : dialog.findChildren<QTableView*>())
            if (view->accessibleName() == "What does not fit")
                return *view;
        throw std::logic_error("no list of faults");
    }
    static QTableView& Understood(const QDialog& dialog)
    {
        for (auto* view : dialog.findChildren<QTableView*>())
            if (view->accessibleName() == "As it is understood")
                return *view;
        throw std::logic_error("no table of what is understood");
    }
    static QStringList Listed(const QDialog& dialog)
    {
        const auto* model = Faults(dialog).model();
        QStringList lines;
        for (int row = 0; row < model->rowCount(); ++row) {
            QStringList texts;
            for (int column = 0; column < model->columnCount(); ++column)
                texts << model->index(row, column).data().toString();
            lines << texts.join('|');
        }
        return lines;
    }
    static void Mend(QDialog& dialog, int row, const char* text)
    {
        auto* model = Faults(dialog).model();
        EXPECT_TRUE(model->setData(model->index(row, 2), text));
        QCoreApplication::processEvents(); // the list is made anew when its editor has gone
    }
    static void Choose(const QDialog& dialog, const char* name, int entry)
    {
        auto* combo = dialog.findChild<QComboBox*>(name);
        combo->setCurrentIndex(entry);
        emit combo->activated(entry);
    }
    static QString ColumnsOf(const QDialog& dialog)
    {
        QStringList texts;
        const auto* table = dialog.findChild<QTableWidget*>();
        for (int row = 0; row < table->rowCount(); ++row) {
            const auto combo = [&](int column) {
                return qobject_cast<QComboBox*>(table->cellWidget(row, column))->currentText();
            };
            texts << table->item(row, 0)->text() + " > " + combo(1) + ' ' + combo(2);
        }
        return texts.join(", ");
    }
    const std::string before = "A 0 10 1, A 100 20 2, B 0 30 3";
    QString said;
    bool asked = false, canPaste = false;
};

TEST_F(PasteTest, WhatIsCleanIsOneKey)
{
    Paste(2, 3, "21\t5 l/s\n=30+1\t7");
    EXPECT_FALSE(asked);
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, A 100 21 0.005, B 0 31 7");
    Paste(3, 1, "c\t5\t1\t2\nd\t6\t3\t4");
    EXPECT_FALSE(asked);
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, A 100 21 0.005, C 5 1 2, D 6 3 4");
}

TEST_F(PasteTest, EveryBadCellIsListedAndCanBeMendedOrLeftOut)
{
    const QString text = "X\t1\t2\t1.5.2\nY\tabc\t3\t4\n\"Z\nZ\"\t3\t5\t6";
    QStringList listed;
    Paste(2, 1, text, [&](QDialog& dialog) { listed = Listed(dialog); });
    EXPECT_TRUE(asked);
    EXPECT_FALSE(canPaste) << "nobody has decided about them";
    EXPECT_EQ(listed, QStringList({"1|Initial Q|1.5.2|Floating point number required",
                                   "2|Chainage|abc|Floating point number required",
                                   "3|River Name|Z\nZ|A text takes no characters that cannot be seen. Character 2 of "
                                   "this one is a line end."}));
    EXPECT_EQ(Stored().toStdString(), before);
    EXPECT_EQ(document.UndoStack().count(), 0);

    Paste(2, 1, text, {}, QDialogButtonBox::Cancel);
    EXPECT_EQ(Stored().toStdString(), before);

    Paste(2, 1, text, [&](QDialog& dialog) { dialog.findChild<QCheckBox*>("leaveOut")->click(); });
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, X 1 2 2, B 0 30 3")
        << "a cell stays as it was; of a line that nobody knows all of them do";
    EXPECT_EQ(said.toStdString(), "3 cells pasted; left out: 2 lines, 1 cell");
    document.UndoStack().undo();
    EXPECT_EQ(Stored().toStdString(), before) << "one step";

    Paste(2, 1, text, [&](QDialog& dialog) {
        Mend(dialog, 0, "1.5");
        Mend(dialog, 0, "7");
        Mend(dialog, 0, "z");
        EXPECT_EQ(Listed(dialog).join("/").toStdString(), "");
    });
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, X 1 2 1.5, Y 7 3 4, Z 3 5 6");
    EXPECT_EQ(boxes, QStringList());
}

TEST_F(PasteTest, TheNextBadCellIsAtHandAndWhatIsStillTypedIsPasted)
{
    Paste(1, 1, "X\t1\t2\ta\nY\t2\t3\tb\nZ\t3\t5\tc", [&](QDialog& dialog) {
        QTableView& faults = Faults(dialog);
        auto* leaveOut = dialog.findChild<QCheckBox*>("leaveOut");
        leaveOut->click();
        faults.setCurrentIndex(faults.model()->index(0, 2));
        Mend(dialog, 0, "7");
        EXPECT_EQ(faults.currentIndex(), faults.model()->index(0, 2)) << "the second one, which is the first now";
        EXPECT_TRUE(leaveOut->isChecked());
        faults.edit(faults.currentIndex());
        auto* editor = faults.findChild<QLineEdit*>();
        ASSERT_TRUE(editor);
        editor->setText("42");
    });
    EXPECT_EQ(Stored().toStdString(), "X 1 2 7, Y 2 3 42, Z 3 5 3");
    EXPECT_EQ(said.toStdString(), "11 cells pasted; left out: 1 cell");
}

TEST_F(PasteTest, BlankCellsAreAsClearedOnes)
{
    document.Parameters().Global.G_waterlevel = 3.5;
    Paste(1, 3, "\t7\n2\t8");
    EXPECT_FALSE(asked);
    EXPECT_EQ(Stored().toStdString(), "A 0 3.5 7, A 100 2 8, B 0 30 3");
    Paste(1, 1, "A\t0\t5\t7\nA\t100\t6\t8");
    EXPECT_EQ(said.toStdString(), "8 cells pasted") << "what stays as it was is what was copied";
    Paste(1, 1, "A\t0\t5\t7\nA\t100");
    EXPECT_EQ(said.toStdString(), "6 cells pasted; shorter lines leave their other cells as they were");
}

TEST_F(PasteTest, LinesAreCountedAsTheyWereCopiedAndAsTheyGo)
{
    QStringList listed, goTo;
    Paste(2, 2, "Initial h\tRiver Name\nabc\tX\n5\tY\n6\tZ", [&](QDialog& dialog) {
        listed = Listed(dialog);
        for (int line = 0; line < 3; ++line)
            goTo << Understood(dialog).model()->headerData(line, Qt::Vertical).toString();
        Mend(dialog, 0, "7");
    });
    EXPECT_EQ(listed, QStringList("2|Initial h|abc|Floating point number required")) << "the headers are a line";
    EXPECT_EQ(goTo, QStringList({"2", "3", "new"}));
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, X 100 7 2, Y 0 5 3, Z 10000000000 6 0");
}

TEST_F(PasteTest, LeavingOutIsAgreedToAsItIsShown)
{
    const auto leaveOut = [](QDialog& dialog) { return dialog.findChild<QCheckBox*>("leaveOut"); };
    bool agreedBefore = false, agreedAfter = true;
    Paste(1, 2, "x\t5\n1\t6", [&](QDialog& dialog) {
        leaveOut(dialog)->click();
        agreedBefore = leaveOut(dialog)->isChecked();
        Choose(dialog, "decimal", 1);
        agreedAfter = leaveOut(dialog)->isChecked();
    });
    EXPECT_TRUE(agreedBefore);
    EXPECT_FALSE(agreedAfter) << "something else is left out now";
    EXPECT_FALSE(canPaste);
    Paste(1, 2, "x", [&](QDialog& dialog) { leaveOut(dialog)->click(); });
    EXPECT_FALSE(canPaste) << "nothing remains";
    QString summary;
    Paste(1, 1, "X\tabc", [&](QDialog& dialog) {
        dialog.findChild<QCheckBox*>("headers")->click();
        summary = Summary(dialog);
    });
    EXPECT_EQ(summary.toStdString(), "1 line was copied. 0 lines are new.") << "a single line names nothing";
    Paste(1, 3, "5\t6\t7"); // more than the table has
    EXPECT_TRUE(asked);
    EXPECT_EQ(Stored().toStdString(), "A 0 5 6, A 100 20 2, B 0 30 3");
    EXPECT_EQ(said.toStdString(), "2 cells pasted");
}

TEST_F(PasteTest, ColumnsGoWhereTheirHeadersSay)
{
    for (const char* text : {"initial q [l/s]\tNote\tRIVER NAME\tInitial h [m]\n500\tx\tM\t7\n250\ty\tN\t8",
                             "InitialQ (l/s)\t\tRiverName\tInitialH\n500\tx\tM\t7\n250\ty\tN\t8"}) {
        QString columns;
        Paste(2, 2, text, [&](QDialog& dialog) { columns = ColumnsOf(dialog); });
        EXPECT_TRUE(asked) << text;
        EXPECT_TRUE(columns.startsWith("initial", Qt::CaseInsensitive) && columns.contains("> Initial Q l/s"))
            << columns.toStdString();
        EXPECT_EQ(Stored().toStdString(), "A 0 10 1, M 100 7 0.5, N 0 8 0.25") << text;
        document.UndoStack().undo();
    }
    KsLanguage::Instance().SetCurrent("ja"); // headers of another language of the program
    Paste(2, 2, "Initial h\tRiver Name\n7\tM");
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, M 100 7 2, B 0 30 3");
    document.UndoStack().undo();
    KsLanguage::Instance().SetCurrent("en_US");
    Paste(1, 2, "depth\tflow\n1\t2"); // nobody knows them, but numbers stand below
    EXPECT_TRUE(asked && canPaste);
    EXPECT_EQ(Stored().toStdString(), "A 1 2 1, A 100 20 2, B 0 30 3");
    document.UndoStack().undo();
    // In their order, without another unit: nothing to ask about. Names only, they are no names.
    for (const char* text : {"Initial h\tInitial Q\n5\t6", "Initial h [-]\tInitialQ ()\n5\t6"}) {
        Paste(1, 3, text); // up to the last column
        EXPECT_FALSE(asked) << text;
        EXPECT_EQ(Stored().toStdString(), "A 0 5 6, A 100 20 2, B 0 30 3") << text;
        document.UndoStack().undo();
    }
    Paste(2, 2, "chainage [m]\tInitialH\n1\t2");
    EXPECT_FALSE(asked);
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, A 1 2 2, B 0 30 3");
    document.UndoStack().undo();
    Paste(1, 1, "Initial h\nNAME", {}, QDialogButtonBox::Cancel);
    EXPECT_TRUE(asked);
    EXPECT_EQ(Stored().toStdString(), before);
    QString summary;
    Paste(1, 1, "Chainage [s]\tRiver Name\n1\tM", [&](QDialog& dialog) { summary = Summary(dialog); });
    EXPECT_FALSE(canPaste);
    EXPECT_TRUE(summary.contains("\"s\" is no unit of \"Chainage\". Possible are m")) << summary.toStdString();
    EXPECT_EQ(Stored().toStdString(), before);
}

TEST_F(PasteTest, NumbersOfOtherCountriesAreUnderstoodAndShown)
{
    QString understood;
    Paste(1, 2, "1.234,5\t3,25\n2.000\t4,5\n3\t5,125", [&](QDialog& dialog) {
        const auto* model = Understood(dialog).model();
        understood = model->index(0, 0).data().toString() + ' ' + model->index(1, 0).data().toString();
    });
    EXPECT_TRUE(asked);
    EXPECT_EQ(understood.toStdString(), "1234.5 2000");
    EXPECT_EQ(Stored().toStdString(), "A 1234.5 3.25 1, A 2000 4.5 2, B 3 5.125 3");
    document.UndoStack().undo();
    Paste(1, 2, "1,234.5\n12,345"); // thousands
    EXPECT_EQ(Stored().toStdString(), "A 1234.5 10 1, A 12345 20 2, B 0 30 3");
    document.UndoStack().undo();
    Paste(1, 2, "1,234\n2,500"); // as they are where points are decimal signs
    EXPECT_EQ(Stored().toStdString(), "A 1234 10 1, A 2500 20 2, B 0 30 3");
    document.UndoStack().undo();
    QLocale::setDefault(QLocale(QLocale::German));
    for (const char* text : {"1,234\n2,5", "1,234\n2,500", "1.234\n2.500"}) { // a point is one, as in a cell
        Paste(1, 2, text, {}, QDialogButtonBox::Ok, Qt::ControlModifier | Qt::ShiftModifier);
        EXPECT_EQ(Stored().toStdString(), "A 1.234 10 1, A 2.5 20 2, B 0 30 3") << text;
        document.UndoStack().undo();
    }
    QLocale::setDefault(QLocale::system());
    Paste(1, 2, "1,234\n2,500", [&](QDialog& dialog) { Choose(dialog, "decimal", 1); }); // which, the user says
    EXPECT_EQ(Stored().toStdString(), "A 1.234 10 1, A 2.5 20 2, B 0 30 3");
    document.UndoStack().undo();
    for (const char* text : {"1 234,5\n2", "1\u00A0234,5\n2"}) {
        Paste(1, 2, text);
        EXPECT_EQ(Stored().toStdString(), "A 1234.5 10 1, A 2 20 2, B 0 30 3") << text;
        document.UndoStack().undo();
    }
    Paste(1, 2, "1 234.5\n2");
    EXPECT_EQ(Stored().toStdString(), "A 1234.5 10 1, A 2 20 2, B 0 30 3");
    document.UndoStack().undo();
    Paste(1, 1, "X;1,5;2\nY;2,5;3"); // separated as files with decimal commas are
    EXPECT_EQ(Stored().toStdString(), "X 1.5 2 1, Y 2.5 3 2, B 0 30 3");
}

TEST_F(PasteTest, LinesFindTheirPlaces)
{
    Add("A", 100, 40, 4); // another one at the same place
    grid->Refresh();
    QString summary;
    const auto byPlace = [&](QDialog& dialog) {
        Choose(dialog, "place", 2);
        summary = Summary(dialog);
    };
    Paste(3, 1, "b\t0\t31\t5\nA\t100.0000000001\t21\t5\na\t100\t41\t6\nC\t7\t1\t8", byPlace, QDialogButtonBox::Ok,
          Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(summary.toStdString(), "4 lines were copied. 1 line is new.");
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, A 100 21 5, B 0 31 5, A 100 41 6, C 7 1 8");
    EXPECT_EQ(said.toStdString(), "16 cells pasted") << "with those that name the lines";
    const auto block = grid->SelectedBlock().value_or(QItemSelectionRange());
    EXPECT_EQ(std::pair(block.top(), block.bottom()), std::pair(1, 4)) << "in another order";
    document.UndoStack().undo();
    EXPECT_EQ(Stored().toStdString(), before + ", A 100 40 4") << "one step";

    // A line that ends before its place is told has none, whatever stands in the next one.
    Add("5", 0, 50, 5);
    grid->Refresh();
    QStringList listed;
    Paste(1, 1, "Chainage\tRiver Name\tInitial h\n0\n5\tB\t9\n1o\tB\t8\n\tA\t7", [&](QDialog& dialog) {
        byPlace(dialog);
        listed = Listed(dialog);
        dialog.findChild<QCheckBox*>("leaveOut")->click();
    });
    EXPECT_EQ(summary.toStdString(), "4 lines were copied. 1 line is new.");
    EXPECT_EQ(listed,
              QStringList({"2||0|The line does not tell its place.", "4|Chainage|1o|Floating point number required",
                           "5|Chainage||The line does not tell its place."}));
    EXPECT_EQ(Stored().toStdString(), before + ", A 100 40 4, 5 0 50 5, B 5 9 0");
}

TEST_F(PasteTest, OfTwoCopiedLinesOfOnePlaceNoneBecomesASecondOneUnasked)
{
    QStringList listed;
    const auto byPlace = [&](QDialog& dialog) {
        Choose(dialog, "place", 2);
        listed = Listed(dialog);
    };
    const QString text = "A\t100\t7\t8\nC\t5\t1\t2\na\t100.00\t8\t9\nC\t5.0000001\t3\t4\nB\t0\t5\t6";
    Paste(
        1, 1, text,
        [&](QDialog& dialog) {
            byPlace(dialog);
            dialog.findChild<QCheckBox*>("leaveOut")->click();
        },
        QDialogButtonBox::Ok, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(listed, QStringList({"1|Chainage|100|The copied lines 1, 3 have the same place.",
                                   "2|Chainage|5|The copied lines 2, 4 have the same place.",
                                   "3|Chainage|100.00|The copied lines 1, 3 have the same place.",
                                   "4|Chainage|5.0000001|The copied lines 2, 4 have the same place."}));
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, A 100 20 2, B 0 5 6");
    document.UndoStack().undo();
    Paste(
        1, 1, text,
        [&](QDialog& dialog) {
            byPlace(dialog);
            Mend(dialog, 0, "0");
            Mend(dialog, 0, "6");
        },
        QDialogButtonBox::Ok, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(Stored().toStdString(), "A 0 7 8, A 100 8 9, B 0 5 6, C 6 1 2, C 5.0000001 3 4") << "both can be mended";
}

TEST_F(PasteTest, NoLineLosesItsBranchUnasked)
{
    QStringList listed;
    const auto look = [&](QDialog& dialog) {
        listed = Listed(dialog);
        if (auto* leaveOut = dialog.findChild<QCheckBox*>("leaveOut"); leaveOut->isVisible())
            leaveOut->click();
    };
    const char* const reason = "A line needs the name of its branch.";
    Paste(1, 1, "A\t0\t4\n\t200\t5\nB\t300\t6", look); // a branch in the first line of a block only
    EXPECT_EQ(listed, QStringList(QString("2|River Name||") + reason));
    EXPECT_EQ(Stored().toStdString(), "A 0 4 1, A 100 20 2, B 300 6 3");
    document.UndoStack().undo();
    Paste(1, 1, "A\n\nC", look); // of a single column it is a cell
    EXPECT_EQ(listed, QStringList(QString("2|River Name||") + reason));
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, A 100 20 2, C 0 30 3");
    document.UndoStack().undo();
    Paste(2, 1, "\u200B \t1", look, QDialogButtonBox::Cancel); // nobody sees it
    EXPECT_TRUE(asked);
    Paste(1, 1, "\n \t\nX\t1\n\nY\t2\n\t\nZ\t3", look);
    EXPECT_FALSE(asked) << "blank lines are none";
    EXPECT_EQ(Stored().toStdString(), "X 1 10 1, Y 2 20 2, Z 3 30 3");
    EXPECT_EQ(said.toStdString(), "6 cells pasted; left out: 4 blank lines");
    document.UndoStack().undo();
    QString summary;
    Paste(
        1, 1, "X\t1\n\nY\tb",
        [&](QDialog& dialog) {
            summary = Summary(dialog);
            listed = Listed(dialog);
        },
        QDialogButtonBox::Cancel);
    EXPECT_EQ(summary.toStdString(), "2 lines were copied. 0 lines are new. 1 blank line is left out.");
    EXPECT_TRUE(listed.join("").startsWith("3|Chainage|b|")) << "the lines are counted as they were copied";
    // The cell that is cleared may be one with a name, too.
    Paste(2, 1, "\n", look);
    EXPECT_EQ(listed, QStringList(QString("1|River Name||") + reason));
    EXPECT_FALSE(canPaste) << "nothing remains";
}

TEST_F(PasteTest, LinesThatSomethingElseDividesAreNoNames)
{
    for (const char* text : {"A,0,1.5,2\nB,100,2.5,3", "A|0|1.5|2\n\nB|100|2.5|3", "A;0;1.5;2\nB;100;2.5;3"}) {
        Paste(1, 1, text);
        EXPECT_TRUE(asked) << text;
        EXPECT_EQ(Stored().toStdString(), "A 0 1.5 2, B 100 2.5 3, B 0 30 3") << text;
        document.UndoStack().undo();
    }
    for (const char* text : {"C;7;1;2", "C,7,1,2", "C|7|1|2"}) {
        Paste(1, 1, text);
        EXPECT_TRUE(asked) << text;
        EXPECT_EQ(Stored().toStdString(), "C 7 1 2, A 100 20 2, B 0 30 3") << text;
        document.UndoStack().undo();
    }
    Paste(1, 1, "RHINE, UPPER");
    EXPECT_FALSE(asked) << "a name";
    init.GetAt(0).RiverName = "A;1";
    init.GetAt(1).RiverName = "B;2";
    grid->Refresh();
    grid->SetCurrentCell(1, 1);
    grid->selectionModel()->select(QItemSelection(grid->model()->index(0, 0), grid->model()->index(1, 0)),
                                   QItemSelectionModel::ClearAndSelect);
    QTest::keyClick(grid, Qt::Key_C, Qt::ControlModifier);
    Paste(2, 1, {});
    EXPECT_FALSE(asked) << "cells of a table of the program are known";
    EXPECT_EQ(Stored().section(", ", 1).toStdString(), "A;1 100 20 2, B;2 0 30 3");
}

TEST_F(PasteTest, UnitsMayStandInALineOfTheirOwn)
{
    for (const char* text : {"River Name\tChainage\tInitial h\n\t[km]\t[ft]\nX\t1\t10\nY\t2\t20",
                             "River Name\tChainage\tInitial h\n-\tkm\tft\nX\t1\t10\nY\t2\t20",
                             "who\twhere\tdeep\n\t(km)\tft\nX\t1\t10\nY\t2\t20"}) {
        Paste(1, 1, text);
        EXPECT_TRUE(asked) << text;
        EXPECT_EQ(Stored().toStdString(), "X 1000 3.048 1, Y 2000 6.096 2, B 0 30 3") << text;
        document.UndoStack().undo();
    }
    Paste(1, 1, "River Name\tChainage\tInitial h\n\t[m]\t[m]\nX\t1\t10");
    EXPECT_FALSE(asked) << "they are the units shown";
    EXPECT_EQ(Stored().toStdString(), "X 1 10 1, A 100 20 2, B 0 30 3");
    document.UndoStack().undo();
    QString understood;
    Paste(1, 2, "Chainage\tInitial h\n[km]\t[m]\n1\t2", [&](QDialog& dialog) {
        auto* units = dialog.findChild<QCheckBox*>("units");
        units->click(); // the user knows better
        understood = Listed(dialog).join("/");
        units->click();
    });
    EXPECT_EQ(understood.toStdString(),
              "2|Chainage|[km]|Floating point number required/2|Initial h|[m]|Floating point number required");
    EXPECT_EQ(Stored().toStdString(), "A 1000 2 1, A 100 20 2, B 0 30 3");
    document.UndoStack().undo();
    Paste(1, 1, "River Name\tChainage\tInitial h\nA\tm\tm\nX\t1\t10", [&](QDialog& dialog) {
        understood = Listed(dialog).join("/");
        dialog.findChild<QCheckBox*>("leaveOut")->click();
    });
    EXPECT_TRUE(understood.startsWith("2|Chainage|m|")) << "A names a branch: " << understood.toStdString();
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, X 1 10 2, B 0 30 3") << "no line goes where another one would";
}

TEST_F(PasteTest, WhatIsOfAnotherQuantityIsAskedAbout)
{
    grid->SetCurrentCell(1, 4);
    grid->selectionModel()->select(QItemSelection(grid->model()->index(0, 3), grid->model()->index(1, 3)),
                                   QItemSelectionModel::ClearAndSelect);
    QTest::keyClick(grid, Qt::Key_C, Qt::ControlModifier);
    QString summary;
    bool isMarked = false;
    const auto look = [&](QDialog& dialog) {
        summary = Summary(dialog);
        isMarked = !dialog.findChild<QTableWidget*>()->item(0, 0)->icon().isNull();
    };
    Paste(1, 3, {}, look);
    EXPECT_TRUE(asked && isMarked && !canPaste);
    EXPECT_TRUE(summary.contains("\"m³/s\" is no unit of \"Initial h\". Possible are m")) << summary.toStdString();
    Paste(1, 3, "Flow [m3/s]\n7\n8", look);
    EXPECT_TRUE(asked && isMarked && !canPaste);
    EXPECT_EQ(Stored().toStdString(), before);
    Paste(1, 3, "Flow [m3/s]\n7\n8", [&](QDialog& dialog) {
        auto* unit = qobject_cast<QComboBox*>(dialog.findChild<QTableWidget*>()->cellWidget(0, 2));
        unit->setCurrentIndex(unit->findText("m"));
        emit unit->activated(unit->currentIndex());
        look(dialog);
    });
    EXPECT_FALSE(isMarked);
    EXPECT_EQ(Stored().toStdString(), "A 0 7 1, A 100 8 2, B 0 30 3") << "as the user says";
    document.UndoStack().undo();
    Paste(1, 3, "Depth [ft]\n10", look);
    EXPECT_EQ(Stored().toStdString(), "A 0 3.048 1, A 100 20 2, B 0 30 3") << "a unit of the column's";
}

TEST_F(PasteTest, WhatNobodySeesIsNoPartOfNamesAndNumbers)
{
    Paste(1, 1, " x \u200B\t 1 \t\uFEFF2\t3\u00AD\u2060\u00A0");
    EXPECT_FALSE(asked);
    EXPECT_EQ(Stored().toStdString(), "X 1 2 3, A 100 20 2, B 0 30 3");
    document.UndoStack().undo();
    Paste(1, 2, "\uFEFFInitial\u00A0h\n 1 ft ");
    EXPECT_EQ(Stored().toStdString(), "A 0 0.3048 1, A 100 20 2, B 0 30 3");
}

TEST_F(PasteTest, AnEmptyCellIsCopiedAsOne)
{
    document.Parameters().Global.G_waterlevel = 3.5;
    Add("D", NotGiven);
    grid->Refresh();
    grid->SetCurrentCell(4, 2);
    QTest::keyClick(grid, Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(QGuiApplication::clipboard()->text(), "");
    Paste(1, 3, {});
    EXPECT_FALSE(asked);
    EXPECT_EQ(init.GetAt(0).InitialH, 3.5) << "as a cleared one";
    grid->SetCurrentCell(2, 3);
    grid->selectionModel()->select(QItemSelection(grid->model()->index(1, 1), grid->model()->index(2, 2)),
                                   QItemSelectionModel::ClearAndSelect);
    QTest::keyClick(grid, Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(Stored().toStdString(), "A 0 3.5 1, A 10000000000 3.5 2, B 10000000000 3.5 3, D 10000000000 0 0");
    QGuiApplication::clipboard()->setText(QString());
    EXPECT_FALSE(CanPasteCells(*grid)) << "nothing is on it";
}

TEST_F(PasteTest, MendingATextKeepsTheDigitsOfTheOthers)
{
    init.GetAt(0).InitialH = 1.0 / 3;
    init.GetAt(1).RiverName = "";
    grid->Refresh();
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    grid->selectionModel()->select(QItemSelection(grid->model()->index(0, 0), grid->model()->index(1, 3)),
                                   QItemSelectionModel::ClearAndSelect);
    QTest::keyClick(grid, Qt::Key_C, Qt::ControlModifier);
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    Paste(3, 1, {}, [](QDialog& dialog) { Mend(dialog, 0, "M"); });
    ASSERT_EQ(init.GetCount(), 4u);
    EXPECT_EQ(init.GetAt(2).InitialH, 1.0 / 3);
    EXPECT_EQ(init.GetAt(3).RiverName, "M");
    document.UndoStack().undo();
    // What is mended is no longer what was copied.
    QGuiApplication::clipboard()->setMimeData(
        ToClipboard({{"x", "10"}},
                    {{grid->Model()->Column(1).style.Group(), "ft"}, {grid->Model()->Column(2).style.Group(), "ft"}},
                    {{"3", "3.048"}})
            .release());
    Paste(3, 2, {}, [](QDialog& dialog) { Mend(dialog, 0, "20"); });
    EXPECT_EQ(Stored().section(", ", 2).toStdString(), "B 6.096 3.048 3");
}

TEST_F(PasteTest, ValuesTravelWithTheirUnitsAndEveryDigit)
{
    init.GetAt(0).InitialH = 1.0 / 3;
    init.GetAt(1).InitialH = 0.1 + 0.2;
    grid->Refresh();
    const auto copy = [&] {
        grid->SetCurrentCell(1, 3);
        grid->selectionModel()->select(QItemSelection(grid->model()->index(0, 2), grid->model()->index(1, 3)),
                                       QItemSelectionModel::ClearAndSelect);
        QTest::keyClick(grid, Qt::Key_C, Qt::ControlModifier);
    };
    using enum KsUnitSystem;
    for (const auto& [from, to] : {std::pair(Metric, UsCustomary), {UsCustomary, Metric}, {UsCustomary, UsCustomary}}) {
        KsUnits::Instance().SetSystem(from);
        copy();
        KsUnits::Instance().SetSystem(to);
        Paste(3, 3, {});
        EXPECT_FALSE(asked);
        ASSERT_EQ(init.GetCount(), 4u);
        EXPECT_EQ(init.GetAt(2).InitialH, 1.0 / 3);
        EXPECT_EQ(init.GetAt(3).InitialH, 0.1 + 0.2);
        EXPECT_EQ(init.GetAt(3).InitialQ, 2);
        document.UndoStack().undo();
    }
    for (const auto& [from, to] : {std::pair(UsCustomary, Metric), {UsCustomary, UsCustomary}}) { // below headers
        KsUnits::Instance().SetSystem(from);
        grid->selectionModel()->select(QItemSelection(grid->model()->index(0, 2), grid->model()->index(1, 3)),
                                       QItemSelectionModel::ClearAndSelect);
        QTest::keyClick(grid, Qt::Key_C, Qt::ControlModifier | Qt::ShiftModifier);
        KsUnits::Instance().SetSystem(to);
        Paste(3, 3, {});
        EXPECT_EQ(asked, from != to) << "another unit is named";
        ASSERT_EQ(init.GetCount(), 4u);
        EXPECT_EQ(init.GetAt(2).InitialH, 1.0 / 3);
        EXPECT_EQ(init.GetAt(3).InitialH, 0.1 + 0.2);
        document.UndoStack().undo();
    }
    KsUnits::Instance().SetSystem(UsCustomary);
    copy();
    KsUnits::Instance().SetSystem(Metric);
    Paste(
        3, 3, {},
        [](QDialog& dialog) {
            auto* unit = qobject_cast<QComboBox*>(dialog.findChild<QTableWidget*>()->cellWidget(0, 2));
            EXPECT_EQ(unit->currentText(), "ft");
            unit->setCurrentIndex(unit->findText("m"));
            emit unit->activated(unit->currentIndex());
        },
        QDialogButtonBox::Ok, Qt::ControlModifier | Qt::ShiftModifier);
    ASSERT_EQ(init.GetCount(), 4u);
    EXPECT_NEAR(init.GetAt(2).InitialH, 1.0936, 0.0001) << "the text is taken, as the user says";
    document.UndoStack().undo();
    init.GetAt(0).InitialH = 3.048;
    grid->Refresh();
    KsUnits::Instance().SetSystem(UsCustomary);
    grid->SetCurrentCell(1, 3);
    QTest::keyClick(grid, Qt::Key_C, Qt::ControlModifier);
    KsUnits::Instance().SetSystem(Metric);
    grid->SetCurrentCell(2, 2);
    grid->selectionModel()->select(QItemSelection(grid->model()->index(1, 1), grid->model()->index(2, 2)),
                                   QItemSelectionModel::ClearAndSelect);
    QTest::keyClick(grid, Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(Stored().section(", ", 1).toStdString(), "A 3.048 3.048 2, B 3.048 3.048 3") << "in each column";
    document.UndoStack().undo();
    // Of a header without unit the clipboard knows it, also when the user says again that it is one.
    const UnitGroup length = grid->Model()->Column(2).style.Group();
    for (const int clicks : {0, 2}) {
        const auto own = [&] {
            return ToClipboard({{"Initial h", "River Name"}, {"10", "X"}}, {{length, "ft"}, {}}, {}).release();
        };
        QGuiApplication::clipboard()->setMimeData(own());
        Paste(3, 2, {}, [clicks](QDialog& dialog) {
            for (int i = 0; i < clicks; ++i)
                dialog.findChild<QCheckBox*>("headers")->click();
        });
        EXPECT_TRUE(asked);
        EXPECT_NEAR(init.GetAt(2).InitialH, 3.048, 1e-9) << clicks;
        document.UndoStack().undo();
    }
    // What says more than its text must not be believed.
    const auto lie = [](const char* text, const char* own) {
        auto* content = new QMimeData;
        content->setText(text);
        content->setData("application/x-kvr-cells", own);
        QGuiApplication::clipboard()->setMimeData(content);
    };
    for (const char* own : {"", "100000", "100000\t100001\nm\tm\n", "100000\t7\nm\ts\n1\t2", "\n\n\n\t\t"}) {
        lie("5\t6", own);
        Paste(3, 3, {});
        EXPECT_EQ(Stored().section(", ", 2).toStdString(), "B 0 5 6") << own;
        document.UndoStack().undo();
    }
    lie("5\t6\n7\t8", "100000\t100001\nm\tm\n5\n7"); // narrower than the texts
    Paste(2, 3, {});
    EXPECT_EQ(Stored().section(", ", 1).toStdString(), "A 100 5 6, B 0 7 8");
}

TEST_F(PasteTest, DigitsTravelBesideAColumnWithoutUnit)
{
    auto& winds = document.Parameters().WindList;
    for (const double chainage : {1.0 / 3, 0.1 + 0.2, 1.1 * 1.1, 1e5 / 7, 2e5 / 7, 0.7 / 0.9}) {
        auto& wind = winds.Add({});
        wind.RiverName = "A";
        wind.Chainage = chainage;
    }
    for (int line = 0; line < 6; ++line)
        winds.Add({}).RiverName = "B";
    Open<FamilyPage>(winds);
    grid->setFocus();
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    ASSERT_TRUE(grid->Model()->Column(grid->ColumnCount() - 1).UnitSymbol().isEmpty());
    grid->SetCurrentCell(1, 2);
    grid->selectionModel()->select(
        QItemSelection(grid->model()->index(0, 1), grid->model()->index(5, grid->ColumnCount() - 1)),
        QItemSelectionModel::ClearAndSelect);
    QTest::keyClick(grid, Qt::Key_C, Qt::ControlModifier);
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    Paste(7, 2, {});
    EXPECT_FALSE(asked);
    for (std::size_t line = 0; line < 6; ++line)
        EXPECT_EQ(winds.GetAt(line + 6).Chainage, winds.GetAt(line).Chainage);
}

TEST_F(PasteTest, WhatWasPastedIsSelectedAndNothingElse)
{
    Add("A", 50, 40, 4);
    grid->ChangeView([](CGridModel& model) {
        model.SortBy({{0}, {1}});
        model.Filter({"A"});
    });
    const auto byPlace = [](QDialog& dialog) { Choose(dialog, "place", 2); };
    const auto held = Qt::ControlModifier | Qt::ShiftModifier;
    const auto block = [this] { return grid->SelectedBlock().value_or(QItemSelectionRange()); };
    Paste(1, 1, "B\t0\t7\nA\t100\t8", byPlace, QDialogButtonBox::Ok, held); // the first one is hidden
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, A 100 8 2, B 0 7 3, A 50 40 4");
    EXPECT_LE(block().height(), 1);
    EXPECT_EQ(Current(), std::pair(3, 1)) << "the first that is shown";
    document.UndoStack().undo();
    Paste(3, 1, "A\t100\t8\nA\t0\t9", byPlace, QDialogButtonBox::Ok, held); // another one stands between them
    EXPECT_LE(block().height(), 1);
    document.UndoStack().undo();
    Paste(1, 1, "A\t100\t8\nA\t50\t9", byPlace, QDialogButtonBox::Ok, held);
    EXPECT_EQ(std::pair(block().top(), block().bottom()), std::pair(1, 2)) << "one below the other, whatever the order";
}

TEST_F(PasteTest, OnlyWhatIsShownIsOverwritten)
{
    grid->ChangeView([](CGridModel& model) { model.Filter({"A"}); });
    Paste(2, 3, "21,5\n22,5\n23,5");
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, A 100 21.5 2, B 0 30 3,  10000000000 22.5 0,  10000000000 23.5 0");
}

namespace {

/// A table whose line at 100 is locked but for its last columns.
class LockedPage : public CLocationPage
{
public:
    LockedPage(CKavo0_hdDoc* document, CGenList& list) : CLocationPage(document, list)
    {
        auto* grid = new CGenGrid;
        (new QVBoxLayout(this))->addWidget(grid);
        const auto isLocked = [](const void* row) { return static_cast<const HD_Initial*>(row)->Chainage == 100; };
        GridColumns columns = Grid(grid);
        columns.BranchName({.locked = isLocked}).Chainage({.locked = isLocked});
        for (const Field& field : list.Fields())
            if (field.kind != FieldKind::Group)
                columns.Value(field, {});
    }
};

} // namespace

TEST_F(PasteTest, LockedCellsAreTold)
{
    Open<LockedPage>(init);
    QStringList listed;
    Paste(1, 1, "Z\t1\nZ\t7\nZ\t3", [&](QDialog& dialog) {
        listed = Listed(dialog);
        dialog.findChild<QCheckBox*>("leaveOut")->click();
    });
    EXPECT_EQ(listed, QStringList({"2|River Name|Z|The cell is locked.", "2|Chainage|7|The cell is locked."}))
        << "and no others";
    EXPECT_EQ(Stored().toStdString(), "Z 1 10 1, A 100 20 2, Z 3 30 3");
    Paste(2, 1, "A\t100\t5");
    EXPECT_FALSE(asked) << "they hold that already";
    EXPECT_EQ(Stored().toStdString(), "Z 1 10 1, A 100 5 2, Z 3 30 3");
}

TEST(Separator, IsThatWhichDividesEveryLineAlike)
{
    const auto of = [](const char* text) {
        return SeparatorOf([text = QString(text)](QChar separator) { return CopiedTable{CTextTable(text, separator)}; })
            .toLatin1();
    };
    EXPECT_EQ(of("a;b\nc;d"), ';');
    EXPECT_EQ(of("a,b\nc,d"), ',');
    EXPECT_EQ(of("a|b\nc|d"), '|');
    EXPECT_EQ(of("a;b,c\nd;e,f"), ';');
    EXPECT_EQ(of("a;b\nc"), '\t') << "a line has none";
    EXPECT_EQ(of("a;b\nc;d\te"), '\t') << "a tab divides another line";
    EXPECT_EQ(of("1,234\n2,345"), '\t') << "numbers";
    EXPECT_EQ(of("a;b\n\nc;d"), ';') << "a blank line is none";
    EXPECT_EQ(of("a"), '\t');
}
