// What other editors ask of an HD document.
#include "exchange_fixture.h"

#include "ks/fc/exports.h"

#include <cmath>

namespace {

TEST_F(ExchangeTest, DataComeFromTheFileTheDocumentOrTheView)
{
    const CString path = WriteFile("river.hdkv");
    auto* view = Open(path);
    ASSERT_NE(view, nullptr);
    CKavo0_hdView strange; // without a document
    CObList objects;
    objects.push_back(Item(3, "FIRST", 1));
    Send(view, KsRequest::GetData, &objects);
    EXPECT_EQ(Summary(&objects), std::string("3 FIRST 1, ") + AllItems) << "appended";
    for (const Owned& items : {Owned(KvrMSGGetData(path, nullptr)), Owned(KvrMSGGetData({}, view->GetDocument())),
                               Owned(CKavo0_hd::GetData(path, nullptr)), Owned(CKavo0_hd::GetData({}, view))})
        EXPECT_EQ(Summary(items.get()), AllItems);

    Write(Path("broken.hdkv"), "[KAVO0_HD]\n[InitList\n");
    Write(Path("river.txt"), SmallFile);
    const ExchangeLog log;
    for (const CString& unreadable : {Path("gone.hdkv"), Path("broken.hdkv"), Path("river.txt"), CString()}) {
        EXPECT_EQ(KvrMSGGetData(unreadable, nullptr), nullptr) << qPrintable(unreadable);
        EXPECT_GE(log.Take(), 1);
    }
    EXPECT_EQ(CKavo0_hd::GetData(path, &other), nullptr);
    EXPECT_EQ(CKavo0_hd::GetData(path, &strange), nullptr);
    EXPECT_EQ(log.Take(), 2);
    EXPECT_TRUE(boxes.isEmpty());
}

TEST_F(ExchangeTest, DataHoldIncompleteLinesButNoLineThatIsOnlyShown)
{
    Write(Path("small.hdkv"), SmallFile);
    auto* view = Open(Path("small.hdkv"));
    EXPECT_EQ(Summary(Owned(KvrMSGGetData({}, view->GetDocument())).get()), "0 MAIN 100, 0  200, 0 MAIN 1e+10");
    auto* empty = Open({});
    for (int tab = 0; tab < empty->Sheet()->count(); ++tab)
        empty->Sheet()->SetActivePage(tab);
    EXPECT_EQ(Summary(Owned(KvrMSGGetData({}, empty->GetDocument())).get()), "");
    EXPECT_EQ(Owned(KvrMSGGetHDUserDefMark({}, empty->GetDocument()))->size(), 1u)
        << "the titles, of which there are none";
    EXPECT_EQ(Owned(KvrMSGGetHDMaps({}, empty->GetDocument()))->size(), 0u);
}

TEST_F(ExchangeTest, ReadingDisturbsNobodyWhoTypes)
{
    constexpr int DefaultPage = 5;
    projectHandle = 5;
    auto* view = Open(WriteFile("river.hdkv"));
    QUndoStack& steps = view->GetDocument()->UndoStack();
    const auto readAll = [&] {
        const int step = steps.index();
        CObList objects;
        Send(view, KsRequest::GetData, &objects);
        for (CKsDoc* document : {static_cast<CKsDoc*>(view->GetDocument()), static_cast<CKsDoc*>(nullptr)})
            for (auto* get : {&KvrMSGGetData, &KvrMSGGetHDUserDefMark, &KvrMSGGetHDMaps})
                EXPECT_NE(Owned(get(Path("river.hdkv"), document)), nullptr);
        EXPECT_EQ(steps.index(), step);
        return Summary(&objects);
    };
    auto* grid = view->ActivePage()->GetGrid();
    grid->setFocus();
    grid->SetCurrentCell(1, 2);
    for (const char digit : {'1', '2', '3', '4'}) {
        QTest::keyClick(QApplication::focusWidget(), digit);
        EXPECT_EQ(readAll(), AllItems) << "what is stored, not what is being typed";
    }
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    EXPECT_TRUE(readAll().starts_with("0 MAIN 1234,"));

    // Not even something that cannot be stored: no message, and the text and the focus stay.
    auto* field = TypeWrongInto(*view, DefaultPage);
    const std::string stored = readAll();
    EXPECT_TRUE(stored.starts_with("0 MAIN 1234,"));
    EXPECT_EQ(field->text(), "1e");
    EXPECT_EQ(QApplication::focusWidget(), field);
    EXPECT_EQ(view->Sheet()->currentIndex(), DefaultPage);
    EXPECT_TRUE(boxes.isEmpty());
    QTest::keyClick(field, Qt::Key_Escape);
}

TEST_F(ExchangeTest, AFileIsFoundInWhateverCaseItIsSpelt)
{
    const CString path = WriteFile("River.HDKV");
    const CString spelt = folder.filePath("river.hdkv");
    EXPECT_EQ(Summary(Owned(KvrMSGGetData(spelt, nullptr)).get()), AllItems) << "read";
    auto* view = Open(path);
    CObList items = Items(0, "MAIN", 5);
    KvrMSGInsertData(spelt, nullptr, &items);
    EXPECT_EQ(documents->findChildren<CKsDoc*>().size(), 1);
    EXPECT_EQ(List(*view, 0).GetCount(), 3u) << "into the open document";
    EXPECT_EQ(Open(spelt), view);
}

TEST_F(ExchangeTest, AChangeAsksWhoIsTypingOnceAndTakesNoLineFromUnderIt)
{
    auto* view = Open(WriteFile("river.hdkv"));
    auto* grid = view->ActivePage()->GetGrid();
    grid->setFocus();
    grid->SetCurrentCell(1, 2);
    for (int digit = 0; digit < 2; ++digit)
        QTest::keyClick(QApplication::focusWidget(), '7');
    CObList items = Items(0, "MAIN", 77); // as it is typed
    KvrMSGDeleteData({}, view, &items);
    EXPECT_EQ(Summary(Owned(KvrMSGGetData({}, view->GetDocument())).get()).substr(0, 10), "0 SIDE 0.1");

    // A text that cannot be stored keeps its line, too.
    grid->SetCurrentCell(1, 3);
    for (const char key : {'1', 'e'})
        QTest::keyClick(QApplication::focusWidget(), key);
    items = Items(0, "SIDE", List(*view, 0).GetAt(0).Chainage);
    KvrMSGDeleteData({}, view, &items);
    EXPECT_EQ(List(*view, 0).GetCount(), 1u);
    EXPECT_EQ(boxes.size(), 1) << "asked once";
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
}

TEST_F(ExchangeTest, MarksAndMaps)
{
    auto* view = Open({});
    auto& globals = Parameters(*view).Global;
    globals.MarkTitles = {"BANK", "ALARM"};
    globals.MarkInterpolate = {true};
    HDWLMark mark;
    mark.RiverName = "MAIN";
    mark.Chainage = 12.5;
    mark.MarkLevels = {3.25};
    Parameters(*view).WaterLevelMarkList.Add(mark);
    CMapsOutput map;
    map.XOrigin = 1, map.YOrigin = 2, map.Rotation = 3, map.GridSize = 4, map.JCells = 5, map.KCells = 6;
    map.FileName = "area.map";
    globals.MapOutput.MapOutputFiles = {map};

    const Owned marks(KvrMSGGetHDUserDefMark({}, view->GetDocument()));
    ASSERT_EQ(marks->size(), 2u);
    const auto& head = dynamic_cast<const CKvrCBEUserDefMark&>(*marks->at(0));
    EXPECT_EQ(head.titles, (std::vector<CString>{"BANK", "ALARM"}));
    EXPECT_EQ(head.flags, (std::vector<std::int32_t>{1, 0}));
    const auto& line = dynamic_cast<const CKvrCBEUserDefMark&>(*marks->at(1));
    EXPECT_EQ(line.branch, "MAIN");
    EXPECT_EQ(line.values, (std::vector<double>{12.5, 3.25, NotGiven}));

    const Owned maps(KvrMSGGetHDMaps({}, view->GetDocument()));
    ASSERT_EQ(maps->size(), 1u);
    const auto& area = dynamic_cast<const CKvr_CBE_HDMaps&>(*maps->at(0));
    EXPECT_EQ((std::vector<double>{area.xOrigin, area.yOrigin, area.rotation, area.cellSize, double(area.jCells),
                                   double(area.kCells)}),
              (std::vector<double>{1, 2, 3, 4, 5, 6}));
    EXPECT_EQ(area.fileName, "area.map");
    EXPECT_EQ(KvrMSGGetHDMaps(Path("gone.hdkv"), nullptr), nullptr);
    EXPECT_EQ(KvrMSGGetHDUserDefMark({}, nullptr), nullptr);
}

// Type, tab of the sheet, numbers of the texts: as other editors' users know them.
struct Row
{
    int type, tab, inserted, deleted, selected;
};
constexpr Row Rows[] = {{0, 0, 4986, 4981, 4993}, {1, 1, 4989, 4983, 4995}, {2, 2, 4987, 4982, 4994},
                        {3, 3, 4988, 4980, 4992}, {4, 6, 4990, 4984, 4996}, {5, 8, 4991, 4985, 4997},
                        {6, 9, 5017, 5016, 5018}};

TEST_F(ExchangeTest, InsertingAddsOneLineToTheTableAndShowsItsTab)
{
    projectHandle = 5;
    auto* view = Open(WriteFile("river.hdkv"));
    auto& globals = Parameters(*view).Global;
    globals.G_waterlevel = 1.25, globals.G_discharge = 40, globals.G_wind_factor = 0.5, globals.G_resistance = 22;
    globals.Mixing.CoefPairs = {{1, 2}};
    globals.Mixing.MixCoef4 = 0.75;
    QUndoStack& steps = view->GetDocument()->UndoStack();
    for (const Row& row : Rows) {
        SCOPED_TRACE(row.type);
        const auto before = FileText(*view);
        const int step = steps.index();
        QTest::qWait(1); // the steps of the row before are told
        messages.clear();
        CObList items = Items(row.type, "Main", 7.125);
        items.push_back(Item(row.type, "SECOND", 8));
        dynamic_cast<CKvr_CBE_ModelDataItem&>(*items[0]).second = 99;
        EXPECT_EQ(Send(view, KsRequest::InsertData, &items), 0);
        CGenList& list = List(*view, row.type);
        ASSERT_EQ(list.GetCount(), 3u) << "the first item alone";
        EXPECT_EQ(list.GetAt(2).RiverName, "Main");
        EXPECT_EQ(list.GetAt(2).Chainage, 7.125);
        EXPECT_EQ(view->Sheet()->currentIndex(), row.tab);
        EXPECT_EQ(steps.index(), step + 1);
        EXPECT_TRUE(view->GetDocument()->IsModified());
        EXPECT_EQ(Told(KsRequest::DataChanged), 1);
        const auto after = FileText(*view);
        steps.undo();
        EXPECT_TRUE(FileText(*view) == before);
        steps.redo();
        EXPECT_TRUE(FileText(*view) == after);
    }
    EXPECT_EQ(Parameters(*view).InitList.GetAt(2).InitialH, 1.25);
    EXPECT_EQ(Parameters(*view).InitList.GetAt(2).InitialQ, 40);
    EXPECT_EQ(Parameters(*view).WindList.GetAt(2).WindFactor, 0.5);
    EXPECT_EQ(Parameters(*view).BedList.GetAt(2).Resistance, 22);
    EXPECT_EQ(Parameters(*view).WaveList.GetAt(2).DownstreamChainage, 99);
    EXPECT_EQ(Parameters(*view).MixingCoefList.GetAt(2).CoefPairs.at(0).Second, 2);
    EXPECT_EQ(Parameters(*view).MixingCoefList.GetAt(2).MixCoef4, 0.75);
    EXPECT_TRUE(boxes.isEmpty());
}

TEST_F(ExchangeTest, AnEmptyTableShowsTheInsertedLineAlone)
{
    auto* view = Open({});
    auto& list = Parameters(*view).InitList;
    EXPECT_EQ(view->ActivePage()->GetGrid()->RowCount(), 1) << "a line that is only shown";
    CObList items = Items(0, "MAIN", 5);
    QUndoStack& steps = view->GetDocument()->UndoStack();
    const auto texts = [&] { return view->ActivePage()->GetGrid()->TextAt(1, 1) + QString::number(list.GetCount()); };
    EXPECT_EQ(texts(), "0");
    KvrMSGInsertData({}, view, &items);
    EXPECT_EQ(texts(), "MAIN1");
    steps.undo();
    EXPECT_EQ(texts(), "0");
    steps.redo();
    EXPECT_EQ(texts(), "MAIN1");
    KvrMSGDeleteData({}, view, &items);
    EXPECT_EQ(texts(), "0");
    steps.undo();
    EXPECT_EQ(texts(), "MAIN1");
}

TEST_F(ExchangeTest, DeletingTakesTheFirstLineAtExactlyThePlace)
{
    projectHandle = 5;
    auto* view = Open(WriteFile("river.hdkv"));
    QUndoStack& steps = view->GetDocument()->UndoStack();
    for (const Row& row : Rows) {
        SCOPED_TRACE(row.type);
        const auto before = FileText(*view);
        const double place = 0.1 + row.type;
        const ExchangeLog log;
        for (const auto& [branch, chainage] :
             {std::pair("SIDE", std::nextafter(place, 1e9)), std::pair("side", place), std::pair("MAIN", place)}) {
            CObList none = Items(row.type, branch, chainage);
            Send(view, KsRequest::DeleteData, &none);
            EXPECT_TRUE(FileText(*view) == before) << branch << chainage;
            EXPECT_EQ(log.Take(), 1);
        }
        QTest::qWait(1);
        messages.clear();
        CObList items = Items(row.type, "SIDE", place);
        Send(view, KsRequest::DeleteData, &items);
        EXPECT_EQ(List(*view, row.type).GetCount(), 1u);
        EXPECT_EQ(view->Sheet()->currentIndex(), row.tab);
        EXPECT_EQ(Told(KsRequest::DataChanged), 1);
        steps.undo();
        EXPECT_TRUE(FileText(*view) == before);
    }
    HD_Initial twin;
    twin.RiverName = "MAIN";
    twin.Chainage = 100;
    twin.InitialQ = 7;
    Parameters(*view).InitList.Add(twin);
    CObList items = Items(0, "MAIN", 100);
    KvrMSGDeleteData({}, view, &items);
    ASSERT_EQ(Parameters(*view).InitList.GetCount(), 2u);
    EXPECT_EQ(Parameters(*view).InitList.GetAt(1).InitialQ, 7);
}

TEST_F(ExchangeTest, SelectingShowsTheLine)
{
    auto* view = Open(WriteFile("river.hdkv"));
    auto* second = Open({});
    const auto before = FileText(*view);
    for (const Row& row : Rows) {
        SCOPED_TRACE(row.type);
        second->GetDocument()->GetDocTemplate()->OpenDocumentFile(&frame, {}); // something else in front
        CObList items = Items(row.type, "SIDE", 0.1 + row.type);
        KvrMSGSelectData({}, view, &items);
        EXPECT_EQ(frame.GetActiveView(), view);
        EXPECT_EQ(view->Sheet()->currentIndex(), row.tab);
        auto* grid = view->ActivePage()->GetGrid();
        if (grid && view->ActivePage()->GetList() == &List(*view, row.type)) {
            EXPECT_EQ(grid->CurrentRow(), 2);
            EXPECT_EQ(grid->CurrentColumn(), 1);
        }
    }
    EXPECT_TRUE(FileText(*view) == before);
    EXPECT_FALSE(view->GetDocument()->IsModified());
}

TEST_F(ExchangeTest, APageThatCannotBeLeftStaysAndTheUserIsTold)
{
    constexpr int DefaultPage = 5;
    auto* view = Open(WriteFile("river.hdkv"));
    for (const Row& row : Rows) {
        for (const auto& [request, number] :
             {std::pair(&KvrMSGInsertData, row.inserted), std::pair(&KvrMSGSelectData, row.selected),
              std::pair(&KvrMSGDeleteData, row.deleted)}) {
            SCOPED_TRACE(number);
            auto* field = TypeWrongInto(*view, DefaultPage);
            boxes.clear();
            CObList items = Items(row.type, "NEW", 1);
            request({}, view, &items);
            ASSERT_FALSE(boxes.isEmpty());
            EXPECT_EQ(boxes.last(), LoadString(number));
            EXPECT_FALSE(boxes.last().isEmpty());
            EXPECT_EQ(view->Sheet()->currentIndex(), DefaultPage);
            EXPECT_EQ(field->text(), "1e") << "what was typed is not lost";
            EXPECT_EQ(List(*view, row.type).GetCount(), number == row.deleted ? 2u : 3u) << "done all the same";
            QTest::keyClick(field, Qt::Key_Escape);
        }
    }
    EXPECT_EQ(LoadString(4986),
              "Data inserted in Init page, but to switch there, you must first repair error on active page");
    EXPECT_EQ(LoadString(4980),
              "Data deleted in Wave page, but to switch there, you must first repair error on active page");
    EXPECT_EQ(LoadString(4993), "Can't select Init page because of error on active page");
}

TEST_F(ExchangeTest, WithoutAViewTheFileIsOpenedOnce)
{
    const CString path = WriteFile("river.hdkv");
    CObList items = Items(0, "MAIN", 5);
    KvrMSGInsertData(path, nullptr, &items);
    ASSERT_EQ(documents->findChildren<CKsDoc*>().size(), 1);
    auto* view = static_cast<CKavo0_hdView*>(frame.GetActiveView());
    ASSERT_NE(view, nullptr);
    EXPECT_EQ(List(*view, 0).GetCount(), 3u);

    auto* grid = view->ActivePage()->GetGrid(); // the user goes on, and types something
    grid->setFocus();
    grid->SetCurrentCell(1, 3);
    QTest::keyClicks(grid, "8");
    KvrMSGDeleteData(folder.path() + "/./river.hdkv", nullptr, &items);
    EXPECT_EQ(documents->findChildren<CKsDoc*>().size(), 1) << "the same file";
    EXPECT_EQ(List(*view, 0).GetCount(), 2u);
    EXPECT_EQ(Parameters(*view).InitList.GetAt(0).InitialH, 8);

    Write(Path("broken.hdkv"), "[KAVO0_HD]\n[InitList\n");
    const ExchangeLog log;
    for (const CString& unreadable : {Path("gone.hdkv"), Path("broken.hdkv"), CString()})
        KvrMSGInsertData(unreadable, nullptr, &items);
    EXPECT_GE(log.Take(), 3);
    KsSetMainWindow(this); // no frame to open windows in
    KvrMSGInsertData(WriteFile("other.hdkv"), nullptr, &items);
    EXPECT_EQ(log.Take(), 1);
    EXPECT_EQ(documents->findChildren<CKsDoc*>().size(), 1);
    EXPECT_TRUE(boxes.isEmpty());
    answer = QMessageBox::Discard;
    EXPECT_TRUE(frame.CloseAllWindows());
    QTest::qWait(1);
    documents.reset();
    KsSetMainWindow(&frame);
    KvrMSGInsertData(path, nullptr, &items);
    EXPECT_NE(frame.GetActiveView(), nullptr) << "a template of its own";
}

TEST_F(ExchangeTest, AnEditorThatIsGoneIsNotFound)
{
    KsAddExports([](const char* name) -> QFunctionPointer {
        return qstrcmp(name, "KvrMSGGetData") == 0 ? reinterpret_cast<QFunctionPointer>(&KvrMSGGetData) : nullptr;
    });
    EXPECT_EQ(KsFindExportAs<decltype(KvrMSGGetData)>("KvrMSGGetData"), &KvrMSGGetData);
    EXPECT_EQ(KsFindExport("KvrMSGGetNothing"), nullptr);
    KsClearExports();
    EXPECT_EQ(KsFindExport("KvrMSGGetData"), nullptr);
}

} // namespace
