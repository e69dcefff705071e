// The pages of user-defined marks, increment curves and sand bars: columns that come and go, a global row, locks.
#include "page_fixture.h"
#include "pages/page_table.h"

#include "data/hd_file.h"
#include "grid/grid_search.h"
#include "pages/location_loader.h"

#include <QCheckBox>
#include <QClipboard>
#include <QRadioButton>
#include <QSignalSpy>

class MarkPagesTest : public PageTest
{
protected:
    QStringList Text() const { return QString::fromStdString(HDFileText(document.Parameters())).split('\n'); }
    HDWLMark& AddMark(const char* name, double chainage, std::vector<double> levels)
    {
        HDWLMark mark;
        mark.RiverName = name;
        mark.Chainage = chainage;
        mark.MarkLevels = std::move(levels);
        return document.Parameters().WaterLevelMarkList.Add(mark);
    }
    CGenGrid& OpenMarks()
    {
        Open(MakeWLMarkPage);
        return *view->page->findChild<CGenGrid*>("titles_1075");
    }
    QStringList Headers() const
    {
        QStringList headers;
        for (int column = 2; column < grid->ColumnCount(); ++column)
            headers << grid->model()->headerData(column, Qt::Horizontal).toString();
        return headers;
    }
    /// "levels of the first record | of the second", missing ones left out.
    QString Levels() const
    {
        QStringList records;
        auto& marks = document.Parameters().WaterLevelMarkList;
        for (std::size_t i = 0; i < marks.GetCount(); ++i) {
            QStringList levels;
            for (const double level : marks.GetAt(i).MarkLevels)
                levels << (level == NotGiven ? "-" : KsShortestNumber(level));
            records << levels.join(' ');
        }
        return records.join(" | ");
    }
    void Undo() { view->page->UndoRedo(true); }

    HD_Global_Var& g = document.Parameters().Global;
};

TEST_F(MarkPagesTest, LevelsOfMarksAreLevels)
{
    g.MarkTitles = {"LOW"};
    AddMark("A", 0, {3.048});
    OpenMarks();
    const auto tip = [this] { return grid->model()->headerData(2, Qt::Horizontal, Qt::ToolTipRole).toString(); };
    EXPECT_TRUE(tip().contains("\nUnit: m\n")) << tip().toStdString();
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(Texts(1), "A|0|10.000");
    EXPECT_TRUE(tip().contains("\nUnit: ft\n")) << tip().toStdString();
    Enter(1, 3, "20");
    EXPECT_NEAR(document.Parameters().WaterLevelMarkList.GetAt(0).MarkLevels[0], 6.096, 1e-12);
}

TEST_F(MarkPagesTest, TitlesAndLevelsStayInStep)
{
    g.MarkTitles = {"LOW", "HIGH"};
    g.MarkInterpolate = {true}; // one short
    AddMark("A", 1, {3});       // a shorter list
    AddMark("B", 2, {1, 2});
    CGenGrid& titles = OpenMarks();
    const QStringList before = Text();
    EXPECT_EQ(Headers(), QStringList({"LOW", "HIGH"}));
    EXPECT_EQ(Texts(1), "A|1|3.000|");
    EXPECT_EQ(Texts(2), "B|2|1.000|2.000");

    // Insert above the second title.
    titles.setFocus();
    titles.SelectLines(2, 2);
    QTest::keyClick(&titles, Qt::Key_Insert);
    EXPECT_EQ(Headers(), QStringList({"LOW", "", "HIGH"}));
    EXPECT_EQ(Levels(), "3 | 1 - 2") << "a list that ends before the column is left as it is";
    // Typed in lower case it stands in upper case, in the cell and above the column.
    const QSignalSpy headers(grid->model(), &QAbstractItemModel::headerDataChanged);
    QTest::keyClicks(&titles, "m");
    QTest::keyClicks(OpenEditor(titles), "id");
    QTest::keyClick(OpenEditor(titles), Qt::Key_Return);
    titles.StoreEditedLine();
    EXPECT_EQ(titles.TextAt(2, 1), "MID");
    EXPECT_EQ(Headers(), QStringList({"LOW", "MID", "HIGH"}));
    EXPECT_GE(headers.count(), 1) << "which is painted anew";
    // A level for the record that is too short.
    Enter(1, 5, "7.5");
    grid->StoreEditedLine();
    EXPECT_EQ(Levels(), "3 - 7.5 | 1 - 2");
    Undo();
    EXPECT_EQ(Levels(), "3 | 1 - 2") << "as short as it was";
    grid->SetCurrentCell(1, 4);
    QGuiApplication::clipboard()->setText("6\t7.5");
    QTest::keyClick(grid, Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(Levels(), "3 6 7.5 | 1 - 2");
    Undo();
    EXPECT_EQ(Levels(), "3 | 1 - 2") << "both cells in one step";
    Undo();
    EXPECT_EQ(Headers(), QStringList({"LOW", "", "HIGH"}));
    Undo();
    EXPECT_TRUE(Text() == before);
    EXPECT_EQ(Headers(), QStringList({"LOW", "HIGH"}));

    // Delete the first title, and bring it back.
    titles.setFocus();
    titles.SelectLines(1, 1);
    QTest::keyClick(&titles, Qt::Key_Delete);
    EXPECT_EQ(Headers(), QStringList("HIGH"));
    EXPECT_EQ(Levels(), " | 2");
    titles.SelectLines(1, 1);
    QTest::keyClick(&titles, Qt::Key_Delete);
    EXPECT_EQ(Headers(), QStringList("HIGH")) << "the only title stays";
    Undo();
    EXPECT_TRUE(Text() == before);
    EXPECT_EQ(boxes, QStringList());
}

TEST_F(MarkPagesTest, InterpolateIsAClickOnItsBox)
{
    g.MarkTitles = {"LOW", "HIGH"};
    CGenGrid& titles = OpenMarks();
    const QStringList before = Text();
    const auto click = [&](int row, int column) {
        QTest::mouseClick(titles.viewport(), Qt::LeftButton, {},
                          titles.visualRect(titles.model()->index(row, column)).center());
    };
    click(1, 1);
    EXPECT_EQ(g.MarkInterpolate, (std::deque<bool>{false, true}));
    EXPECT_TRUE(document.IsModified());
    QTest::keyClick(&titles, Qt::Key_Space);
    EXPECT_EQ(g.MarkInterpolate, (std::deque<bool>{false, false}));
    Undo();
    Undo();
    EXPECT_TRUE(Text() == before) << "and the list of flags is as short as it was";
    // Keys that would open an editor elsewhere do nothing here.
    QTest::keyClick(&titles, Qt::Key_A);
    EXPECT_FALSE(OpenEditor(titles));
    EXPECT_TRUE(Text() == before);
}

TEST_F(MarkPagesTest, ATitleWithoutTextIsLeftOutOfTheFile)
{
    QTemporaryDir folder;
    AddMark("A", 1, {3, 4}); // levels of no title
    CGenGrid& titles = OpenMarks();
    EXPECT_EQ(titles.RowCount(), 1) << "a row to name the first title in";
    EXPECT_EQ(Headers(), QStringList(""));
    ASSERT_TRUE(document.OnSaveDocument(folder.filePath("new.HDKV")));
    EXPECT_TRUE(g.MarkTitles.empty());
    EXPECT_EQ(titles.RowCount(), 1) << "shown again";
    EXPECT_EQ(document.UndoStack().count(), 0);
    titles.setFocus();
    QTest::keyClick(&titles, Qt::Key_F);
    QTest::keyClick(OpenEditor(titles), Qt::Key_Return);
    titles.StoreEditedLine();
    titles.setFocus();
    QTest::keyClick(&titles, Qt::Key_Insert); // a second one, never named
    EXPECT_EQ(g.MarkTitles, (std::vector<std::string>{"F", ""}));
    EXPECT_EQ(Levels(), "3 - 4") << "the first title is that of the levels which stand there";
    ASSERT_TRUE(document.OnSaveDocument(folder.filePath("new.HDKV")));
    EXPECT_EQ(g.MarkTitles, std::vector<std::string>{"F"});
    Undo();
    EXPECT_EQ(g.MarkTitles, (std::vector<std::string>{"F", ""}));
    Undo();
    Undo();
    EXPECT_TRUE(g.MarkTitles.empty());
    EXPECT_EQ(Levels(), "3 4") << "the levels stay, as they were before they had a title";
}

TEST_F(MarkPagesTest, TheGlobalRowIsNoLineOfTheList)
{
    HDWLCurve record;
    record.RiverName = "A";
    record.Chainage = 10;
    record.CurveOption = 4;
    record.CurveValue1 = NotGiven;
    record.CurveValue2 = 250;
    document.Parameters().WLCurveList.Add(record);
    g.CurveIncrement = {.Enabled = true, .Range = 1, .Width = 40, .Radius = 300, .Velocity = 1.25};
    Open(MakeWLCurvePage);
    EXPECT_EQ(Texts(1), "Global||Single|40.000|300.000|1.250");
    EXPECT_EQ(Texts(2), "A|10|Multiple ½||250.000|0.000");

    Enter(1, 4, "55.5");
    Type(2, 5, ""); // emptied
    QTest::keyClick(Editor(), Qt::Key_Return);
    grid->StoreEditedLine();
    EXPECT_EQ(g.CurveIncrement.Width, 55.5);
    EXPECT_EQ(document.Parameters().WLCurveList.GetAt(0).CurveValue2, NotGiven);
    for (const int column : {1, 2}) {
        SCOPED_TRACE(column);
        grid->SetCurrentCell(1, column);
        QTest::keyClick(grid, Qt::Key_X);
        EXPECT_FALSE(Editor()) << "caption of the row";
    }
    // What it is called and what it has no value for fills no line.
    grid->SetCurrentCell(1, 1);
    grid->selectionModel()->select(QItemSelection(grid->model()->index(0, 0), grid->model()->index(1, 3)),
                                   QItemSelectionModel::ClearAndSelect);
    QTest::keyClick(grid, Qt::Key_D, Qt::ControlModifier);
    EXPECT_TRUE(Texts(2).startsWith("A|10|Single|55.500|")) << Texts(2).toStdString();
    QTest::keyClick(grid, Qt::Key_Z, Qt::ControlModifier);
    // It can neither be deleted nor moved down by an insertion.
    SelectRows(1, 1);
    QTest::keyClick(grid, Qt::Key_Delete);
    SelectRows(1, 2);
    QTest::keyClick(grid, Qt::Key_Delete);
    EXPECT_EQ(grid->RowCount(), 2) << "an empty list shows a blank line";
    EXPECT_EQ(Texts(2), "||None|||");
    SelectRows(1, 1);
    QTest::keyClick(grid, Qt::Key_Insert);
    EXPECT_EQ(grid->RowCount(), 3);
    EXPECT_EQ(grid->TextAt(1, 1), "Global");
    Undo();
    Undo();
    SelectRows(2, 2);
    QTest::keyClick(grid, Qt::Key_Insert);
    EXPECT_EQ(grid->TextAt(3, 1), "A") << "above the line chosen";
    Undo();
    EXPECT_EQ(Texts(2), "A|10|Multiple ½|||0.000");
    view->page->InsertLocation("NEW", "12.5");
    EXPECT_EQ(document.Parameters().WLCurveList.GetAt(1).RiverName, "NEW");
    EXPECT_EQ(Current(), std::pair(3, 1));
    EXPECT_FALSE(view->page->GetRecordAt(1));
    EXPECT_EQ(view->page->GetRecordAt(2)->RiverName, "A");
    int row = 1;
    EXPECT_FALSE(SearchRows(*grid, row, {"GLOBAL"}));
}

TEST_F(MarkPagesTest, CurveSwitchesTakeEachOtherAlong)
{
    g.CurveIncrement.Enabled = true;
    Open(MakeWLCurvePage);
    const struct
    {
        const char* box;
        const char* state;  // of range, width, radius, velocity afterwards
        const char* locked; // columns
    } steps[] = {{"range_1099", "1000", "3"},      {"radius_1101", "1011", "3 5 6"}, {"width_1100", "1111", "3 4 5 6"},
                 {"radius_1101", "1101", "3 4 6"}, {"velocity_1102", "1000", "3"},   {"velocity_1102", "1001", "3 6"},
                 {"range_1099", "0001", "6"}};
    const auto state = [this] {
        const auto& c = g.CurveIncrement;
        return QString("%1%2%3%4").arg(c.SystemRange).arg(c.SystemWidth).arg(c.SystemRadius).arg(c.SystemVelocity);
    };
    const auto locked = [this](int row) {
        QStringList columns;
        for (int column = 3; column <= 6; ++column)
            if (grid->Model()->IsLocked(row, column - 1))
                columns << QString::number(column);
        return columns.join(' ');
    };
    for (const auto& step : steps) {
        SCOPED_TRACE(step.box);
        const QString before = state();
        view->page->findChild<QCheckBox*>(step.box)->click();
        EXPECT_EQ(state(), step.state);
        EXPECT_EQ(locked(0), step.locked);
        EXPECT_EQ(locked(1), step.locked);
        Undo();
        EXPECT_EQ(state(), before) << "one step";
        view->page->UndoRedo(false);
    }
    view->page->findChild<QCheckBox*>("enable_1098")->click();
    EXPECT_FALSE(grid->isEnabled());
    EXPECT_FALSE(view->page->findChild<QCheckBox*>("velocity_1102")->isEnabled());

    g.SandBarIncrement.Enabled = true;
    Open(MakeWLSandBarsPage);
    EXPECT_EQ(locked(1), "6");
    view->page->findChild<QRadioButton*>("observed_1109")->click();
    EXPECT_EQ(g.SandBarIncrement.Method, 1);
    EXPECT_EQ(locked(0), "3 4 5");
    EXPECT_EQ(locked(1), "3 4 5");
}

TEST_F(MarkPagesTest, PlacesAreLoadedBelowTheGlobalRow)
{
    CObList places;
    auto place = std::make_unique<CKvrCBELocation>();
    place->branch = "MAIN";
    place->chainage = 125;
    place->radius = 300;
    place->width = 42;
    places.push_back(std::move(place));
    g.CurveIncrement = {.Enabled = true, .Width = 7, .Radius = 8};
    Open(MakeWLCurvePage);
    EXPECT_EQ(LoadLocations(*view->page, places, {true, true}).added, 1);
    EXPECT_EQ(Texts(1), "Global||None|7.000|8.000|0.000");
    EXPECT_EQ(Texts(2), "MAIN|125|None|42.000|300.000|") << "instead of the line that the empty list showed";
    EXPECT_EQ(grid->RowCount(), 2);
    Undo();
    EXPECT_EQ(Texts(2), "||None|||");
    EXPECT_EQ(g.CurveIncrement.Width, 7);
    g.SandBarIncrement.Enabled = true;
    Open(MakeWLSandBarsPage);
    EXPECT_EQ(LoadLocations(*view->page, places, {true, true}).added, 1);
    EXPECT_EQ(Texts(2), "MAIN|125||42.000||");
}
