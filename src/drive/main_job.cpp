#include "drive/main_job.h"

#include "data/hd_file.h"
#include "drive/page_tour.h"
#include "drive/robot.h"
#include "ks/fc/doc.h"
#include "shell/main_frame.h"

#include <QAbstractItemModel>
#include <QAction>
#include <QApplication>
#include <QDialog>
#include <QFileInfo>
#include <QLineEdit>
#include <QMenu>
#include <QTabWidget>
#include <QTableView>
#include <algorithm>

namespace {

constexpr int InitGrid = 1003, GlobalLevel = 1001, GlobalDischarge = 1002, SearchName = 1058;

struct Line
{
    QString river, chainage, level, discharge;
};

const Line NewLine{"drive branch", "1234.5", "2.75", "18.25"};

QString CellText(QTableView* table, int row, int column)
{
    return table->model()->index(row, column).data().toString();
}

QTableView* InitialGrid(Robot& robot)
{
    return robot.Control<QTableView>(InitGrid);
}

void ChangeGlobals(Robot& robot)
{
    robot.Did("Type a global water level and leave the field with Tab");
    auto* level = robot.Control<QLineEdit>(GlobalLevel);
    if (!level)
        return;
    robot.ClickMiddle(level);
    robot.Key(level, Qt::Key_A, Qt::ControlModifier);
    robot.Type(level, "3.125");
    robot.Key(level, Qt::Key_Tab);
    robot.Verify(level->text() == "3.125", "the field shows 3.125");
    robot.Verify(robot.Frame().GetActiveView()->GetDocument()->IsModified(), "the document is modified");
}

/// Appends a line with the Insert key, types it cell by cell, and returns its row.
int AppendTypedLine(Robot& robot)
{
    auto* grid = InitialGrid(robot);
    const int before = grid->model()->rowCount();
    robot.Did("Press Insert in the grid: a line is appended");
    robot.ClickCell(grid, before - 1, 0);
    robot.Key(grid, Qt::Key_Insert);
    robot.Verify(grid->model()->rowCount() == before + 1, QStringLiteral("the grid has %1 lines").arg(before + 1));

    robot.Did("Type river, chainage, level and discharge, Tab after each");
    robot.ClickCell(grid, before, 0);
    for (const QString& text : {NewLine.river, NewLine.chainage, NewLine.level, NewLine.discharge}) {
        robot.TypeToFocus(text);
        robot.KeyToFocus(Qt::Key_Tab);
    }
    robot.Verify(CellText(grid, before, 0) == NewLine.river.toUpper(), "the river name stands in upper case");
    robot.Verify(CellText(grid, before, 2) == "2.750", "the level shows three decimals");
    robot.Verify(grid->model()->rowCount() == before + 2, "Tab in the last cell appended another line");
    robot.Verify(grid->currentIndex().row() == before + 1 && grid->currentIndex().column() == 0,
                 "the first cell of that line is current");
    return before;
}

void DeleteLastLine(Robot& robot)
{
    auto* grid = InitialGrid(robot);
    const int before = grid->model()->rowCount();
    robot.Did("Click the number of the last line and press Delete");
    robot.ClickRowHeader(grid, before - 1);
    robot.Key(grid, Qt::Key_Delete);
    robot.Verify(grid->model()->rowCount() == before - 1, "the line is gone");
    robot.Key(grid, Qt::Key_Z, Qt::ControlModifier);
    robot.Verify(InitialGrid(robot)->model()->rowCount() == before, "Ctrl+Z brings it back");
    robot.Key(InitialGrid(robot), Qt::Key_Y, Qt::ControlModifier);
    robot.Verify(InitialGrid(robot)->model()->rowCount() == before - 1, "Ctrl+Y deletes it again");
}

void SearchForLine(Robot& robot, int row)
{
    auto* grid = InitialGrid(robot);
    robot.ClickCell(grid, 0, 0);
    robot.Did("Press F7 and search for the new branch");
    robot.WithDialog([&] { robot.Key(grid, Qt::Key_F7); },
                     [&](QDialog& dialog) {
                         for (auto* edit : dialog.findChildren<QLineEdit*>()) {
                             if (edit->objectName().endsWith(QStringLiteral("_%1").arg(SearchName)))
                                 robot.Type(edit, NewLine.river.toUpper());
                         }
                         dialog.grab().save(QString()); // lays the dialog out before Enter
                         robot.Key(&dialog, Qt::Key_Return);
                     });
    robot.Verify(grid->currentIndex().row() == row, QStringLiteral("line %1 is current").arg(row + 1));
}

void SwitchUnits(Robot& robot, int row)
{
    auto* grid = InitialGrid(robot);
    robot.Did("Switch to US customary units and back");
    robot.Choose("actionUsCustomary");
    robot.Verify(CellText(grid, row, 1) == "4050", "the chainage 1234.5 m shows as 4050 ft");
    robot.Picture("initial-us-units");
    robot.Choose("actionMetric");
    robot.Verify(CellText(grid, row, 2) == "2.750", "the level shows 2.750 m again");
}

void ShowInJapanese(Robot& robot)
{
    robot.Did("Switch to Japanese and back");
    robot.Choose("actionLanguage_ja");
    robot.Picture("initial-japanese");
    robot.Choose("actionLanguage_en_US");
}

bool HoldsNewLine(const HD_Parameters& parameters, int row)
{
    if (int(parameters.InitList.GetCount()) <= row)
        return false;
    const HD_Initial& line = parameters.InitList.GetAt(std::size_t(row));
    return line.RiverName == NewLine.river.toUpper().toStdString() && line.Chainage == 1234.5 &&
           line.InitialH == 2.75 && line.InitialQ == 18.25;
}

bool OpenRecent(Robot& robot, const QString& path)
{
    QMenu* menu = robot.Frame().findChild<QAction*>("actionOpenRecent")->menu();
    return robot.ChooseFrom(menu, [&](const QString& text) { return text.endsWith(QFileInfo(path).fileName()); });
}

void SaveCloseReopen(Robot& robot, const QString& file, int row)
{
    auto* sheet = robot.Frame().GetActiveView()->findChild<QTabWidget*>("sheet");
    const bool otherPages = sheet && sheet->count() > 1;
    std::vector<PageChange> changes;
    if (otherPages) {
        robot.Did("Visit every page and change a global and a local value on each");
        changes = ChangeEveryPage(robot);
        GoToTab(robot, sheet, 0);
    }
    const double level = robot.Control<QLineEdit>(GlobalLevel)->text().toDouble();
    robot.Did("Save with Ctrl+S");
    robot.KeyToFocus(Qt::Key_S, Qt::ControlModifier);
    const QString saved = robot.Frame().GetActiveView()->GetDocument()->GetPathName();
    robot.Verify(saved.endsWith(".HDKV") && QFileInfo::exists(saved), "the file is " + QFileInfo(saved).fileName());
    robot.Verify(!robot.Frame().GetActiveView()->GetDocument()->IsModified(), "the document is no longer modified");
    robot.Verify(!QFileInfo::exists(file) || QFileInfo(file) == QFileInfo(saved),
                 "no second spelling of the file stands beside it");

    robot.Did("Close the document and open it again from the recent files");
    robot.Choose("actionClose");
    const auto windows = robot.Frame().Windows().All();
    robot.Verify(std::none_of(windows.begin(), windows.end(),
                              [](const QMdiSubWindow* window) { return window->windowTitle().contains(".HDKV"); }),
                 "the document is closed");
    const bool reopened = OpenRecent(robot, saved);
    robot.Verify(reopened, "the saved file is among the recent files");
    if (!reopened)
        return;
    robot.Verify(robot.Frame().GetActiveView() != nullptr, "the document is open again");
    auto* grid = InitialGrid(robot);
    if (!grid)
        return;
    robot.Verify(CellText(grid, row, 0) == NewLine.river.toUpper(), "the typed line is there");

    VerifyEveryPage(robot, changes);
    robot.Did("Read the saved file without the program and compare");
    const auto parameters = LoadHDFile(saved.toStdString());
    robot.Verify(bool(parameters), "the file reads without an error");
    if (!parameters)
        return;
    robot.Verify(HoldsNewLine(parameters.value(), row), "the typed line is in the file, bit for bit");
    robot.Verify(parameters.value().Global.G_waterlevel == level, "the global water level is in the file");
    robot.Verify(int(parameters.value().InitList.GetCount()) == grid->model()->rowCount(),
                 "the file has as many lines as the grid");
}

} // namespace

void DriveMainJob(Robot& robot, const QString& file)
{
    auto* grid = InitialGrid(robot);
    robot.Verify(grid && grid->model()->rowCount() > 10, "the sample file shows its initial conditions");
    if (!grid)
        return;
    robot.Picture("initial");
    ChangeGlobals(robot);
    const int row = AppendTypedLine(robot);
    DeleteLastLine(robot);
    SearchForLine(robot, row);
    robot.Picture("initial-edited");
    SwitchUnits(robot, row);
    ShowInJapanese(robot);
    SaveCloseReopen(robot, file, row);
    robot.Picture("initial-reopened");
}
