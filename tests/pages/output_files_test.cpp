// The pages of time series output and maps: lists without locations, files to browse for, dates, locks of a row.
#include "grid/grid_clipboard.h"
#include "page_fixture.h"
#include "pages/page_table.h"

#include "data/hd_file.h"
#include "grid/date_time_text.h"
#include "ks/fc/file_dialog.h"
#include "pages/framework/date_time_edit.h"
#include "pages/framework/file_browse.h"

#include <QCheckBox>
#include <QFile>
#include <QLabel>
#include <QLocale>
#include <QTemporaryDir>
#include <QToolButton>
#include <functional>

class OutputFilesTest : public PageTest
{
protected:
    OutputFilesTest()
    {
        QLocale::setDefault(QLocale(QLocale::English, QLocale::UnitedStates));
        KsSetFileDialogHandler([this](const KsFileQuestion& question) {
            asked << question.proposal + ' ' + question.filters;
            return chosen;
        });
    }
    ~OutputFilesTest() override
    {
        KsSetFileDialogHandler({});
        QLocale::setDefault(QLocale::system());
    }
    CGenGrid& Part(const char* name) const { return *view->page->findChild<CGenGrid*>(name); }
    static void Click(CGenGrid& cells, int row, int column)
    {
        QTest::mouseClick(cells.viewport(), Qt::LeftButton, {},
                          cells.visualRect(cells.model()->index(row - 1, column - 1)).center());
    }
    static void Put(CGenGrid& cells, int row, int column, const char* text)
    {
        ASSERT_TRUE(cells.Model()->setData(cells.model()->index(row - 1, column - 1), text, Qt::EditRole));
        cells.StoreEditedLine();
    }
    std::string Text() const { return HDFileText(document.Parameters()); }

    QTemporaryDir folder;
    QStringList asked;
    CString chosen;
    HDTextOutput& text = globals.TextOutput;
    HDMapOutput& maps = globals.MapOutput;
};

TEST_F(OutputFilesTest, NewRowsAndTheGridWithTheFocus)
{
    Open(MakeTextOutputPage);
    CGenGrid &items = Part("items_1216"), &files = Part("files_1226");
    EXPECT_EQ(items.RowCount(), 1);
    EXPECT_EQ(items.TextAt(1, 1) + '|' + items.TextAt(1, 3), "Water level|2");
    EXPECT_EQ(files.TextAt(1, 1), "kvt Timeseries Bridge");
    EXPECT_FALSE(document.IsModified());
    for (CGenGrid* cells : {&files, &items, grid}) {
        SCOPED_TRACE(cells->objectName().toStdString());
        const int rows = cells->RowCount();
        document.SetModifiedFlag(false);
        cells->setFocus();
        QTest::keyClick(cells, Qt::Key_Insert);
        EXPECT_EQ(cells->RowCount(), rows + 1);
        EXPECT_TRUE(document.IsModified());
        QTest::keyClick(cells, Qt::Key_Delete); // the current line, without a selection
        EXPECT_EQ(cells->RowCount(), rows);
    }
    // The index is stored whatever the user calls the item, and the format by its name.
    Put(items, 1, 1, "froude number");
    Put(files, 1, 1, "Ascii Format 2 Timeseries Bridge");
    EXPECT_EQ(text.OutputItems[0].Item, 8);
    EXPECT_EQ(text.OutputFiles[0].Format, "Ascii Format 2 Timeseries Bridge");
    EXPECT_FALSE(files.Model()->setData(files.model()->index(0, 0), "Another Format", Qt::EditRole));
    view->page->InsertLocation("MAIN", "125");
    EXPECT_EQ(Texts(grid->RowCount()), "MAIN|125|");
    EXPECT_EQ(document.Parameters().OutputGridPoints.GetAt(1).PointValue, NotGiven);
}

TEST_F(OutputFilesTest, BrowsingStartsAtTheFileNamed)
{
    document.SetPathName(folder.filePath("river.HDKV"));
    QDir(folder.path()).mkdir("out");
    QFile(folder.filePath("out/there.kvt0")).open(QIODevice::WriteOnly);
    text.OutputFiles.resize(2);
    Open(MakeTextOutputPage);
    CGenGrid& files = Part("files_1226");
    const struct
    {
        const char *format, *name, *proposal, *filters;
    } cases[] = {{"kvt Timeseries Bridge", "", "/.kvt0", "(*.kvt0)"},
                 {"kvt Timeseries Bridge", "out/there.kvt0", "/out/there.kvt0", "(*.kvt0)"},
                 {"kvt Timeseries Bridge", "out/gone.kvt0", "/out/.kvt0", "(*.kvt0)"},
                 {"Ascii Format 2 Timeseries Bridge", "nowhere/x", "/.txt", "(*.txt)"}};
    for (const auto& c : cases) {
        SCOPED_TRACE(c.proposal);
        Put(files, 1, 1, c.format);
        Put(files, 1, 3, c.name);
        asked.clear();
        chosen.clear();
        Click(files, 1, 4);
        EXPECT_EQ(asked, QStringList(folder.path() + c.proposal + ' ' + c.filters));
        EXPECT_EQ(files.TextAt(1, 3), c.name) << "cancelled";
    }
    // The name of a file that is there is asked about, unless it was the one named already.
    chosen = folder.filePath("out/there.kvt0");
    Click(files, 1, 4);
    EXPECT_EQ(boxes.size(), 1);
    EXPECT_EQ(files.TextAt(1, 3), "nowhere/x") << "not agreed to";
    chosen = folder.filePath("out/new.txt");
    document.SetModifiedFlag(false);
    Click(files, 1, 4);
    EXPECT_EQ(text.OutputFiles[0].FileName, chosen.toStdString());
    EXPECT_TRUE(document.IsModified());
}

// A file that the simulation writes is asked about when it is there, one that it reads when it is not.
TEST_F(OutputFilesTest, DoubtfulFilesAreAskedAbout)
{
    const QString there = folder.filePath("there.kvt2"), missing = folder.filePath("missing.kvt2");
    QFile(there).open(QIODevice::WriteOnly);
    maps.GenerateOutput = maps.ApplyDemGroundElevation = maps.MapAreaGeoDb = true;
    Open(MakeMapsPage);
    auto* help = view->page->findChild<CGeoFileEdit*>("helpGrid_1241");
    const struct
    {
        std::function<void()> browse;
        std::function<QString()> name;
        QString doubtful, plain;
        const char* says;
    } cases[] = {{[&] { Click(Part("maps_1226"), 1, 8); }, [&] { return Part("maps_1226").TextAt(1, 7); }, there,
                  missing, "write over it"},
                 {[&] { Click(Part("dem_1227"), 1, 2); }, [&] { return Part("dem_1227").TextAt(1, 1); }, missing, there,
                  "does not exist"},
                 {[&] { help->findChild<QToolButton*>()->click(); }, [&] { return help->Field()->text(); }, missing,
                  there, "does not exist"}};
    for (const auto& c : cases) {
        SCOPED_TRACE(&c - cases);
        boxes.clear();
        chosen = c.doubtful;
        answer = QMessageBox::No;
        c.browse();
        EXPECT_EQ(c.name(), "");
        answer = QMessageBox::Yes;
        c.browse();
        EXPECT_EQ(c.name(), chosen);
        ASSERT_EQ(boxes.size(), 2);
        EXPECT_TRUE(boxes[0].contains(c.says)) << boxes[0].toStdString();
        chosen = c.plain;
        c.browse();
        c.browse();
        EXPECT_EQ(c.name(), chosen);
        EXPECT_EQ(boxes.size(), 2) << "nothing to ask";
    }
    chosen = there;
    Click(Part("maps_1226"), 1, 8);
    Click(Part("maps_1226"), 1, 8);
    EXPECT_EQ(boxes.size(), 3) << "not when it is the one named already";
}

TEST_F(OutputFilesTest, DatesAreKeptUnlessTheyAreTyped)
{
    text.LimitedPeriodStart = {2024, 13, 5, 7, 8, 9};
    text.LimitedPeriodEnd = {2024, 2, 29, 18, 30, 5};
    Open(MakeTextOutputPage);
    const std::string before = Text();
    auto* start = view->page->findChild<CDateTimeEdit*>("start_1223");
    auto* end = view->page->findChild<CDateTimeEdit*>("end_1225");
    auto* limited = view->page->findChild<QCheckBox*>("limited_1221");
    EXPECT_EQ(start->text(), "Invalid DateTime");
    EXPECT_EQ(end->text(), "2/29/2024 6:30:05 PM");
    EXPECT_FALSE(start->isEnabled());
    limited->click();
    EXPECT_TRUE(start->isEnabled());
    EXPECT_TRUE(view->page->findChild<QLabel*>("label_1225")->isEnabled());
    limited->click();
    EXPECT_EQ(Text(), before);
    limited->click();

    const struct
    {
        const char* typed;
        HDDateTime stored;
    } dates[] = {{"3/1/2024 7:05:06 AM", {2024, 3, 1, 7, 5, 6}},
                 {"3/1/2024 7:05 PM", {2024, 3, 1, 19, 5, 0}},
                 {"2024-03-02 23:59:58", {2024, 3, 2, 23, 59, 58}},
                 {"", {}}};
    for (const auto& date : dates) {
        SCOPED_TRACE(date.typed);
        start->setFocus();
        start->selectAll();
        QTest::keyClick(start, Qt::Key_Backspace);
        QTest::keyClicks(start, date.typed);
        QTest::keyClick(start, Qt::Key_Tab);
        EXPECT_TRUE(text.LimitedPeriodStart == date.stored);
    }
    EXPECT_EQ(boxes, QStringList());
    for (const char* typed : {"2/30/2024 6:30:05 PM", "yesterday", "2024"}) {
        SCOPED_TRACE(typed);
        boxes.clear();
        end->setFocus();
        end->selectAll();
        QTest::keyClicks(end, typed);
        QTest::keyClick(end, Qt::Key_Tab);
        QTest::qWait(1);
        EXPECT_EQ(boxes, QStringList(DateTimeRefusal(typed)));
        EXPECT_TRUE(end->hasFocus());
        EXPECT_TRUE(text.LimitedPeriodEnd == (HDDateTime{2024, 2, 29, 18, 30, 5}));
        QTest::keyClick(end, Qt::Key_Escape);
    }
    EXPECT_EQ(end->text(), "2/29/2024 6:30:05 PM");
}

TEST_F(OutputFilesTest, DatesOfEveryLocaleReadBack)
{
    const HDDateTime dates[] = {{1999, 1, 2, 0, 0, 0}, {2024, 12, 31, 23, 59, 59}, {100, 2, 28, 12, 0, 1}};
    for (const char* name : {"en_US", "en_GB", "ja_JP", "de_DE", "C", "ar_EG", "fr_FR"}) {
        SCOPED_TRACE(name);
        QLocale::setDefault(QLocale(name));
        for (const HDDateTime& date : dates)
            EXPECT_TRUE(ReadDateTime(DateTimeText(date)) == date) << DateTimeText(date).toStdString();
    }
}

TEST_F(OutputFilesTest, TypeAndItemLockTheOtherCellsOfARow)
{
    maps.GenerateOutput = true;
    maps.MapOutputFiles.resize(2);
    Open(MakeMapsPage);
    CGenGrid& cells = Part("maps_1226");
    const struct
    {
        const char *type, *item, *locked; // columns
    } cases[] = {{"Max", "Water level", "11 12 13 14 15"},
                 {"Min", "AD component", "12 13 14 15"},
                 {"Dynamic", "Velocity", "11"},
                 {"Dynamic", "AD component", ""},
                 {"Dynamic", "DEM", "9 11 12"},
                 {"Max", "(h,p,q)", "11 12 13 14 15"}};
    const auto locked = [&] {
        QStringList columns;
        for (int column = 1; column <= 15; ++column)
            if (cells.Model()->IsLocked(0, column - 1))
                columns << QString::number(column);
        return columns.join(' ');
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(QString("%1 %2").arg(c.type, c.item).toStdString());
        Put(cells, 1, 10, "Water level"); // opens the type
        // As soon as it is chosen, not only when the line is left.
        ASSERT_TRUE(cells.Model()->setData(cells.model()->index(0, 8), c.type, Qt::EditRole));
        ASSERT_TRUE(cells.Model()->setData(cells.model()->index(0, 9), c.item, Qt::EditRole));
        EXPECT_EQ(locked(), c.locked);
        cells.StoreEditedLine();
        EXPECT_EQ(locked(), c.locked);
    }
    EXPECT_EQ(maps.MapOutputFiles[1].Type, 0);
}

// What a pasted type unlocks takes what is pasted with it, in whatever order the columns stand.
TEST_F(OutputFilesTest, ALineThatIsPastedOverAnotherIsItsCopy)
{
    maps.GenerateOutput = true;
    maps.MapOutputFiles.resize(2);
    Open(MakeMapsPage);
    CGenGrid& cells = Part("maps_1226");
    const std::pair<int, const char*> dynamic[] = {{7, "b.map"}, {10, "AD component"}, {9, "Dynamic"}, {11, "7"}};
    for (const auto& [column, typed] : dynamic)
        ASSERT_TRUE(cells.Model()->setData(cells.model()->index(1, column - 1), typed, Qt::EditRole)) << column;
    cells.StoreEditedLine();
    const auto line = [&cells](int row) {
        QStringList texts;
        for (int column = 1; column <= cells.ColumnCount(); ++column)
            texts << cells.TextAt(row, column);
        return texts;
    };
    const QStringList before = line(1), copied = line(2);
    ASSERT_NE(before, copied);
    cells.SetCurrentCell(2, 1);
    cells.SelectLines(2, 2);
    CopyCells(cells);
    cells.SetCurrentCell(1, 1);
    EXPECT_TRUE(PasteCells(cells));
    EXPECT_EQ(line(1), copied);
    EXPECT_EQ(line(2), copied);
    document.UndoStack().undo();
    EXPECT_EQ(line(1), before);
}

TEST_F(OutputFilesTest, WhatIsShownAndEnabled)
{
    Open(MakeMapsPage);
    const char* boxNames[] = {"generate_1228", "groundElevation_1239", "geoDb_1240"};
    const struct
    {
        const char *on, *shown; // boxes by place; maps, DEM, ground elevations, cross-sections, help grid
    } cases[] = {{"000", "00000"}, {"011", "00000"}, {"100", "10100"},
                 {"101", "10100"}, {"110", "11110"}, {"111", "11111"}};
    for (const auto& c : cases) {
        SCOPED_TRACE(c.on);
        maps.GenerateOutput = maps.ApplyDemGroundElevation = maps.MapAreaGeoDb = false;
        view->page->LoadFromDocument(&document);
        for (int i = 2; i >= 0; --i) // enabled or not: a file may say so
            if (c.on[i] == '1')
                (i == 0 ? maps.GenerateOutput : i == 1 ? maps.ApplyDemGroundElevation : maps.MapAreaGeoDb) = true;
        view->page->LoadFromDocument(&document);
        EXPECT_EQ(Part("maps_1226").isVisible(), c.shown[0] == '1');
        EXPECT_EQ(Part("dem_1227").isVisible(), c.shown[1] == '1');
        EXPECT_EQ(view->page->findChild<QWidget*>(boxNames[1])->isEnabled(), c.shown[2] == '1');
        EXPECT_EQ(view->page->findChild<QWidget*>("riverXsec_1237")->isEnabled(), c.shown[3] == '1');
        EXPECT_EQ(view->page->findChild<QWidget*>("helpGrid_1241")->isEnabled(), c.shown[4] == '1');
        EXPECT_EQ(view->linesMenu, c.shown[0] == '1');
    }
}

TEST_F(OutputFilesTest, RowsWithoutAFileAreAnnouncedAndLeftOut)
{
    maps.GenerateOutput = maps.ApplyDemGroundElevation = true;
    Open(MakeMapsPage);
    auto* status = view->page->findChild<QLabel*>("status_1229");
    CGenGrid& cells = Part("maps_1226");
    ASSERT_TRUE(document.OnSaveDocument(folder.filePath("maps.HDKV")));
    EXPECT_EQ(document.UndoStack().count(), 0) << "the rows to type into are nothing to bring back";
    EXPECT_EQ(cells.RowCount(), 1) << "and stand there again";
    EXPECT_EQ(status->text(), "");
    Put(cells, 1, 1, "1000.5");
    cells.setFocus();
    QTest::keyClick(&cells, Qt::Key_Insert);
    Put(cells, 2, 7, "depth.kvt2");
    EXPECT_TRUE(status->isVisible());
    EXPECT_TRUE(status->text().contains("(1)")) << status->text().toStdString();
    ASSERT_TRUE(document.OnSaveDocument(folder.filePath("maps.HDKV")));
    ASSERT_EQ(maps.MapOutputFiles.size(), 1U);
    EXPECT_EQ(maps.MapOutputFiles[0].FileName, "depth.kvt2");
    EXPECT_EQ(boxes, QStringList());
    view->page->UndoRedo(true);
    ASSERT_EQ(maps.MapOutputFiles.size(), 2U);
    EXPECT_EQ(maps.MapOutputFiles[0].XOrigin, 1000.5);
}
