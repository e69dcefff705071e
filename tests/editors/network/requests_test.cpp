// What other editors ask the network's view, and what it asks them.
#include "network_fixture.h"

#include <QMenu>

namespace {

TEST_F(NetworkTest, ThePickedPlaceIsFetched)
{
    CNetworkView* view = Open();
    CObList objects;
    EXPECT_EQ(Ask(view, KsRequest::FetchLocation, &objects), 0); // nothing picked yet
    EXPECT_TRUE(objects.empty());
    view->Map()->Marks().Pick(CMapPlace{"MAIN", 2500});
    EXPECT_EQ(Ask(view, KsRequest::FetchLocation, &objects), 1);
    ASSERT_EQ(objects.size(), 1u);
    const auto* place = dynamic_cast<const CKvrCBELocation*>(objects[0].get());
    ASSERT_NE(place, nullptr);
    EXPECT_EQ(place->branch, "MAIN");
    EXPECT_EQ(place->chainage, 2500);
    Remove(*view->Document(), view->Branches()->Model()->Rows(), 0, 1); // the place is gone
    EXPECT_EQ(Ask(view, KsRequest::FetchLocation, &objects), 0);
}

TEST_F(NetworkTest, BranchNamesAreAppended)
{
    CNetworkView* view = Open();
    CObList objects;
    objects.push_back(Location("before", 1));
    EXPECT_EQ(Ask(view, KsRequest::BranchNames, &objects), 1);
    ASSERT_EQ(objects.size(), 3u);
    EXPECT_EQ(dynamic_cast<const CKvrCBEText&>(*objects[1]).text, "MAIN");
    EXPECT_EQ(dynamic_cast<const CKvrCBEText&>(*objects[2]).text, "SIDE");
}

TEST_F(NetworkTest, RadiusAndWidthAreFilledInWhereTheyAreMissing)
{
    CNetworkView* view = Open();
    CObList objects;
    objects.push_back(Location("MAIN", 3000));
    objects.push_back(Location("MAIN", 1500)); // before the table
    objects.push_back(Location("MAIN", 5000)); // the width ends at 4000
    objects.push_back(Location("SIDE", 100));  // an empty table
    objects.push_back(Location("OTHER", 100));
    objects.push_back(std::make_unique<CKvrCBEText>());
    objects.push_back(Location("MAIN", 3000));
    static_cast<CKvrCBELocation&>(*objects[6]).width = 7; // known already
    objects.push_back(nullptr);
    EXPECT_EQ(Ask(view, KsRequest::LoadLocationsAndChannel, &objects), 1);
    const auto at = [&](std::size_t i) { return static_cast<const CKvrCBELocation&>(*objects[i]); };
    EXPECT_EQ(objects.size(), 8u);
    EXPECT_EQ(at(0).radius, 500);
    EXPECT_EQ(at(0).width, 40);
    EXPECT_EQ(at(2).radius, 700);
    EXPECT_EQ(at(6).width, 7);
    EXPECT_EQ(at(6).radius, 500);
    for (const std::size_t i : {1u, 3u, 4u})
        EXPECT_TRUE(std::isnan(at(i).radius) && std::isnan(at(i).width)) << i;
    EXPECT_TRUE(std::isnan(at(2).width));
    EXPECT_EQ(Ask(view, KsRequest::LoadLocationsAndChannel, &objects), 0); // nothing left that the table has
}

TEST_F(NetworkTest, ABranchIsTheOneWhoseCapitalsAreTheSame)
{
    QByteArray text(SmallNetwork);
    text.replace("\"MAIN\"", "\"Wei\u00dfe Elster\"").replace("\"SIDE\"", "\"K\u0131z\u0131l\u0131rmak\"");
    hdLocations = {{"WEISSE ELSTER", 2000, HDInitialData, {}}, {"KIZILIRMAK", 250, HDBedData, {}}};
    CNetworkView* view = Open(text);
    ASSERT_TRUE(QTest::qWaitFor([&] { return view->Map()->Marks().Locations().size() == 2; }));
    EXPECT_EQ(view->Map()->Marks().Placed().size(), 2u) << "none is outside this network";
    CObList channel, names;
    channel.push_back(Location("WEISSE ELSTER", 2000));
    EXPECT_EQ(Ask(view, KsRequest::LoadLocationsAndChannel, &channel), 1);
    auto known = std::make_unique<CKvrCBEText>(); // another editor has named it
    known->text = "Kizilirmak";
    names.push_back(std::move(known));
    EXPECT_EQ(Ask(view, KsRequest::BranchNames, &names), 1);
    EXPECT_EQ(names.size(), 2u);
    const auto rows = view->Branches()->Model()->Rows();
    const auto twin = rows->NewRows(1);
    *static_cast<CNetworkBranch*>(twin->At(0)) = view->Document()->Network().branches[0];
    static_cast<CNetworkBranch*>(twin->At(0))->name = "weisse elster";
    EXPECT_TRUE(rows->FindFault(rows->Count(), *twin)) << "the name is taken";
}

TEST_F(NetworkTest, StrangeRequestsDoNothing)
{
    CNetworkView* view = Open();
    for (const WPARAM request : {KsRequest::FetchLocation, KsRequest::BranchNames, KsRequest::LoadLocationsAndChannel,
                                 KsRequest::LocationShown, KsRequest::GetData, KsRequest::DeleteData,
                                 KsRequest::LoadLocations, WPARAM(0), WPARAM(99999)}) {
        EXPECT_EQ(Ask(view, request, nullptr), 0) << request;
        EXPECT_EQ(KsSendMessage(view, KsMessage::BetweenEditors(), request, 0), 0) << request;
        CObList strange;
        strange.push_back(std::make_unique<CKvrCBEText>());
        strange.push_back(nullptr);
        EXPECT_EQ(Ask(view, request, &strange), request == KsRequest::BranchNames) << request;
    }
    EXPECT_EQ(KsSendMessage(view, KsMessage::SwitchBoard(), 25, 0), 0);
    EXPECT_EQ(KsSendMessage(view, KsMessage::ProjectManagement(), KsRequest::ProjectClosing, 0), 0);
    EXPECT_FALSE(view->Document()->IsModified());

    CNetworkDoc unopened;
    CNetworkView early; // has not been shown yet
    unopened.AddView(&early);
    CObList objects;
    EXPECT_EQ(Ask(&early, KsRequest::FetchLocation, &objects), 0);
    EXPECT_EQ(KsSendMessage(&early, KsMessage::ProjectManagement(), KsRequest::ProjectOpened, 0), 0);
}

TEST_F(NetworkTest, LocationsAreFetchedAtTheStartAndWhenDataChange)
{
    CNetworkView* view = Open();
    ASSERT_TRUE(QTest::qWaitFor([&] { return view->Map()->Marks().Locations().size() == 4; }));
    EXPECT_TRUE(log.contains("get data 1"));
    EXPECT_EQ(view->Map()->Marks().Placed().size(), 2u);
    EXPECT_EQ(view->Map()->Marks().Locations()[0].file, hdDoc.GetPathName());

    hdLocations.push_back({"Side", 250, HDMixingData, {}}); // in whatever case
    log.clear();
    for (int i = 0; i < 5; ++i)
        Ask(view, KsRequest::DataChanged, nullptr);
    EXPECT_FALSE(log.contains("get data 1")); // not within the sender's message
    ASSERT_TRUE(QTest::qWaitFor([&] { return view->Map()->Marks().Placed().size() == 3; }));
    EXPECT_EQ(log.count("get data 1"), 1);

    hdOpen = false; // closed meanwhile
    Ask(view, KsRequest::DataChanged, nullptr);
    ASSERT_TRUE(QTest::qWaitFor([&] { return view->Map()->Marks().Locations().empty(); }));
    hdOpen = true;
    KsClearExports(); // no editor for them
    Ask(view, KsRequest::DataChanged, nullptr);
    QTest::qWait(120);
    EXPECT_TRUE(view->Map()->Marks().Locations().empty());
}

TEST_F(NetworkTest, ALocationIsDeletedShownAndInsertedInTheDocumentItCameFrom)
{
    CNetworkView* view = Open();
    CNetworkMap* map = view->Map();
    ASSERT_TRUE(QTest::qWaitFor([&] { return map->Marks().Placed().size() == 2; }));
    Click(map, map->SymbolPoint(1));
    ASSERT_NE(map->Marks().Selected(), nullptr);
    EXPECT_EQ(map->Marks().Selected()->kind, HDBedData);
    EXPECT_EQ(map->Marks().Picked(), (CMapPlace{"MAIN", 5000}));

    const auto choose = [&](std::initializer_list<const char*> path) {
        const auto menu = view->MapMenu();
        QMenu* level = menu.get();
        for (const char* text : path) {
            const auto actions = level->actions();
            const auto found = std::find_if(actions.begin(), actions.end(),
                                            [&](const QAction* action) { return action->text().remove('&') == text; });
            ASSERT_NE(found, actions.end()) << text;
            if ((*found)->menu())
                level = (*found)->menu();
            else
                (*found)->trigger();
        }
    };
    choose({"Show in HD Parameters"});
    EXPECT_TRUE(log.contains("select 1 MAIN 5000"));
    choose({"Insert Here as", "Flood plain"});
    QTest::keyClick(map, Qt::Key_Delete);
    choose({"Delete Location"});
    EXPECT_EQ(hdView.requests, (QStringList{"61 MAIN 5000 5 from networkView", "81 MAIN 5000 2 from networkView",
                                            "81 MAIN 5000 2 from networkView"}));
    // The line is gone from the document; so is the selection, once that is known.
    hdLocations.erase(hdLocations.begin() + 1);
    Ask(view, KsRequest::DataChanged, nullptr);
    ASSERT_TRUE(QTest::qWaitFor([&] { return map->Marks().Selected() == nullptr; }));
    hdView.requests.clear();
    QTest::keyClick(map, Qt::Key_Delete);
    EXPECT_TRUE(hdView.requests.isEmpty());

    Click(map, map->SymbolPoint(0));
    ASSERT_NE(map->Marks().Selected(), nullptr);
    hdDoc.SetPathName(Write("river.hdkv", "")); // saved in another case, which the map has not heard
    QTest::keyClick(map, Qt::Key_Delete);
    EXPECT_EQ(hdView.requests, QStringList("81 MAIN 2000 0 from networkView"));
    hdView.requests.clear();
    hdOpen = false; // its document has been closed, which the map has not heard
    QTest::keyClick(map, Qt::Key_Delete);
    EXPECT_TRUE(hdView.requests.isEmpty());
    map->Marks().Pick(std::nullopt);
}

TEST_F(NetworkTest, AShownLocationComesIntoSight)
{
    CNetworkView* view = Open();
    CNetworkMap* map = view->Map();
    for (int i = 0; i < 12; ++i)
        map->Zoom(1.4);
    ASSERT_FALSE(map->rect().contains(PointOf(map, "MAIN", 1200).toPoint()));
    CObList objects;
    objects.push_back(Location("MAIN", 1200));
    EXPECT_EQ(Ask(view, KsRequest::LocationShown, &objects), 0);
    const QPointF shown = PointOf(map, "MAIN", 1200);
    EXPECT_LT((shown - QRectF(map->rect()).center()).manhattanLength(), 3);
    objects[0] = Location("MAIN", 1201); // in sight already: the map stays
    Ask(view, KsRequest::LocationShown, &objects);
    EXPECT_EQ(PointOf(map, "MAIN", 1200), shown);
    objects[0] = Location("NOWHERE", 1);
    Ask(view, KsRequest::LocationShown, &objects);
    EXPECT_EQ(PointOf(map, "MAIN", 1200), shown);
}

} // namespace
