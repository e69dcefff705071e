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
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, X 1 2 2, Y 0 3 4,  3 5 6")
        << "a cell stays as it was, a new one is empty";
    EXPECT_EQ(said.toStdString(), "9 cells pasted; 3 left out");
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
    EXPECT_EQ(said.toStdString(), "11 cells pasted; 1 left out");
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
    // In their order, without another unit: nothing to ask about. Names only, they are no names.
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
        for (auto* table : dialog.findChildren<QTableView*>())
            if (table->accessibleName() == "As it is understood")
                understood =
                    table->model()->index(0, 0).data().toString() + ' ' + table->model()->index(1, 0).data().toString();
    });
    EXPECT_TRUE(asked);
    EXPECT_EQ(understood.toStdString(), "1234.5 2000");
    EXPECT_EQ(Stored().toStdString(), "A 1234.5 3.25 1, A 2000 4.5 2, B 3 5.125 3");
    document.UndoStack().undo();
    Paste(1, 2, "1,234.5\n12,345"); // thousands
    EXPECT_EQ(Stored().toStdString(), "A 1234.5 10 1, A 12345 20 2, B 0 30 3");
    document.UndoStack().undo();
    Paste(1, 2, "1,234\n2,500", [&](QDialog& dialog) { Choose(dialog, "decimal", 1); }); // which, the user says
    EXPECT_EQ(Stored().toStdString(), "A 1.234 10 1, A 2.5 20 2, B 0 30 3");
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
    Paste(3, 1, "b\t0\t31\t5\nA\t100.0000000001\t21\t5\na\t100\t41\t6\nA\t100\t51\t7\nC\t7\t1\t8", byPlace,
          QDialogButtonBox::Ok, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(summary.toStdString(), "5 lines were copied. 2 lines are new.");
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, A 100 21 5, B 0 31 5, A 100 41 6, A 100 51 7, C 7 1 8");
    document.UndoStack().undo();
    EXPECT_EQ(Stored().toStdString(), before + ", A 100 40 4") << "one step";
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
    KsUnits::Instance().SetSystem(Metric);
    // What says more than its text must not be believed.
    for (const char* own : {"", "100000", "100000\t100001\nm\tm\n", "100000\t7\nm\ts\n1\t2", "\n\n\n\t\t"}) {
        auto* content = new QMimeData;
        content->setText("5\t6");
        content->setData("application/x-kvr-cells", own);
        QGuiApplication::clipboard()->setMimeData(content);
        Paste(3, 3, {});
        EXPECT_EQ(Stored().section(", ", 2).toStdString(), "B 0 5 6") << own;
        document.UndoStack().undo();
    }
}

TEST_F(PasteTest, OnlyWhatIsShownIsOverwritten)
{
    grid->ChangeView([](CGridModel& model) { model.Filter({"A"}); });
    Paste(2, 3, "21,5\n22,5\n23,5");
    EXPECT_EQ(Stored().toStdString(), "A 0 10 1, A 100 21.5 2, B 0 30 3,  10000000000 22.5 0,  10000000000 23.5 0");
}
