// The pages of bed resistance, wave approximation, the quasi-steady solver and mixing.
#include "canceled_paste.h"
#include "flow_page_fixture.h"
#include "grid/grid_clipboard.h"
#include "pages/page_table.h"

#include "ks/fc/messages.h"
#include "ks/fc/package.h"
#include "pages/load_option_dlg.h"

#include <QClipboard>
#include <QRadioButton>

class ChannelPagesTest : public FlowPagesTest
{
protected:
    template <typename Record>
    Record& AddTo(CGenParamList<Record>& list, const char* name, double chainage)
    {
        Record& record = list.Add();
        record.RiverName = name;
        record.Chainage = chainage;
        return record;
    }
    bool PasteAt(int row, int column, const char* text)
    {
        QGuiApplication::clipboard()->setText(text);
        grid->SetCurrentCell(row, column);
        CancelPaste(*grid, boxes);
        const bool isPasted = PasteCells(*grid);
        QCoreApplication::processEvents();
        return isPasted;
    }
};

TEST_F(ChannelPagesTest, ApproximationsAreChosenFromAList)
{
    auto& list = document.Parameters().WaveList;
    AddTo(list, "A", 100).WaveApproximation = 9;
    AddTo(list, "B", 200).DownstreamChainage = 300;
    Open(MakeWavePage);
    EXPECT_EQ(Texts(1), "A|100|0|9") << "an index without entry shows as its number";
    EXPECT_EQ(Texts(2), "B|200|300|High Order Fully Dynamic");
    grid->setFocus();
    grid->SetCurrentCell(1, 4);
    QTest::keyClick(grid, Qt::Key_F2);
    QTest::keyClick(Editor(), Qt::Key_Return);
    EXPECT_EQ(list.GetAt(0).WaveApproximation, 9) << "looking changes nothing";
    EXPECT_FALSE(document.IsModified());

    Enter(1, 4, "Di"); // first letters
    EXPECT_EQ(list.GetAt(0).WaveApproximation, 2);
    Enter(2, 4, ""); // emptied
    EXPECT_EQ(list.GetAt(1).WaveApproximation, 3);
    EXPECT_EQ(grid->TextAt(2, 4), "Kinematic Wave");
    Enter(2, 3, "");
    EXPECT_EQ(list.GetAt(1).DownstreamChainage, NotGiven);
    EXPECT_EQ(Texts(2), "B|200||Kinematic Wave");
    while (document.UndoStack().canUndo())
        document.UndoStack().undo();
    EXPECT_EQ(list.GetAt(0).WaveApproximation, 9);

    // The texts of spreadsheets: entries, whatever their case, and the numbers of entries.
    EXPECT_TRUE(PasteAt(1, 4, "fully dynamic\n0"));
    EXPECT_EQ(list.GetAt(0).WaveApproximation, 1);
    EXPECT_EQ(list.GetAt(1).WaveApproximation, 0);
    const auto before = Lines();
    for (const char* unknown : {"Dynamic", "4", "-1", "1.0"}) {
        boxes.clear();
        EXPECT_FALSE(PasteAt(1, 4, unknown)) << unknown;
        ASSERT_EQ(boxes.size(), 1);
        EXPECT_TRUE(boxes[0].contains("Diffusive Wave") && boxes[0].contains(unknown)) << boxes[0].toStdString();
    }
    EXPECT_EQ(Lines(), before);

    // A new line: the reach has no end yet.
    view->page->AppendLine();
    EXPECT_EQ(list.GetAt(2).DownstreamChainage, NotGiven);
    EXPECT_EQ(list.GetAt(2).WaveApproximation, 1);
}

TEST_F(ChannelPagesTest, ResistanceApproachAndFormula)
{
    AddTo(document.Parameters().BedList, "A", 1).Resistance = 33;
    globals.ResisZone = 7;
    globals.resist_num = 5;
    Open(MakeBedPage);
    auto* formula = Find<QComboBox>(1300);
    auto *uniform = Find<QRadioButton>(1301), *zones = Find<QRadioButton>(1302);
    EXPECT_EQ(formula->currentText(), "5") << "kept, though nobody knows it";
    EXPECT_FALSE(uniform->isChecked() || zones->isChecked());
    const auto unit = [&](int number) {
        return view->page->findChild<QLabel*>(QString("unit_%1").arg(number))->text();
    };
    const auto tip = [&](int column) {
        return grid->model()->headerData(column - 1, Qt::Horizontal, Qt::ToolTipRole).toString();
    };
    const char* units[] = {"m¹⁄³/s", "s/m¹⁄³", "m¹⁄²/s", ""};
    for (int index : {3, 2, 1, 0}) {
        if (index < 3) {
            formula->setFocus();
            QTest::keyClick(formula, Qt::Key_Up);
            EXPECT_EQ(globals.resist_num, index);
        }
        for (int number : {1303, 1304, 1305, 1306})
            EXPECT_EQ(unit(number), units[index]);
        const QString unitTip = *units[index] ? QString("Unit: %1\n").arg(units[index]) : QString();
        for (int column : {3, 4, 5, 6})
            EXPECT_TRUE(tip(column).contains(".\n" + unitTip + "New lines: ")) << tip(column).toStdString();
        EXPECT_TRUE(Find<QLineEdit>(1303)->toolTip().contains(".\n" + unitTip + "Default: 30"));
    }
    EXPECT_EQ(globals.G_resistance, 30) << "no value is converted";
    EXPECT_EQ(Texts(1), "A|1|33|30|25|20");

    // What the approach does not use is locked, and kept.
    const auto expectZones = [&](bool inUse) {
        EXPECT_EQ(Find(1303)->isEnabled(), !inUse);
        for (int number : {1304, 1305, 1306})
            EXPECT_EQ(Find(number)->isEnabled(), inUse);
        for (int column = 3; column <= 6; ++column) {
            const QModelIndex cell = grid->model()->index(0, column - 1);
            const bool locked = (column > 3) != inUse;
            EXPECT_EQ(bool(cell.flags() & Qt::ItemIsEditable), !locked) << column;
            EXPECT_EQ(cell.data(Qt::BackgroundRole).value<QBrush>() == QApplication::palette().brush(QPalette::Button),
                      locked);
        }
    };
    uniform->click();
    EXPECT_EQ(globals.ResisZone, 0);
    expectZones(false);
    zones->click();
    EXPECT_EQ(globals.ResisZone, 1);
    expectZones(true);
    boxes.clear();
    EXPECT_FALSE(PasteAt(1, 3, "31"));
    EXPECT_TRUE(boxes.value(0).contains("The cell is locked."));
    EXPECT_TRUE(PasteAt(1, 4, "31\t26\t21"));
    EXPECT_EQ(Texts(1), "A|1|33|31|26|21");
}

TEST_F(ChannelPagesTest, EnergyEquationEnablesItsOptions)
{
    AddTo(document.Parameters().QSSContractionExpansionList, "A", 1);
    globals.FrictionSlope = 3;
    Open(MakeQuasiPage);
    const auto expectUsed = [&](bool used) {
        for (int number : {1188, 1189, 1190, 1191, 1194, 1042, 1043, 1104})
            EXPECT_EQ(Find(number)->isEnabled(), used) << number;
        for (const char* label : {"label_1194", "label_1042", "label_1043"})
            EXPECT_EQ(view->page->findChild<QLabel*>(label)->isEnabled(), used) << label;
        EXPECT_EQ(grid->isVisible(), used);
        for (int number : {1024, 1028, 1030, 1032, 1034, 1036, 1038, 1041, 1187})
            EXPECT_TRUE(Find(number)->isEnabled()) << number;
    };
    expectUsed(false);
    EXPECT_EQ(Find<QComboBox>(1194)->currentText(), "Geometric mean");
    const auto* relax = Find(1024);
    const QPoint before = relax->mapTo(view.get(), QPoint());
    Find<QAbstractButton>(1187)->click();
    expectUsed(true);
    EXPECT_EQ(relax->mapTo(view.get(), QPoint()), before) << "the page does not jump";
    Find<QAbstractButton>(1187)->click();
    expectUsed(false);
    EXPECT_EQ(document.Parameters().QSSContractionExpansionList.GetCount(), 1u);
}

namespace {

/// A shell with one project and no editor but this one.
struct ProjectShell : CKsWindow
{
    ProjectShell() { KsSetMainWindow(this); }
    ~ProjectShell() override { KsSetMainWindow(nullptr); }
    LRESULT WindowProc(unsigned, WPARAM request, LPARAM) override
    {
        requests << int(request);
        return request == KsRequest::JoinProject;
    }
    QList<int> requests;
};

} // namespace

TEST_F(ChannelPagesTest, LoadingLocationsSaysWhyItCannot)
{
    globals.EnergyEquation = true;
    Open(MakeQuasiPage);
    Find<QAbstractButton>(1104)->click();
    ASSERT_EQ(boxes.size(), 1);
    EXPECT_TRUE(boxes[0].contains("belongs to no project"));

    ProjectShell shell;
    document.JoinProject(view.get());
    const struct
    {
        const char* button; // null cancels
        int request;
    } cases[] = {{"branch_1105", 40}, {"radius_1106", 49}, {"width_1107", 49}, {nullptr, 0}};
    for (const auto& c : cases) {
        boxes.clear();
        shell.requests.clear();
        QTimer::singleShot(0, [&] {
            auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            ASSERT_TRUE(dialog);
            EXPECT_EQ(dialog->windowTitle(), "Load Branch and Chainage");
            EXPECT_TRUE(dialog->findChild<QRadioButton*>("branch_1105")->isChecked());
            if (c.button)
                dialog->findChild<QRadioButton*>(c.button)->click();
            QTest::keyClick(dialog, c.button ? Qt::Key_Return : Qt::Key_Escape);
        });
        Find<QAbstractButton>(1104)->click();
        ASSERT_EQ(shell.requests.size(), c.button ? 1 : 0);
        EXPECT_EQ(shell.requests.value(0), c.request);
        EXPECT_EQ(boxes.size(), c.button ? 1 : 0);
    }
    EXPECT_FALSE(document.IsModified());
}
