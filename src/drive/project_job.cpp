#include "drive/project_job.h"

#include "drive/page_tour.h"
#include "drive/robot.h"
#include "ks/fc/doc.h"
#include "shell/main_frame.h"

#include <QAbstractItemModel>
#include <QAction>
#include <QCheckBox>
#include <QDialog>
#include <QElapsedTimer>
#include <QMenu>
#include <QMenuBar>
#include <QRadioButton>
#include <QTabWidget>
#include <QTableView>
#include <QTreeWidget>

namespace {

constexpr int InitGrid = 1003, CurveEnable = 1098, SystemWidth = 1100, CurveGrid = 1103, LoadButton = 1104,
              WithWidth = 1107;
constexpr int InitTab = 0, CurveTab = 20;
constexpr int TitleMiddle = 10; // pixels below the top of a window

/// The windows of the project, by the extension of their documents.
class Project
{
public:
    explicit Project(Robot& robot) : m_robot(robot) {}

    CView* View(const char* extension) const
    {
        for (const CKsMDIChildWnd* window : m_robot.Frame().Windows().All()) {
            CView* view = window->GetActiveView();
            if (view && view->GetDocument()->GetPathName().endsWith(QLatin1String(extension), Qt::CaseInsensitive))
                return view;
        }
        return nullptr;
    }
    void Activate(const char* extension)
    {
        if (auto* window = CKsMDIChildWnd::Of(View(extension)))
            m_robot.Click(window, QPoint(window->width() / 3, TitleMiddle));
    }
    QTableView* Page(int tab, int grid)
    {
        Activate(".hdkv");
        if (auto* sheet = View(".hdkv")->findChild<QTabWidget*>("sheet"))
            GoToTab(m_robot, sheet, tab);
        return m_robot.Control<QTableView>(grid);
    }
    QWidget* Map() const { return View(".kvnw")->findChild<QWidget*>("networkMap"); }
    QString Marked() const { return Map()->property("marked").toString(); }
    int OnMap() const { return Map()->property("placedCount").toInt(); }
    /// The map follows a change a moment later.
    bool Soon(const std::function<bool()>& fact)
    {
        QElapsedTimer timer;
        for (timer.start(); !fact() && timer.elapsed() < 3000;)
            m_robot.Settle();
        return fact();
    }

private:
    Robot& m_robot;
};

QString Place(QTableView* grid, int row)
{
    const auto cell = [&](int column) { return grid->model()->index(row, column).data(Qt::EditRole).toString(); };
    return cell(0) + u' ' + QString::number(cell(1).toDouble(), 'f', 1);
}

void ChooseLinesCommand(Robot& robot, const QString& text)
{
    for (const QAction* top : robot.Frame().menuBar()->actions()) {
        if (top->isEnabled() &&
            robot.ChooseFrom(top->menu(), [&](const QString& entry) { return entry.startsWith(text); }))
            return;
    }
    robot.Verify(false, "there is a command " + text);
}

void PickAndInsert(Robot& robot, Project& project)
{
    robot.Did("Pick the place in the middle of the map with the space bar, and insert it into the page in front");
    project.Activate(".kvnw");
    robot.Key(project.Map(), Qt::Key_Escape);
    robot.Key(project.Map(), Qt::Key_Space);
    const QString picked = project.Marked();
    robot.Verify(!picked.isEmpty(), "the map marks " + picked);
    auto* grid = project.Page(InitTab, InitGrid);
    const int before = grid->model()->rowCount(), onMap = project.OnMap();
    ChooseLinesCommand(robot, "Insert Location");
    robot.Verify(grid->model()->rowCount() == before + 1, "the page has a line more");
    robot.Verify(Place(grid, before) == picked, "the line is at " + Place(grid, before));
    robot.Verify(project.Soon([&] { return project.OnMap() == onMap + 1; }), "the map has a location more");
    robot.Picture("project");
}

void DeleteOnTheMap(Robot& robot, Project& project)
{
    robot.Did("Step to a location on the map with N, and delete it with Delete");
    auto* grid = project.Page(InitTab, InitGrid);
    const int before = grid->model()->rowCount(), onMap = project.OnMap();
    project.Activate(".kvnw");
    robot.Click(project.Map(), QPoint(3, 3)); // in the table beside it Delete would delete a branch
    robot.Key(project.Map(), Qt::Key_Escape);
    robot.Key(project.Map(), Qt::Key_N);
    const QString selected = project.Marked();
    robot.Verify(selected == Place(grid, 0), "the first initial condition is selected: " + selected);
    robot.Key(project.Map(), Qt::Key_Delete);
    robot.Verify(project.Soon([&] { return grid->model()->rowCount() == before - 1; }), "its line is gone");
    robot.Verify(project.Soon([&] { return project.OnMap() == onMap - 1; }), "and so is its symbol");
    grid = project.Page(InitTab, InitGrid);
    robot.Key(grid, Qt::Key_Z, Qt::ControlModifier);
    robot.Verify(grid->model()->rowCount() == before && Place(grid, 0) == selected, "Ctrl+Z brings the line back");
    robot.Verify(project.Soon([&] { return project.OnMap() == onMap; }), "and the symbol");
}

void ShowOnTheMap(Robot& robot, Project& project)
{
    robot.Did("Click a line and see its place on the map; change its chainage and see the map follow");
    project.Activate(".kvnw");
    robot.Key(project.Map(), Qt::Key_Escape);
    auto* grid = project.Page(InitTab, InitGrid);
    robot.ClickCell(grid, 0, 1);
    robot.ClickCell(grid, 2, 1);
    robot.Verify(project.Soon([&] { return project.Marked() == Place(grid, 2); }), "the map marks " + project.Marked());
    const int onMap = project.OnMap();
    robot.TypeToFocus("99999999");
    robot.KeyToFocus(Qt::Key_Tab);
    robot.Verify(project.Soon([&] { return project.OnMap() == onMap - 1; }), "a place beyond the river leaves the map");
    robot.Key(grid, Qt::Key_Z, Qt::ControlModifier);
    robot.Verify(project.Soon([&] { return project.OnMap() == onMap; }), "taken back it is there again");
}

void LoadCurves(Robot& robot, Project& project)
{
    robot.Did("Load branches, chainages, radius and channel width into the increments in curves");
    auto* grid = project.Page(CurveTab, CurveGrid);
    auto* enable = robot.Control<QCheckBox>(CurveEnable);
    if (enable && !enable->isChecked())
        robot.Key(enable, Qt::Key_Space);
    auto* systemWidth = robot.Control<QCheckBox>(SystemWidth);
    if (systemWidth && systemWidth->isChecked()) // else the column would be locked
        robot.Key(systemWidth, Qt::Key_Space);
    const int before = grid->model()->rowCount();
    auto* load = robot.Control(LoadButton);
    robot.WithDialog([&] { robot.Key(load, Qt::Key_Space); },
                     [&](QDialog& dialog) {
                         for (auto* option : dialog.findChildren<QRadioButton*>())
                             if (option->objectName().endsWith(QStringLiteral("_%1").arg(WithWidth)))
                                 robot.Key(option, Qt::Key_Space);
                         robot.Key(&dialog, Qt::Key_Return);
                     });
    const int after = grid->model()->rowCount();
    robot.Verify(after > before, QStringLiteral("%1 lines came").arg(after - before));
    const auto number = [&](int column) { return grid->model()->index(after - 1, column).data().toDouble(); };
    robot.Verify(number(3) > 0 && number(4) > 0,
                 QStringLiteral("width %1 m, radius %2 m").arg(number(3)).arg(number(4)));
    robot.Picture("project-curves");
}

} // namespace

void DriveProjectJob(Robot& robot)
{
    Project project(robot);
    robot.Did("Look at the project");
    const auto* tree = robot.Frame().findChild<QTreeWidget*>();
    robot.Verify(tree && tree->topLevelItemCount() == 1 && tree->topLevelItem(0)->childCount() == 3,
                 "the tree shows the project with three files");
    const bool open = project.View(".hdkv") && project.View(".kvnw") && project.View(".kvxs");
    robot.Verify(open, "parameters, network and cross sections are open");
    if (!open)
        return;
    robot.Choose("actionSideBySide");
    robot.Verify(project.Soon([&] { return project.OnMap() > 0; }),
                 QStringLiteral("the map shows %1 locations").arg(project.OnMap()));
    PickAndInsert(robot, project);
    DeleteOnTheMap(robot, project);
    ShowOnTheMap(robot, project);
    LoadCurves(robot, project);
}
