// What an HD document asks of the other editors of its project, and what it tells them.
#include "exchange_fixture.h"

#include "ks/fc/exchange.h"
#include "document/store_value.h"
#include "pages/load_option_dlg.h"

#include <QCheckBox>
#include <QComboBox>
#include <QRadioButton>
#include <QTimer>

namespace {

std::unique_ptr<CKvrCBELocation> Place(const char* branch, double chainage, double radius = KsUnset,
                                       double width = KsUnset)
{
    auto place = std::make_unique<CKvrCBELocation>();
    place->branch = branch;
    place->chainage = chainage;
    place->radius = radius;
    place->width = width;
    return place;
}

class ExchangeClientTest : public ExchangeTest
{
protected:
    ~ExchangeClientTest() override { KsUnits::Instance().SetSystem(KsUnitSystem::Metric); }
    /// The switchboard answers one request by appending items; the requests are counted.
    void Answer(WPARAM answered, std::function<void(CObList&)> append)
    {
        answerShell = [this, answered, append](unsigned message, WPARAM request, CKSComm_Package& package,
                                               LRESULT joined) -> LRESULT {
            if (message != KsMessage::SwitchBoard() || request != answered)
                return joined;
            ++requests;
            EXPECT_NE(package.view, nullptr);
            EXPECT_EQ(package.project, projectHandle);
            if (!append)
                return 0;
            append(*package.objects);
            return 1;
        };
    }
    int requests = 0;
};

TEST_F(ExchangeClientTest, APickedPlaceIsInsertedInDisplayUnits)
{
    projectHandle = 5;
    auto* view = Open(WriteFile("river.hdkv"));
    auto& list = Parameters(*view).InitList;
    Answer(KsRequest::FetchLocation, [](CObList& objects) { objects.push_back(Place("Main", 304.8006096012192)); });
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_TRUE(view->IsCommandEnabled(Command::FetchLocation));
    EXPECT_TRUE(view->OnCommand(Command::FetchLocation));
    ASSERT_EQ(list.GetCount(), 3u);
    EXPECT_EQ(list.GetAt(2).RiverName, "MAIN");
    EXPECT_DOUBLE_EQ(list.GetAt(2).Chainage, 304.8006096012192);
    EXPECT_EQ(view->ActivePage()->GetGrid()->TextAt(3, 2), "1000");
    QTest::qWait(1);
    EXPECT_EQ(Told(KsRequest::DataChanged), 1);

    // Nobody answers, or not with a place.
    using Append = std::function<void(CObList&)>;
    for (const Append& append :
         {Append(), Append([](CObList&) {}), Append([](CObList& o) { o.push_back(std::make_unique<CKvrCBEText>()); }),
          Append([](CObList& o) { o.push_back(nullptr); }), Append([](CObList& o) { o.push_back(Place("", 1)); }),
          Append([](CObList& o) { o.push_back(Place("MAIN", KsUnset)); })}) {
        boxes.clear();
        Answer(KsRequest::FetchLocation, append);
        view->OnCommand(Command::FetchLocation);
        ASSERT_EQ(boxes.size(), 1);
        EXPECT_TRUE(boxes[0].startsWith("No network editor"));
        EXPECT_EQ(list.GetCount(), 3u);
    }
}

TEST_F(ExchangeClientTest, OutsideAProjectNothingIsAskedOrOffered)
{
    auto* view = Open(WriteFile("river.hdkv"));
    const auto hasFetch = [](const CKavo0_hdView& v) {
        const auto menu = v.LinesMenu();
        return std::any_of(menu.begin(), menu.end(),
                           [](const CKsMenuCommand& command) { return command.id == Command::FetchLocation; });
    };
    EXPECT_FALSE(hasFetch(*view));
    EXPECT_FALSE(view->IsCommandEnabled(Command::FetchLocation));
    messages.clear();
    EXPECT_TRUE(view->BranchNames().isEmpty());
    view->ActivePage()->GetGrid()->SetCurrentCell(2, 1);
    QTest::qWait(1);
    EXPECT_TRUE(messages.empty());
    projectHandle = 5;
    EXPECT_TRUE(hasFetch(*Open(WriteFile("member.hdkv"))));
}

TEST_F(ExchangeClientTest, TheBranchListIsAskedForWhenACellOpens)
{
    projectHandle = 5;
    auto* view = Open(WriteFile("river.hdkv"));
    Answer(KsRequest::BranchNames, [](CObList& objects) {
        for (const char* name : {"Main", "SIDE", "", "MAIN", "K\u0131z\u0131l\u0131rmak", "KIZILIRMAK"}) {
            auto item = std::make_unique<CKvrCBEText>();
            item->text = QString::fromUtf8(name);
            objects.push_back(std::move(item));
        }
        objects.push_back(nullptr);
    });
    auto* grid = view->ActivePage()->GetGrid();
    grid->setFocus();
    grid->SetCurrentCell(1, 1);
    EXPECT_EQ(requests, 0);
    QTest::keyClick(grid, Qt::Key_F2);
    auto* list = grid->findChild<QComboBox*>();
    ASSERT_NE(list, nullptr);
    EXPECT_EQ(list->count(), 3);
    EXPECT_EQ(list->itemText(0) + list->itemText(1) + list->itemText(2), "MAINSIDEKIZILIRMAK");
    EXPECT_EQ(requests, 1);
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    grid->SetCurrentCell(1, 3);
    QTest::keyClick(grid, Qt::Key_F2);
    EXPECT_EQ(requests, 1) << "no other column asks";
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
}

TEST_F(ExchangeClientTest, TheCurrentLocationIsToldOnceAnEvent)
{
    projectHandle = 5;
    Write(Path("small.hdkv"), SmallFile);
    auto* view = Open(Path("small.hdkv"));
    QStringList shown;
    answerShell = [&](unsigned message, WPARAM request, CKSComm_Package& package, LRESULT joined) {
        if (message == KsMessage::BetweenEditors() && request == KsRequest::LocationShown) {
            EXPECT_EQ(package.view, view);
            const auto& place = dynamic_cast<const CKvrCBELocation&>(*package.objects->at(0));
            shown << QString("%1 %2").arg(place.branch).arg(place.chainage);
        }
        return joined;
    };
    QTest::qWait(1);
    EXPECT_EQ(shown, QStringList("MAIN 100"));
    auto* grid = view->ActivePage()->GetGrid();
    grid->SetCurrentCell(2, 1);
    QTest::qWait(1);
    EXPECT_EQ(shown.size(), 1) << "not a line without a branch";
    for (const int row : {3, 2, 1})
        grid->SetCurrentCell(row, 1);
    grid->SetCurrentCell(1, 2);
    QTest::qWait(1);
    EXPECT_EQ(shown.size(), 2);
}

TEST_F(ExchangeClientTest, DeletedLinesAndUndoAreToldWhenTheyAreDone)
{
    projectHandle = 5;
    auto* view = Open(WriteFile("river.hdkv"));
    QTest::qWait(1);
    messages.clear();
    view->OnCommand(Command::DeleteLine); // no whole line is selected
    QTest::qWait(1);
    EXPECT_EQ(Told(KsRequest::DataChanged), 0);
    view->ActivePage()->GetGrid()->SelectLines(1, 1);
    view->OnCommand(Command::DeleteLine);
    EXPECT_EQ(Told(KsRequest::DataChanged), 0) << "not in the middle of it";
    QTest::qWait(1);
    EXPECT_EQ(Told(KsRequest::DataChanged), 1);
    view->GetDocument()->UndoStack().undo();
    QTest::qWait(1);
    EXPECT_EQ(Told(KsRequest::DataChanged), 2);
}

TEST_F(ExchangeClientTest, EveryChangeOfDataIsToldOnceAStepAndNotInTheMiddleOfIt)
{
    projectHandle = 5;
    auto* view = Open(WriteFile("river.hdkv"));
    auto& document = *view->GetDocument();
    auto& globals = document.Parameters().Global;
    QUndoStack& steps = document.UndoStack();
    QTest::qWait(1);
    std::vector<double> heard; // what is stored when the others are told
    answerShell = [&](unsigned message, WPARAM request, CKSComm_Package&, LRESULT joined) {
        if (message == KsMessage::BetweenEditors() && request == KsRequest::DataChanged)
            heard.push_back(globals.G_waterlevel);
        return joined;
    };
    const auto told = [&](const std::function<void()>& change) {
        heard.clear();
        change();
        EXPECT_TRUE(heard.empty()) << "in the middle";
        QTest::qWait(1);
        return heard;
    };
    const auto once = [&](double level) { return std::vector<double>{level}; };
    EXPECT_EQ(told([&] { StoreValue(document, globals.G_waterlevel, 2.5); }), once(2.5)) << "a global field";
    EXPECT_EQ(told([&] { StoreValue(document, globals.G_waterlevel, 2.5); }).size(), 0u) << "no change";
    EXPECT_EQ(told([&] {
                  steps.beginMacro("two");
                  StoreValue(document, globals.G_waterlevel, 3.5);
                  StoreValue(document, globals.G_discharge, 1.0);
                  steps.endMacro();
              }),
              once(3.5));
    EXPECT_EQ(told([&] { steps.undo(); }), once(2.5));
    EXPECT_EQ(told([&] { steps.redo(); }), once(3.5));
    EXPECT_EQ(told([&] { steps.setIndex(0), steps.redo(); }).size(), 2u) << "two steps";

    const auto type = [](CGenGrid* grid, int row, int column, const char* text) {
        grid->setFocus();
        grid->SetCurrentCell(row, column);
        for (const char* c = text; *c; ++c)
            QTest::keyClick(QApplication::focusWidget(), *c);
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Return);
    };
    constexpr int MarkPage = 10, MapPage = 15;
    ASSERT_TRUE(view->Sheet()->SetActivePage(MarkPage));
    for (auto* grid : view->ActivePage()->findChildren<CGenGrid*>())
        EXPECT_EQ(told([&] { type(grid, 1, 1, "BANK"); }).size(), 1u) << qPrintable(grid->objectName());
    EXPECT_EQ(globals.MarkTitles, std::vector<std::string>{"BANK"});
    EXPECT_EQ(document.Parameters().WaterLevelMarkList.GetAt(0).RiverName, "BANK");
    ASSERT_TRUE(view->Sheet()->SetActivePage(MapPage));
    QCoreApplication::processEvents(); // the page that was just made is shown
    auto* box = view->ActivePage()->findChild<QCheckBox*>();
    EXPECT_EQ(told([&] { box->click(); }).size(), 1u) << qPrintable(box->text());
    EXPECT_EQ(told([&] { type(view->ActivePage()->findChild<CGenGrid*>(), 1, 1, "7"); }).size(), 1u) << "a map";
    EXPECT_EQ(globals.MapOutput.MapOutputFiles.size(), 1u);
    view->Sheet()->SetActivePage(0);
    EXPECT_EQ(told([&] { document.DoSave(document.GetPathName()); }).size(), 1u) << "the save dropped incomplete lines";
}

TEST_F(ExchangeClientTest, LocationsAreLoadedIntoThePage)
{
    projectHandle = 5;
    auto* view = Open(WriteFile("river.hdkv"));
    Parameters(*view).Global.EnergyEquation = true;
    Parameters(*view).Global.G_Contraction = 0.25;
    auto& list = Parameters(*view).QSSContractionExpansionList;
    int tab = 0;
    while (view->Sheet()->PageAt(tab)->GetList() != &list)
        ++tab;
    ASSERT_TRUE(view->Sheet()->SetActivePage(tab));
    const auto load = [&](const char* option) {
        QTimer::singleShot(0, view, [option] {
            auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            ASSERT_NE(dialog, nullptr);
            if (option)
                dialog->findChild<QRadioButton*>(option)->setChecked(true);
            option ? dialog->accept() : dialog->reject();
        });
        AskForLocations(*view->ActivePage());
    };
    Answer(KsRequest::LoadLocations, [](CObList& objects) {
        objects.push_back(Place("main", 10));
        objects.push_back(Place("MAIN", 20, 300));
    });
    load(nullptr);
    EXPECT_EQ(requests, 0) << "cancelled";
    load("branch_1105");
    EXPECT_EQ(requests, 1);
    ASSERT_EQ(list.GetCount(), 2u) << "in place of the line that was only shown";
    EXPECT_EQ(list.GetAt(0).RiverName, "MAIN");
    EXPECT_EQ(list.GetAt(1).Chainage, 20);
    EXPECT_EQ(list.GetAt(1).Contraction, 0.25) << "as new lines have it";
    QTest::qWait(1);
    EXPECT_EQ(Told(KsRequest::DataChanged), 1);
    load("branch_1105");
    EXPECT_EQ(list.GetCount(), 2u) << "they are there already";
    EXPECT_TRUE(boxes.isEmpty());

    requests = 0;
    for (const char* option : {"radius_1106", "width_1107"}) {
        boxes.clear();
        Answer(KsRequest::LoadLocationsAndChannel, {});
        load(option);
        EXPECT_EQ(boxes.size(), 1) << "nobody answered";
    }
    EXPECT_EQ(requests, 2);
}

} // namespace
