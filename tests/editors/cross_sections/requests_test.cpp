// What other editors ask, and what they are told.
#include "cross_sections_fixture.h"

#include <QLineEdit>

namespace {

TEST_F(CrossSectionTest, LocationsComeByBranchAndChainage)
{
    CCrossSectionView* view = Open();
    CObList objects;
    objects.push_back(Location("MAIN", 1)); // another editor's
    EXPECT_EQ(Ask(view, KsRequest::LoadLocations, &objects), 1);
    QStringList places;
    for (const auto& object : objects) {
        const auto& item = dynamic_cast<const CKvrCBELocation&>(*object);
        places << QString("%1 %2").arg(item.branch).arg(item.chainage);
        EXPECT_TRUE(std::isnan(item.radius) && std::isnan(item.width));
    }
    EXPECT_EQ(places, QStringList({"MAIN 1", "MAIN 1000", "MAIN 2500.5", "MAIN 2500.5", "SIDE 300"}));
    // Edited lines stay where they are in the table, not in the answer.
    EXPECT_TRUE(Edit(view->Sections(), Main1000, SectionChainage, "9000"));
    objects.clear();
    Ask(view, KsRequest::LoadLocations, &objects);
    EXPECT_EQ(dynamic_cast<const CKvrCBELocation&>(*objects.at(2)).chainage, 9000);
    Remove(*view->Document(), view->Sections()->Model()->Rows(), 0, SmallRows);
    objects.clear();
    EXPECT_EQ(Ask(view, KsRequest::LoadLocations, &objects), 0);
    EXPECT_EQ(objects.size(), 0u);
    EXPECT_EQ(Ask(view, KsRequest::BranchNames, &objects), 0);
}

TEST_F(CrossSectionTest, RadiusAndWidthAreFilledWhereTheyAreMissing)
{
    CCrossSectionView* view = Open();
    EXPECT_TRUE(Edit(view->Sections(), Main2500, SectionWidth, "")); // the later survey has it
    struct Case
    {
        const char* branch;
        double chainage, radius;          // asked
        double filledRadius, filledWidth; // expected
    };
    const Case cases[] = {{"MAIN", 2500.5, KsUnset, 400, 25},
                          {"MAIN", 2500.5, 77, 77, 25},
                          {"MAIN", 2500, KsUnset, KsUnset, KsUnset},
                          {"MAIN", 1000, KsUnset, KsUnset, KsUnset},
                          {"SIDE", 300.0001, 0, 0, 7},
                          {"side", 300, KsUnset, KsUnset, 7}};
    CObList objects;
    objects.push_back(nullptr);
    objects.push_back(std::make_unique<CKvrCBEText>());
    for (const Case& each : cases)
        objects.push_back(Location(each.branch, each.chainage, each.radius));
    EXPECT_EQ(Ask(view, KsRequest::LoadLocationsAndChannel, &objects), 1);
    EXPECT_EQ(objects.size(), 2 + std::size(cases)) << "nothing is added";
    const auto same = [](double a, double b) { return a == b || (std::isnan(a) && std::isnan(b)); };
    for (std::size_t i = 0; i < std::size(cases); ++i) {
        const auto& item = dynamic_cast<const CKvrCBELocation&>(*objects[i + 2]);
        EXPECT_TRUE(same(item.radius, cases[i].filledRadius)) << i << ": " << item.radius;
        EXPECT_TRUE(same(item.width, cases[i].filledWidth)) << i << ": " << item.width;
    }
    EXPECT_EQ(Ask(view, KsRequest::LoadLocationsAndChannel, &objects), 0) << "nothing is left to fill";
}

TEST_F(CrossSectionTest, BedAndBanksOfEverySection)
{
    CCrossSectionView* view = Open();
    CObList objects;
    EXPECT_EQ(Ask(view, KsRequest::BedLevels, &objects), 1);
    const CCrossSections& all = view->Document()->Sections();
    ASSERT_FALSE(objects.empty());
    for (const auto& object : objects) {
        const auto& item = dynamic_cast<const CKvrCBEBedLevel&>(*object);
        const int at = all.Nearest(item.branch, item.chainage);
        ASSERT_GE(at, 0);
        const auto& points = all.sections[std::size_t(at)].points;
        for (const CSectionPoint& point : points)
            EXPECT_LE(item.bed, point.level);
        EXPECT_GE(item.leftBank, points.front().level);
        EXPECT_GE(item.rightBank, points.back().level);
    }
}

TEST_F(CrossSectionTest, BranchNamesComeOnce)
{
    CCrossSectionView* view = Open();
    CObList objects;
    auto known = std::make_unique<CKvrCBEText>();
    known->text = "SIDE";
    objects.push_back(std::move(known));
    objects.push_back(nullptr);
    EXPECT_EQ(Ask(view, KsRequest::BranchNames, &objects), 1);
    ASSERT_EQ(objects.size(), 3u);
    EXPECT_EQ(dynamic_cast<const CKvrCBEText&>(*objects[2]).text, "MAIN");
}

TEST_F(CrossSectionTest, APlaceShownElsewhereSelectsTheNearestSectionAndIsNotTold)
{
    CCrossSectionView* view = Open();
    struct Case
    {
        const char* branch;
        double chainage;
        int row;
    };
    const Case cases[] = {{"SIDE", 1e6, Side300},
                          {"MAIN", 1700, Main1000},
                          {"MAIN", 1800, Main2500},
                          {"LOST", 300, Main2500},
                          {"MAIN", 1000, Main1000}};
    log.clear();
    for (const Case& each : cases) {
        CObList objects;
        objects.push_back(Location(each.branch, each.chainage));
        EXPECT_EQ(Ask(view, KsRequest::LocationShown, &objects), 0);
        EXPECT_EQ(view->CurrentSection(), each.row) << each.branch << ' ' << each.chainage;
        EXPECT_EQ(view->Points()->model()->rowCount(),
                  int(view->Document()->Sections().sections[std::size_t(each.row)].points.size()));
    }
    EXPECT_TRUE(log.isEmpty()) << log.join(' ').toStdString();
    Select(view->Sections(), Main2500Later);
    log.clear();
    CObList objects;
    objects.push_back(Location("MAIN", 2600));
    Ask(view, KsRequest::LocationShown, &objects);
    EXPECT_EQ(view->CurrentSection(), Main2500Later) << "it is as near as the other survey";
    EXPECT_TRUE(log.isEmpty()) << log.join(' ').toStdString();
}

TEST_F(CrossSectionTest, APlaceShownElsewhereNeitherExtendsASelectionNorDisturbsTyping)
{
    CCrossSectionView* view = Open();
    const auto show = [&](const char* branch, double chainage) {
        CObList objects;
        objects.push_back(Location(branch, chainage));
        Ask(view, KsRequest::LocationShown, &objects);
    };
    for (const auto& [key, modifier] :
         {std::pair(Qt::Key_Control, Qt::ControlModifier), std::pair(Qt::Key_Shift, Qt::ShiftModifier)}) {
        show("MAIN", 1000);
        QTest::keyPress(view->window()->windowHandle(), key, modifier);
        show("SIDE", 300);
        show("MAIN", 2500);
        const auto rows = view->Sections()->selectionModel()->selectedIndexes();
        EXPECT_EQ(rows.size(), 1) << modifier;
        EXPECT_EQ(rows.value(0).row(), Main2500) << modifier;
        QTest::keyRelease(view->window()->windowHandle(), key);
    }
    auto* editor = Type(view->Points(), 1, PointLevel, "10");
    ASSERT_NE(editor, nullptr);
    show("SIDE", 300);
    EXPECT_EQ(view->CurrentSection(), Main2500);
    QTest::keyClicks(editor, "1.5");
    EXPECT_TRUE(view->MayLeave(KsLeave::Field));
    EXPECT_EQ(view->Document()->Sections().sections[Main2500].points[1].level, 101.5);
    Type(view->Points(), 1, PointLevel, "x");
    EXPECT_FALSE(view->MayLeave(KsLeave::Field));
    EXPECT_FALSE(view->MayLeave(KsLeave::Page));
    QCoreApplication::processEvents();
    EXPECT_EQ(boxes.size(), 2) << "once for each time";
    EXPECT_TRUE(view->Points()->IsEditing());
}

TEST_F(CrossSectionTest, ASectionSelectedIsToldOnceAndAnswersDoNotMoveIt)
{
    CCrossSectionView* view = Open();
    log.clear();
    answer = [&] { // an editor that cannot keep quiet
        CObList objects;
        objects.push_back(Location("MAIN", 1000));
        Ask(view, KsRequest::LocationShown, &objects);
    };
    QTest::keyClick(view->Sections(), Qt::Key_End, Qt::ControlModifier);
    EXPECT_EQ(view->CurrentSection(), Side300);
    EXPECT_EQ(log, QStringList{"others 523 SIDE 300"});
    Select(view->Sections(), Main2500);
    QTest::keyClick(view->Sections(), Qt::Key_Down); // the same place, surveyed later
    EXPECT_EQ(view->CurrentSection(), Main2500Later);
    EXPECT_EQ(log, QStringList({"others 523 SIDE 300", "others 523 MAIN 2500.5"}));
}

TEST_F(CrossSectionTest, WhatMakesNoSenseChangesNothing)
{
    CCrossSectionView* view = Open();
    Select(view->Sections(), Main2500);
    const WPARAM requests[] = {KsRequest::LoadLocations,
                               KsRequest::LoadLocationsAndChannel,
                               KsRequest::FetchLocation,
                               KsRequest::BranchNames,
                               KsRequest::LocationShown,
                               KsRequest::DataChanged,
                               KsRequest::GetData,
                               KsRequest::InsertData,
                               0,
                               99999};
    log.clear();
    for (const WPARAM request : requests) {
        EXPECT_EQ(KsSendMessage(view, KsMessage::BetweenEditors(), request, 0), 0) << request;
        EXPECT_EQ(Ask(view, request, nullptr), 0) << request;
        if (request == KsRequest::LoadLocations || request == KsRequest::BranchNames)
            continue; // they only add
        for (int wrong = 0; wrong < 3; ++wrong) {
            CObList objects;
            if (wrong)
                objects.push_back(wrong == 1 ? nullptr : std::make_unique<CKvrCBEText>());
            EXPECT_EQ(Ask(view, request, &objects), 0) << request << ' ' << wrong;
            EXPECT_EQ(objects.size(), std::size_t(wrong > 0));
        }
    }
    EXPECT_EQ(KsSendMessage(view, KsRegisterMessage("no such message"), 40, 0), 0);
    EXPECT_EQ(view->CurrentSection(), Main2500);
    EXPECT_TRUE(log.isEmpty()) << log.join(' ').toStdString();
    EXPECT_EQ(view->Document()->UndoStack().count(), 0);

    const CCrossSectionView bare; // before its first update, and without a document
    CObList objects;
    EXPECT_EQ(Ask(const_cast<CCrossSectionView*>(&bare), KsRequest::LoadLocations, &objects), 0);
}

} // namespace
