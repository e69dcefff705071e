// Branch and chainage stay at the left while a table scrolls sideways, and work there as anywhere else.
#include "page_fixture.h"

#include "grid/filter_fields.h"
#include "grid/frozen_columns.h"
#include "grid/grid_header.h"
#include "grid/grid_widths.h"

#include <QMenu>
#include <QScrollBar>
#include <QStyledItemDelegate>
#include <QTimer>

namespace {

/// A table that is wider than its window, with a locked column and all kinds of cells.
class WidePage : public CLocationPage
{
public:
    WidePage(CKavo0_hdDoc* document, CGenList& list) : CLocationPage(document, list)
    {
        auto* grid = new CGenGrid;
        (new QVBoxLayout(this))->addWidget(grid);
        GridColumns columns = Grid(grid);
        columns.BranchName({}).Chainage(
            {.locked = [](const void* row) { return static_cast<const HDEncroach*>(row)->Chainage == 200; }});
        for (const Field& field : list.Fields())
            columns.Value(field, {.width = 97});
    }
};

class FrozenColumnsTest : public PageTest
{
protected:
    enum Column
    {
        Name = 1,
        Chainage,
        Method,
        Banks,
        LeftOffset,
        Last = 15
    };
    FrozenColumnsTest()
    {
        for (int line = 0; line < 40; ++line) {
            HDEncroach record;
            record.RiverName = line % 3 ? "RHINE" : "ELBE";
            record.Chainage = line * 100 + (line % 2) / 3.0; // hides digits
            record.EncValues1[0] = line;
            lines.Add(record);
        }
        Open<WidePage>(lines);
        grid->Widths().SetChosen();    // pictures of two widths of the window have the same columns
        QApplication::processEvents(); // the scroll bar learns of them
    }
    ~FrozenColumnsTest() override { view.reset(); } // it shows lines that go with the test
    QModelIndex Cell(int row, int column) const { return grid->model()->index(row - 1, column - 1); }
    QRect Place(int row, int column) const { return grid->visualRect(Cell(row, column)); }
    QScrollBar& Bar() const { return *grid->horizontalScrollBar(); }
    int Frozen() const { return grid->Frozen().Width(); }
    /// Of the frozen columns, of the others: the room in which they are seen.
    QRect Room(int column) const
    {
        if (Bar().value() == 0)
            return grid->viewport()->rect();
        const QRect all = grid->viewport()->rect();
        return column <= Chainage ? all.intersected(QRect(0, 0, Frozen(), all.height()))
                                  : all.adjusted(Frozen(), 0, 0, 0);
    }
    void Widen(int width)
    {
        view->resize(width, view->height());
        QTest::qWait(1);
    }
    void ScrollBy(int steps)
    {
        Bar().setValue(steps);
        QApplication::processEvents();
    }
    void Mouse(QWidget* on, QEvent::Type type, QPoint at, Qt::KeyboardModifiers held = {})
    {
        const bool isMove = type == QEvent::MouseMove, isUp = type == QEvent::MouseButtonRelease;
        QMouseEvent event(type, at, on->mapToGlobal(at), isMove ? Qt::NoButton : Qt::LeftButton,
                          isUp ? Qt::NoButton : Qt::LeftButton, held);
        QApplication::sendEvent(on, &event);
    }
    void Drag(QWidget* on, QPoint from, QPoint to)
    {
        Mouse(on, QEvent::MouseButtonPress, from);
        Mouse(on, QEvent::MouseMove, (from + to) / 2);
        Mouse(on, QEvent::MouseMove, to);
        Mouse(on, QEvent::MouseButtonRelease, to);
    }
    /// Rows and columns of what is selected.
    QString Selected() const
    {
        const auto block = grid->SelectedBlock();
        return !block ? QString()
                      : QString("%1-%2, %3-%4")
                            .arg(block->top() + 1)
                            .arg(block->bottom() + 1)
                            .arg(block->left() + 1)
                            .arg(block->right() + 1);
    }

    CGenParamList<HDEncroach> lines{"Lines"};
};

} // namespace

TEST_F(FrozenColumnsTest, LooksAsUnscrolledAndTheOthersGoBelow)
{
    const auto partOf = [](const QImage& shot, const QRect& part) {
        const double scale = shot.devicePixelRatio();
        return shot.copy(QRect(part.topLeft() * scale, part.size() * scale));
    };
    grid->setFocus();
    for (const int current : {int(Name), int(LeftOffset), 0}) {
        grid->SetCurrentCell(4, current);
        grid->selectionModel()->select({Cell(4, Name), Cell(6, LeftOffset)}, QItemSelectionModel::ClearAndSelect);
        grid->setEnabled(current != 0);
        QApplication::processEvents();
        for (QWidget* part : {grid->viewport(), grid->Header().viewport()}) {
            Widen(2000);
            ASSERT_EQ(Frozen(), 0) << "nothing is scrolled";
            const QImage wide = part->grab().toImage();
            Widen(500);
            for (const int scrolled : {1, 150, Bar().maximum()}) {
                ScrollBy(scrolled);
                ASSERT_GT(Frozen(), 100);
                const QImage shot = part->grab().toImage();
                const QRect frozen(0, 0, Frozen() - 1, part->height());
                const QRect others = part->rect().adjusted(Frozen(), 0, 0, 0);
                EXPECT_EQ(partOf(shot, frozen), partOf(wide, frozen)) << scrolled;
                EXPECT_EQ(partOf(shot, others), partOf(wide, others.translated(scrolled, 0))) << scrolled;
            }
            ScrollBy(0);
        }
    }
}

TEST_F(FrozenColumnsTest, WhatIsOnTheScreenIsWhatIsPaintedAfresh)
{
    const auto shot = [this] {
        QApplication::processEvents();
        return view->screen()->grabWindow(view->winId()).toImage();
    };
    const auto expectSame = [&](const std::string& after) {
        const QImage before = shot();
        for (QWidget* part : {static_cast<QWidget*>(view.get()), grid->viewport(), grid->Header().viewport()})
            part->update();
        EXPECT_EQ(shot(), before) << after;
    };
    grid->setFocus();
    for (const int scrolled : {200, 260, 30, 0, 500, 40}) {
        ScrollBy(scrolled);
        expectSame("scrolled to " + std::to_string(scrolled));
    }
    Mouse(grid->Header().viewport(), QEvent::MouseButtonPress, {Place(1, Chainage).center().x(), 8});
    expectSame("header pressed");
    Mouse(grid->Header().viewport(), QEvent::MouseButtonRelease, {Place(1, Chainage).center().x(), 8});
    expectSame("header let go");
    for (const int column : {int(Name), int(LeftOffset)}) {
        Type(2, column, "7");
        for (const int scrolled : {60, 20, 90}) {
            ScrollBy(scrolled);
            expectSame("with an editor in column " + std::to_string(column) + ", at " + std::to_string(scrolled));
        }
        QTest::keyClick(Editor(), Qt::Key_Escape);
    }
    ScrollBy(40);
    for (const int last : {4, 2}) {
        grid->selectionModel()->select({Cell(2, Name), Cell(last, Chainage)}, QItemSelectionModel::ClearAndSelect);
        expectSame("selected to line " + std::to_string(last));
    }
    for (int line = 0; line < 3; ++line)
        lines.GetAt(std::size_t(line)).RiverName = "OTHER";
    emit grid->model()->dataChanged(Cell(1, Name), Cell(3, Name));
    expectSame("changed");
    const int border = grid->columnWidth(0);
    Drag(grid->Header().viewport(), {border, 8}, {border + 15, 8});
    QTest::qWait(20); // the base follows later
    expectSame("wider");
}

TEST_F(FrozenColumnsTest, TheCellBelowTheMouseIsPaintedAsSuch)
{
    class Watch : public QStyledItemDelegate
    {
    public:
        void paint(QPainter*, const QStyleOptionViewItem& option, const QModelIndex& cell) const override
        {
            if (option.state.testFlag(QStyle::State_MouseOver))
                hovered << cell;
        }
        mutable QList<QModelIndex> hovered;
    } watch;
    QAbstractItemDelegate* const own = grid->itemDelegate();
    grid->setItemDelegate(&watch);
    ScrollBy(250);
    QCursor::setPos(grid->viewport()->mapToGlobal(Place(3, Chainage).center()));
    QHoverEvent enters(QEvent::HoverEnter, QPointF(1, 1), QPointF(1, 1), QPointF(-1, -1));
    QApplication::sendEvent(grid->viewport(), &enters);
    grid->viewport()->setAttribute(Qt::WA_UnderMouse);
    watch.hovered.clear();
    grid->viewport()->grab();
    EXPECT_TRUE(watch.hovered.contains(Cell(3, Chainage)));
    EXPECT_FALSE(watch.hovered.contains(Cell(3, Name)));
    grid->setItemDelegate(own);
}

TEST_F(FrozenColumnsTest, EveryCellIsFoundWhereItIsSeenAndOnlyThere)
{
    for (const int scrolled : {0, 60, 333, Bar().maximum()}) {
        ScrollBy(scrolled);
        SCOPED_TRACE(scrolled);
        QList<QRect> seen;
        for (int column = Name; column <= Last; ++column) {
            const QRect place = Place(2, column) & grid->viewport()->rect();
            if (place.isEmpty())
                continue;
            for (const QPoint& point : {place.topLeft(), place.center(), place.bottomRight()})
                EXPECT_EQ(grid->indexAt(point), Cell(2, column));
            for (const QRect& other : seen)
                EXPECT_FALSE(other.intersects(place)) << column;
            seen << place;
        }
    }
}

TEST_F(FrozenColumnsTest, ThereMayBeNoLineBesideThem)
{
    ScrollBy(200);
    ASSERT_GT(Frozen(), 100);
    grid->ChangeView([](CGridModel& model) { model.Filter({"nobody"}); });
    ScrollBy(100);
    const QImage empty = grid->viewport()->grab().toImage();
    EXPECT_EQ(grid->RowCount(), 0);
    EXPECT_EQ(empty.pixelColor(20, 5), empty.pixelColor(20, empty.height() - 5)) << "nothing is painted";
}

TEST_F(FrozenColumnsTest, TheCurrentCellIsNeverCovered)
{
    for (const int scrolled : {0, 120, Bar().maximum()}) {
        for (int column = Name; column <= Last; ++column) {
            ScrollBy(scrolled);
            const QRect before = Place(3, column);
            const bool wasInSight =
                Room(column).contains(before) && before.width() + 1 == grid->columnWidth(column - 1);
            grid->SetCurrentCell(3, column);
            EXPECT_TRUE(!wasInSight || Bar().value() == scrolled) << scrolled << ' ' << column;
            const QRect place = Place(3, column);
            EXPECT_TRUE(Room(column).contains(place)) << scrolled << ' ' << column;
            EXPECT_EQ(place.width() + 1, grid->columnWidth(column - 1)) << "the whole cell";
            if (column <= Chainage) {
                EXPECT_EQ(Bar().value(), scrolled) << "it was in sight";
            }
        }
    }
    grid->SetCurrentCell(3, Last);
    while (grid->CurrentColumn() > Method) {
        QTest::keyClick(grid, Qt::Key_Left);
        EXPECT_TRUE(Room(Method).contains(Place(3, grid->CurrentColumn()))) << grid->CurrentColumn();
    }
    QTest::keyClick(grid, Qt::Key_End);
    EXPECT_EQ(Current(), std::pair(3, int(Last)));
    EXPECT_EQ(Bar().value(), Bar().maximum());
    EXPECT_EQ(Bar().pageStep(), grid->viewport()->width() - Frozen()) << "a page is what is seen of the others";
    grid->GotoLine(30);
    EXPECT_EQ(Current(), std::pair(30, int(Name))) << "the first column in sight";
    EXPECT_EQ(Bar().value(), Bar().maximum());
}

TEST_F(FrozenColumnsTest, TheMouseSelectsAcrossTheEdge)
{
    ScrollBy(250);
    const int inSight = grid->indexAt({Frozen() + 60, 5}).column() + 1;
    ASSERT_GT(inSight, int(Method));
    const auto at = [this](int row, int column) { return Place(row, column).center(); };
    QWidget* cells = grid->viewport();
    Drag(cells, at(2, Chainage), at(4, inSight));
    EXPECT_EQ(Selected(), QString("2-4, 2-%1").arg(inSight)) << "with the columns that are covered";
    Drag(cells, at(5, inSight), at(2, Name));
    EXPECT_EQ(Selected(), QString("2-5, 1-%1").arg(inSight));
    Mouse(cells, QEvent::MouseButtonPress, at(2, Chainage));
    Bar().setValue(Bar().maximum()); // as when the mouse is held at the right
    Mouse(cells, QEvent::MouseMove, at(3, Last));
    Mouse(cells, QEvent::MouseButtonRelease, at(3, Last));
    EXPECT_EQ(Selected(), "2-3, 2-15");

    grid->SetCurrentCell(3, Method); // as Tab does, and not the mouse
    ScrollBy(Bar().maximum());
    QTest::mouseClick(cells, Qt::LeftButton, Qt::ShiftModifier, at(6, Last));
    EXPECT_EQ(Selected(), "3-6, 3-15") << "from a cell that is covered now";
    QTest::mouseClick(cells, Qt::LeftButton, Qt::ShiftModifier, at(2, Chainage));
    EXPECT_EQ(Selected(), "2-3, 2-3");
}

TEST_F(FrozenColumnsTest, ADragDownTheFirstColumnScrollsNothingSideways)
{
    ScrollBy(250);
    Mouse(grid->viewport(), QEvent::MouseButtonPress, {5, Place(2, Name).center().y()});
    for (const int row : {3, 4, 4, 4}) {
        const QPoint at(5, Place(row, Name).center().y());
        QCursor::setPos(grid->viewport()->mapToGlobal(at));
        Mouse(grid->viewport(), QEvent::MouseMove, at);
        QTest::qWait(150); // in which it would begin to
    }
    Mouse(grid->viewport(), QEvent::MouseButtonRelease, {5, Place(4, Name).center().y()});
    EXPECT_EQ(Bar().value(), 250);
    EXPECT_EQ(Selected(), "2-4, 1-1");
}

TEST_F(FrozenColumnsTest, EditorsStandInTheirCellsAndGoBelow)
{
    ScrollBy(200);
    Type(2, Name, "weser");
    EXPECT_EQ(Editor()->geometry(), Place(2, Name));
    ScrollBy(320);
    EXPECT_EQ(Editor()->geometry(), Place(2, Name)) << "stays with its cell";
    QTest::keyClick(Editor(), Qt::Key_Return);
    EXPECT_EQ(lines.GetAt(1).RiverName, "WESER");
    EXPECT_EQ(Current(), std::pair(2, int(Chainage)));
    EXPECT_EQ(Bar().value(), 320);

    Type(2, LeftOffset, "12");
    QWidget* const editor = Editor();
    for (const int further : {40, 60, 200}) {
        Bar().setValue(Bar().value() + further);
        const QRect inSight = editor->geometry() & grid->viewport()->rect();
        EXPECT_EQ(editor->geometry(), Place(2, LeftOffset));
        EXPECT_TRUE(inSight.isEmpty() || Room(LeftOffset).contains(inSight)) << "goes below the frozen ones";
    }
    ASSERT_TRUE(editor->hasFocus());
    QTest::keyClicks(editor, "5");
    QTest::keyClick(editor, Qt::Key_Tab);
    EXPECT_EQ(lines.GetAt(1).EncValues1[0], 125);
    EXPECT_TRUE(Room(LeftOffset).contains(Place(2, LeftOffset + 1))) << "the next cell comes into sight";
}

TEST_F(FrozenColumnsTest, HeadersAreSeenPressedAndResized)
{
    Widen(700);
    ScrollBy(280);
    QWidget* headers = grid->Header().viewport();
    const auto middle = [this](int column) { return QPoint(Place(1, column).center().x(), 8); };
    QTest::mouseClick(headers, Qt::LeftButton, {}, middle(Chainage));
    EXPECT_EQ(Selected(), "1-40, 2-2");
    QTest::mouseDClick(headers, Qt::LeftButton, {}, middle(Name));
    EXPECT_EQ(grid->TextAt(1, Name), "ELBE");
    EXPECT_EQ(grid->Model()->SortedBy(), std::vector<SortKey>{{0}});
    EXPECT_EQ(Bar().value(), 280);

    const int before = grid->columnWidth(Chainage - 1), edge = Frozen();
    for (const int beside : {-2, 1}) { // a border has two sides
        Drag(headers, {Frozen() + beside, 8}, {Frozen() + beside + 20, 8});
        Drag(headers, {Frozen() + beside, 8}, {Frozen() + beside - 10, 8});
    }
    EXPECT_EQ(grid->columnWidth(Chainage - 1), before + 20);
    EXPECT_EQ(Frozen(), edge + 20);
    const auto keys = grid->Model()->SortedBy();
    grid->setColumnWidth(Chainage - 1, before + 20);
    QTest::mouseDClick(headers, Qt::LeftButton, {}, {Frozen() + 1, 8});
    EXPECT_LT(grid->columnWidth(Chainage - 1), before) << "as wide as its texts";
    EXPECT_EQ(grid->Model()->SortedBy(), keys) << "not by the column that is covered there";
    grid->setColumnWidth(Chainage - 1, before + 20);
    Drag(headers, {grid->columnWidth(0) - 1, 8}, {grid->columnWidth(0) - 13, 8});
    EXPECT_EQ(Frozen(), edge + 8);
    Drag(headers, {grid->columnWidth(0) - 1, 8}, {-300, 8});
    EXPECT_EQ(grid->columnWidth(0), grid->Header().minimumSectionSize()) << "no narrower than others";
    grid->setColumnWidth(0, 150);
    QTimer::singleShot(0, grid, [] {
        if (auto* menu = qobject_cast<QMenu*>(QApplication::activePopupWidget())) {
            menu->actions().back()->trigger();
            menu->close();
        }
    });
    QContextMenuEvent asks(QContextMenuEvent::Mouse, {10, 8}, headers->mapToGlobal(QPoint(10, 8)));
    QApplication::sendEvent(headers, &asks);
    EXPECT_LT(grid->columnWidth(0), 150) << "the menu is that of the frozen column: fitted";
    grid->setColumnWidth(0, 90);
    QTest::mousePress(headers, Qt::RightButton, {}, {89, 8});
    Mouse(headers, QEvent::MouseMove, {120, 8});
    QTest::mouseRelease(headers, Qt::RightButton, {}, {120, 8});
    EXPECT_EQ(grid->columnWidth(0), 90) << "by the left button";
    for (const auto& [x, shape] : {std::pair(5, Qt::ArrowCursor), std::pair(grid->columnWidth(0), Qt::SplitHCursor),
                                   std::pair(grid->columnWidth(0) + 30, Qt::ArrowCursor)}) {
        QMouseEvent over(QEvent::MouseMove, QPoint(x, 8), headers->mapToGlobal(QPoint(x, 8)), Qt::NoButton,
                         Qt::NoButton, {});
        QApplication::sendEvent(headers, &over);
        EXPECT_EQ(grid->Header().cursor().shape(), shape) << x;
    }
}

TEST_F(FrozenColumnsTest, FilterFieldsStandBelowTheirHeaders)
{
    grid->Header().Fields().Enter(Name - 1);
    for (const int scrolled : {0, 75, Bar().maximum()}) {
        ScrollBy(scrolled);
        for (int column = Name; column <= Last; ++column) {
            const auto* field = grid->Header().findChild<QWidget*>(QString("filter%1").arg(column));
            const QRect place = Place(1, column);
            EXPECT_EQ(field->x(), place.x()) << scrolled << ' ' << column;
            EXPECT_EQ(field->width(), place.width() + 1) << scrolled << ' ' << column;
        }
    }
    auto* field = grid->Header().findChild<QWidget*>("filter1");
    QTest::keyClicks(field, "elb");
    EXPECT_EQ(grid->RowCount(), 14);
    EXPECT_EQ(Bar().value(), Bar().maximum());
    grid->Header().findChild<QWidget*>("filter5")->setFocus();
    EXPECT_TRUE(Room(LeftOffset).contains(Place(1, LeftOffset))) << "whoever goes to a field sees its column";
}

TEST_F(FrozenColumnsTest, NothingIsFrozenWhereTheOthersWouldHaveNoRoom)
{
    ScrollBy(100);
    ASSERT_GT(Frozen(), 0);
    const int edge = Frozen();
    Widen(view->width() - (grid->viewport()->width() - 2 * edge) - 2);
    EXPECT_EQ(Frozen(), 0);
    EXPECT_LT(Place(1, Name).left(), 0);
    grid->SetCurrentCell(1, Name);
    EXPECT_EQ(Bar().value(), 0) << "scrolled to, as any other";
    ScrollBy(100);
    Widen(view->width() + 4);
    EXPECT_EQ(Frozen(), edge);
    EXPECT_EQ(Place(1, Name).left(), 0);
    const int width = grid->columnWidth(0);
    grid->setColumnWidth(0, 400);
    EXPECT_EQ(Frozen(), 0);
    grid->setColumnWidth(0, width);
    EXPECT_EQ(Frozen(), edge);
    grid->setLayoutDirection(Qt::RightToLeft);
    EXPECT_EQ(Frozen(), 0) << "the left is where the lines end";
}
