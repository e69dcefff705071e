#include "drive/page_tour.h"

#include "drive/robot.h"
#include "shell/main_frame.h"

#include <QAbstractButton>
#include <QAbstractItemModel>
#include <QApplication>
#include <QComboBox>
#include <QLineEdit>
#include <QTabBar>
#include <QTabWidget>
#include <QTableView>

namespace {

QTabWidget* Sheet(Robot& robot)
{
    auto* view = robot.Frame().GetActiveView();
    return view ? view->findChild<QTabWidget*>("sheet") : nullptr;
}

/// The controls of a page that stand for values, numbered as in its dialog, those that can be changed now.
template <typename Widget>
Widget* FirstControl(QWidget* page, const char* className)
{
    for (Widget* widget : page->findChildren<Widget*>()) {
        const bool numbered = widget->objectName().section('_', -1).toInt() > 0;
        if (numbered && widget->inherits(className) && widget->isVisible() && widget->isEnabled())
            return widget;
    }
    return nullptr;
}

QString TextOf(const QWidget* control)
{
    if (const auto* edit = qobject_cast<const QLineEdit*>(control))
        return edit->text();
    if (const auto* box = qobject_cast<const QComboBox*>(control))
        return box->currentText();
    const auto* button = qobject_cast<const QAbstractButton*>(control);
    return button && button->isChecked() ? "checked" : "not checked";
}

QTableView* FirstGrid(QWidget* page)
{
    return FirstControl<QTableView>(page, "CGenGrid");
}

/// Changes the first field, list or box that the page offers, by keyboard; null when it has none. A box beside a table
/// is left alone: it may hide tables, here and on other pages.
QWidget* ChangeControl(Robot& robot, QWidget* page)
{
    QLineEdit* edit = FirstControl<QLineEdit>(page, "CCtrlEdit");
    const bool integer = !edit && (edit = FirstControl<QLineEdit>(page, "CKsEditLong"));
    if (edit) {
        robot.ClickMiddle(edit);
        robot.Key(edit, Qt::Key_A, Qt::ControlModifier);
        robot.Type(edit, integer ? "17" : edit->text() == "0.75" ? "0.85" : "0.75");
        robot.Key(edit, Qt::Key_Tab);
        return edit;
    }
    if (auto* box = FirstControl<QComboBox>(page, "QComboBox")) {
        robot.ClickMiddle(box); // opens the list
        robot.Key(box->view(), box->currentIndex() + 1 < box->count() ? Qt::Key_Down : Qt::Key_Up);
        robot.Key(box->view(), Qt::Key_Return);
        return box;
    }
    if (auto* box = FirstControl<QAbstractButton>(page, "QCheckBox"); box && !FirstGrid(page)) {
        robot.Click(box, QPoint(8, box->height() / 2));
        return box;
    }
    return nullptr;
}

void ChangeCell(Robot& robot, QWidget* page, PageChange& change)
{
    auto* grid = FirstGrid(page);
    if (!grid || grid->model()->rowCount() == 0)
        return;
    auto* model = grid->model();
    for (int column = model->columnCount() - 1; column > 0; --column) {
        const QModelIndex index = model->index(0, column);
        bool number = false;
        index.data(Qt::EditRole).toString().toDouble(&number);
        if (!number || !(index.flags() & Qt::ItemIsEditable))
            continue;
        robot.ClickCell(grid, 0, column);
        robot.TypeToFocus(index.data(Qt::EditRole).toString() == "3" ? "4" : "3");
        robot.KeyToFocus(Qt::Key_Return);
        change.row = 0;
        change.column = column;
        change.cellText = model->index(0, column).data().toString();
        return;
    }
}

} // namespace

QWidget* GoToTab(Robot& robot, QTabWidget* sheet, int tab)
{
    const QPoint middle = sheet->tabBar()->tabRect(tab).center();
    robot.Click(sheet->tabBar(), middle);
    robot.Verify(sheet->currentIndex() == tab, QStringLiteral("the page \"%1\" is in front").arg(sheet->tabText(tab)));
    return sheet->currentWidget();
}

std::vector<PageChange> ChangeEveryPage(Robot& robot)
{
    std::vector<PageChange> changes;
    auto* sheet = Sheet(robot);
    robot.Verify(sheet != nullptr, "the document shows its sheet");
    for (int tab = 0; sheet && tab < sheet->count(); ++tab) {
        PageChange change;
        change.tab = tab;
        change.page = sheet->tabText(tab);
        QWidget* page = GoToTab(robot, sheet, tab);
        if (QWidget* control = ChangeControl(robot, page)) {
            change.control = control->objectName();
            change.controlText = TextOf(control);
        }
        ChangeCell(robot, page, change);
        robot.Did(QStringLiteral("%1: %2 is %3, line 1 column %4 is %5")
                      .arg(change.page, change.control, change.controlText)
                      .arg(change.column + 1)
                      .arg(change.cellText));
        robot.Picture(QStringLiteral("page-%1").arg(tab + 1, 2, 10, QLatin1Char('0')));
        changes.push_back(change);
    }
    return changes;
}

void VerifyEveryPage(Robot& robot, const std::vector<PageChange>& changes)
{
    for (const PageChange& change : changes) {
        QWidget* page = GoToTab(robot, Sheet(robot), change.tab);
        if (!change.control.isEmpty()) {
            auto* control = page->findChild<QWidget*>(change.control);
            robot.Verify(control && TextOf(control) == change.controlText,
                         QStringLiteral("%1: %2 is %3").arg(change.page, change.control, change.controlText));
        }
        auto* grid = FirstGrid(page);
        if (change.row >= 0)
            robot.Verify(grid && grid->model()->index(change.row, change.column).data() == change.cellText,
                         QStringLiteral("%1: line 1 column %2 is %3")
                             .arg(change.page)
                             .arg(change.column + 1)
                             .arg(change.cellText));
    }
}
