#include "random_user.h"

#include "grid/grid_keys.h"

#include "module/data_tables.h"
#include "module/sheet.h"
#include "open_editor.h"
#include "pages/framework/page.h"

#include <QAbstractButton>
#include <QApplication>
#include <QCheckBox>
#include <QClipboard>
#include <QComboBox>
#include <QDialog>
#include <QDialogButtonBox>
#include <QHeaderView>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTest>
#include <QTimer>

namespace {

bool IsUsable(const QWidget* widget)
{
    return widget->isVisible() && widget->isEnabled();
}

QString NameOf(const QWidget& page, const QWidget& control)
{
    return page.objectName() + '.' + control.objectName();
}

} // namespace

RandomUser::RandomUser(CKavo0_hdView& view, CView& other, unsigned seed) : m_view(view), m_other(other), m_random(seed)
{
}

CGenPropertyPage& RandomUser::Page() const
{
    return *m_view.ActivePage();
}

void RandomUser::Press(int key, Qt::KeyboardModifiers modifiers)
{
    QWidget* focus = QApplication::focusWidget();
    QTest::keyClick(focus ? focus : &Page(), Qt::Key(key), modifiers);
}

void RandomUser::PressKeys(const QString& keys)
{
    for (const QChar key : keys) // each where the focus is by then: the first one may open an editor
        QTest::keyClick(QApplication::focusWidget(), key.toLatin1());
}

void RandomUser::GoToPage(int tab)
{
    m_view.Sheet()->SetActivePage(tab);
    QCoreApplication::processEvents();
}

void RandomUser::VisitEveryPage()
{
    for (int tab = m_view.Sheet()->PageCount() - 1; tab >= 0; --tab)
        GoToPage(tab);
}

/// With the focus outside the page these are keys of the main frame's menu.
void RandomUser::UndoRedo(bool undo)
{
    m_done = undo ? "undo" : "redo";
    if (Page().isAncestorOf(QApplication::focusWidget()))
        Press(undo ? Qt::Key_Z : Qt::Key_Y, Qt::ControlModifier);
    else
        Page().UndoRedo(undo);
    QCoreApplication::processEvents();
}

void RandomUser::DoSomething()
{
    m_typed.clear();
    m_done.clear();
    static constexpr void (RandomUser::*Things[])() = {
        &RandomUser::TypeIntoCell,  &RandomUser::TypeIntoCell,  &RandomUser::TypeIntoCell,  &RandomUser::TypeIntoCell,
        &RandomUser::TypeIntoField, &RandomUser::TypeIntoField, &RandomUser::ActOnControl,  &RandomUser::ActOnControl,
        &RandomUser::Paste,         &RandomUser::InsertLine,    &RandomUser::DeleteLines,   &RandomUser::Request,
        &RandomUser::ChangePage,    &RandomUser::ChangePage,    &RandomUser::CommandInGrid, &RandomUser::CommandInGrid};
    (this->*Things[Pick(std::size(Things))])();
    QCoreApplication::processEvents();
}

void RandomUser::ChangePage()
{
    GoToPage(Pick(m_view.Sheet()->PageCount()));
    m_done = QString("show ") + Page().objectName();
}

CGenGrid* RandomUser::SomeGrid()
{
    auto grids = Page().findChildren<CGenGrid*>();
    grids.removeIf([](const CGenGrid* grid) { return !IsUsable(grid) || !grid->Model()->Rows(); });
    return grids.isEmpty() ? nullptr : grids[Pick(int(grids.size()))];
}

/// A click on a cell that is in sight, or the keys to one that is not.
bool RandomUser::GoToSomeCell(CGenGrid& grid)
{
    if (grid.RowCount() == 0)
        return false;
    const QModelIndex cell = grid.model()->index(Pick(std::min(grid.RowCount(), 12)), Pick(grid.ColumnCount()));
    grid.scrollTo(cell);
    if (grid.Model()->Columns()[std::size_t(cell.column())].ActsAtOnce()) { // a click would act
        grid.setFocus();
        grid.SetCurrentCell(cell.row() + 1, cell.column() + 1);
    } else {
        QTest::mouseClick(grid.viewport(), Qt::LeftButton, {}, grid.visualRect(cell).center());
    }
    return grid.currentIndex() == cell && QApplication::focusWidget() == &grid;
}

QString RandomUser::SomeText()
{
    static const char* const texts[] = {"river", "alder", "1", "2", "3", "0.25", "12.5", "1234.567", "0"};
    return QString::fromLatin1(texts[Pick(std::size(texts))]);
}

void RandomUser::TypeIntoCell()
{
    CGenGrid* grid = SomeGrid();
    if (!grid || !GoToSomeCell(*grid))
        return;
    const QModelIndex cell = grid->currentIndex();
    const QString where = QString("%1 %2,%3").arg(NameOf(Page(), *grid)).arg(cell.row() + 1).arg(cell.column() + 1);
    if (grid->Model()->Columns()[std::size_t(cell.column())].ActsAtOnce()) {
        m_done = "space on " + where;
        if (grid->Model()->Columns()[std::size_t(cell.column())].Kind() != CellKind::Button)
            Press(Qt::Key_Space);
        return;
    }
    const QString text = Pick(8) == 0 ? QString() : SomeText();
    m_done = "type '" + text + "' into " + where;
    if (text.isEmpty()) {
        Press(Qt::Key_F2);
        if (!OpenEditor(*grid))
            return;
        Press(Qt::Key_A, Qt::ControlModifier);
        Press(Qt::Key_Backspace);
    } else {
        PressKeys(text);
        if (!OpenEditor(*grid))
            return; // locked
    }
    const CellKind kind = grid->Model()->Columns()[std::size_t(cell.column())].Kind();
    if (kind != CellKind::Choice && kind != CellKind::TextChoice) // those take an entry that begins so
        m_typed = text;
    Leave(true);
}

/// The ways to end typing.
void RandomUser::Leave(bool isCell)
{
    switch (Pick(6)) {
    case 0:
        m_done += ", return";
        m_typed.clear(); // the last cell appends a line
        return Press(Qt::Key_Return);
    case 1:
        m_done += ", escape";
        m_typed.clear();
        return Press(Qt::Key_Escape);
    case 2:
        m_done += ", undo";
        m_typed.clear();
        return Press(Qt::Key_Z, Qt::ControlModifier);
    case 3:
        m_done += ", another page";
        return GoToPage((m_view.Sheet()->currentIndex() + 1) % m_view.Sheet()->PageCount());
    default:
        if (isCell) {
            m_done += ", up";
            Press(Qt::Key_Return, Qt::ShiftModifier);
        } else {
            m_done += ", tab";
            Press(Qt::Key_Tab);
        }
    }
}

void RandomUser::TypeIntoField()
{
    auto fields = Page().findChildren<QLineEdit*>();
    fields.removeIf([](const QLineEdit* field) {
        return !IsUsable(field) || field->isReadOnly() || qobject_cast<QComboBox*>(field->parent()) ||
               qobject_cast<CGenGrid*>(field->parent()->parent());
    });
    if (fields.isEmpty())
        return;
    QLineEdit* field = fields[Pick(int(fields.size()))];
    field->setFocus();
    Press(Qt::Key_A, Qt::ControlModifier);
    const QString text = SomeText();
    m_done = "type '" + text + "' into " + NameOf(Page(), *field);
    PressKeys(text);
    m_typed = text;
    Leave(false);
}

void RandomUser::ActOnControl()
{
    QList<QWidget*> controls;
    for (auto* button : Page().findChildren<QAbstractButton*>())
        if (IsUsable(button) && (qobject_cast<QCheckBox*>(button) || qobject_cast<QRadioButton*>(button) ||
                                 button->parent()->objectName() == QLatin1String("CEncroachPage")))
            controls << button;
    for (auto* list : Page().findChildren<QComboBox*>())
        if (IsUsable(list) && !qobject_cast<CGenGrid*>(list->parent()->parent()))
            controls << list;
    if (controls.isEmpty())
        return;
    QWidget* control = controls[Pick(int(controls.size()))];
    m_done = "use " + NameOf(Page(), *control);
    control->setFocus();
    if (qobject_cast<QComboBox*>(control))
        Press(Pick(2) ? Qt::Key_Up : Qt::Key_Down);
    else
        Press(Qt::Key_Space);
}

void RandomUser::Paste()
{
    CGenGrid* grid = SomeGrid();
    if (!grid || !GoToSomeCell(*grid))
        return;
    const QString cells = Pick(2) ? "1\t2\n3\t4" : "alder\t7\nbrook\t12.5\nalder\t";
    QApplication::clipboard()->setText(cells);
    m_done =
        QString("paste into %1 %2,%3").arg(NameOf(Page(), *grid)).arg(grid->CurrentRow()).arg(grid->CurrentColumn());
    const bool leavesOut = Pick(2);
    QTimer::singleShot(0, grid, [leavesOut] { // what is doubtful is asked about
        auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
        if (!dialog)
            return;
        auto* box = dialog->findChild<QCheckBox*>("leaveOut");
        if (leavesOut && box && box->isVisible())
            box->click();
        if (auto* paste = dialog->findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok); paste->isEnabled())
            paste->click();
        else
            dialog->reject();
    });
    Press(Qt::Key_V, Qt::ControlModifier);
    QCoreApplication::processEvents();
    if (!QApplication::focusWidget()) { // no window manager gives it back
        grid->activateWindow();
        grid->setFocus();
        QCoreApplication::processEvents();
    }
}

/// By the line numbers.
void RandomUser::SelectLines(CGenGrid& grid)
{
    const int first = Pick(std::min(grid.RowCount(), 6)), last = std::min(first + Pick(3), grid.RowCount() - 1);
    grid.scrollToTop();
    const auto click = [&](int row, Qt::KeyboardModifiers modifiers) {
        const QHeaderView& numbers = *grid.verticalHeader();
        QTest::mouseClick(numbers.viewport(), Qt::LeftButton, modifiers, {5, numbers.sectionViewportPosition(row) + 5});
    };
    click(first, {});
    if (last > first)
        click(last, Qt::ShiftModifier);
    grid.setFocus();
    m_done = QString("lines %1-%2 of %3").arg(first + 1).arg(last + 1).arg(NameOf(Page(), grid));
}

void RandomUser::InsertLine()
{
    CGenGrid* grid = SomeGrid();
    if (!grid)
        return;
    grid->setFocus();
    if (Pick(2) && grid->RowCount() > 0)
        SelectLines(*grid);
    m_done += " insert in " + NameOf(Page(), *grid);
    Press(Qt::Key_Insert);
}

void RandomUser::DeleteLines()
{
    CGenGrid* grid = SomeGrid();
    if (!grid || grid->RowCount() == 0)
        return;
    SelectLines(*grid);
    m_done += " delete";
    Press(Qt::Key_Delete);
}

/// Commands on lines and cells that ask nothing, and those that only change what is seen.
void RandomUser::CommandInGrid()
{
    static constexpr GridAction actions[] = {
        GridAction::InsertAbove, GridAction::InsertBelow,   GridAction::Duplicate, GridAction::Duplicate,
        GridAction::MoveUp,      GridAction::MoveDown,      GridAction::MoveDown,  GridAction::Cut,
        GridAction::Clear,       GridAction::ResetToGlobal, GridAction::FillDown,  GridAction::SortAscending,
        GridAction::SortByPlace, GridAction::FileOrder,     GridAction::FileOrder, GridAction::RevertToSaved};
    CGenGrid* grid = SomeGrid();
    if (!grid || !GoToSomeCell(*grid))
        return;
    if (Pick(2))
        SelectLines(*grid);
    const GridAction action = actions[Pick(std::size(actions))];
    m_done += QString(" %1 in %2").arg(NameOf(action), NameOf(Page(), *grid));
    const QKeyCombination key = KeyOf(action)[0];
    Press(key.key(), key.keyboardModifiers());
}

void RandomUser::Request()
{
    const int type = Pick(HDDataTypeCount);
    const HDDataTable& table = *FindDataTable(type);
    CGenList& list = table.list(m_view.GetDocument()->Parameters());
    auto item = std::make_unique<CKvr_CBE_ModelDataItem>();
    item->type = type;
    item->branch = "MAIN";
    item->chainage = Pick(100);
    CObList objects;
    CKSComm_Package package;
    package.view = &m_other;
    package.objects = &objects;
    const auto send = [&](WPARAM request) {
        m_view.WindowProc(KsMessage::BetweenEditors(), request, reinterpret_cast<LPARAM>(&package));
    };
    switch (Pick(3)) {
    case 0:
        m_done = QString("request of all data");
        return send(KsRequest::GetData);
    case 1:
        m_done = QString("request to insert into table %1").arg(type);
        objects.push_back(std::move(item));
        return send(KsRequest::InsertData);
    default:
        m_done = QString("request to delete from table %1").arg(type);
        if (list.IsEmpty())
            return;
        const HD_RiverPos& record = list.GetAt(std::size_t(Pick(int(list.GetCount()))));
        item->branch = QString::fromStdString(record.RiverName);
        item->chainage = record.Chainage;
        objects.push_back(std::move(item));
        return send(KsRequest::DeleteData);
    }
}
