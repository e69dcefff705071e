// What the long profile shows of a document, and what dragging its points does to the tables: with the pages and the
// view of the program, and cross sections that the test answers for.
#include "module/exchange_fixture.h"

#include "ks/fc/exchange.h"
#include "profile/profile_content.h"
#include "profile/profile_edit.h"
#include "profile/profile_panel.h"

#include <cmath>

namespace {

constexpr const char* File = "[KAVO0_HD]\n"
                             "  [Global_Variables]\n"
                             "    [Global_Values]\n"
                             "      G_waterlevel = 1.5\n"
                             "      G_discharge = 20\n"
                             "    [/Global_Values]\n"
                             "  [/Global_Variables]\n"
                             "  [InitList]\n"
                             "    DATA = \"MAIN\", 300, 4, 30\n"
                             "    DATA = \"SIDE\", 100, 9, 90\n"
                             "    DATA = \"main\", 100, 2, 10\n"
                             "    DATA = \"\", 200, 1, 1\n"
                             "    DATA = \"MAIN\", 10000000000.0, 1, 1\n"
                             "    DATA = \"MAIN\", 500, 8, 50\n"
                             "  [/InitList]\n"
                             "  [BedList]\n"
                             "    DATA = \"MAIN\", 100, 30, 31, 32, 33\n"
                             "  [/BedList]\n"
                             "  [WaveList]\n"
                             "    DATA = \"MAIN\", 0, 250, 2\n"
                             "    DATA = \"MAIN\", 250, 600, 0\n"
                             "  [/WaveList]\n"
                             "[/KAVO0_HD]\n";

class ProfileTest : public ExchangeTest
{
protected:
    ProfileTest()
    {
        projectHandle = 7;
        answerShell = [this](unsigned message, WPARAM request, CKSComm_Package& package, LRESULT otherwise) -> LRESULT {
            if (message != KsMessage::SwitchBoard() || request != KsRequest::BedLevels || !package.objects)
                return otherwise;
            for (const auto& [chainage, bed] : beds) {
                auto item = std::make_unique<CKvrCBEBedLevel>();
                item->branch = QStringLiteral("Main");
                item->chainage = chainage;
                item->bed = bed;
                item->leftBank = bed + 5;
                item->rightBank = bed + 6;
                package.objects->push_back(std::move(item));
            }
            return 1;
        };
        Write(Path("a.hdkv"), File);
        view = Open(Path("a.hdkv"));
        EXPECT_TRUE(view);
        QTest::qWait(20); // the other pages are made
    }
    ~ProfileTest() override { KsUnits::Instance().SetSystem(KsUnitSystem::Metric); }

    Profile Make(const QSet<QString>& shown = {LevelsTrack, ReachesTrack}) const
    {
        return MakeProfile(*view, QStringLiteral("MAIN"), shown);
    }
    /// Of a curve, by how its name begins; fails without one.
    static PlotPoint Find(const Profile& profile, const QString& name, std::size_t point = 0)
    {
        for (int track = 0; track < int(profile.plot.tracks.size()); ++track)
            for (int curve = 0; curve < int(profile.plot.tracks[std::size_t(track)].curves.size()); ++curve)
                if (Curve(profile, {track, curve}).name == name)
                    return {track, curve, point};
        ADD_FAILURE() << "no curve " << name.toStdString();
        return {0, 0, 0};
    }
    static const PlotCurve& Curve(const Profile& profile, const PlotPoint& point)
    {
        return profile.plot.tracks[std::size_t(point.track)].curves[std::size_t(point.curve)];
    }
    static const PlotCurve& Curve(const Profile& profile, const char* name)
    {
        return Curve(profile, Find(profile, QLatin1String(name)));
    }
    HD_Parameters& Data() const { return view->GetDocument()->Parameters(); }
    const HD_Initial& Line(std::size_t index) const { return Data().InitList.GetAt(index); }
    QUndoStack& Steps() const { return view->GetDocument()->UndoStack(); }

    CKavo0_hdView* view = nullptr;
    std::vector<std::pair<double, double>> beds{{0, -1}, {600, -7}};
};

using Numbers = std::vector<double>;

TEST_F(ProfileTest, ShowsTheLinesOfTheBranchInTheOrderOfTheRiver)
{
    const Profile profile = Make();
    const PlotCurve& level = Curve(profile, "Initial h");
    EXPECT_EQ(level.x, (Numbers{100, 300, 500}))
        << "whatever the order and the spelling in the file; incomplete lines nowhere";
    EXPECT_EQ(level.y, (Numbers{2, 4, 8}));
    EXPECT_EQ(profile.At(Find(profile, QStringLiteral("Initial h"))).rows, (std::vector<std::size_t>{2, 0, 5}));
    EXPECT_EQ(Curve(profile, "Initial Q").y, (Numbers{10, 30, 50})) << "of the page in front";
    EXPECT_EQ(Curve(profile, "Bed").y, (Numbers{-1, -7}));
    EXPECT_EQ(Curve(profile, "Right bank").y, (Numbers{5, -1}));

    const PlotCurve& global = Curve(profile, "Initial h, global");
    ASSERT_EQ(global.x, (Numbers{0, 100, 100, 500, 600})) << "where no line stands, up to the ends of what is known";
    EXPECT_TRUE(std::isnan(global.y[2]));
    EXPECT_EQ(global.y[0], 1.5);
    EXPECT_FALSE(global.isMovable);

    EXPECT_EQ(Curve(profile, "Wave Approx: Diffusive Wave").end, Numbers{250});
    EXPECT_EQ(Curve(profile, "Wave Approx: High Order Fully Dynamic").x, Numbers{250});
    EXPECT_EQ(profile.PointsOf(profile.At(Find(profile, QStringLiteral("Initial h"))).table, 5).size(), 2u)
        << "level and discharge";
    EXPECT_EQ(ProfileBranchesOf(*view), (QStringList{QStringLiteral("MAIN"), QStringLiteral("SIDE")}));

    EXPECT_EQ(MakeProfile(*view, QStringLiteral("NOWHERE"), {LevelsTrack}).plot.tracks.front().curves.front().x,
              Numbers{});
}

TEST_F(ProfileTest, ADepthStandsOnTheBed)
{
    Data().Global.iLevelDepth = 1;
    const Profile profile = Make();
    EXPECT_EQ(Curve(profile, "Initial y").y, (Numbers{0, 0, 2})) << "-2 + 2, -4 + 4, -6 + 8";
    SetProfileValue(profile, Find(profile, QStringLiteral("Initial y"), 2), 1);
    EXPECT_EQ(Line(5).InitialH, 7) << "the depth is stored, not the level";
    const Profile after = Make();
    const PlotPoint curve = Find(after, QStringLiteral("Initial y"));
    ASSERT_TRUE(AddProfileLine(after, curve.track, curve.curve, 400, 1));
    EXPECT_EQ(Line(1).InitialH, 6) << "behind the line before it: the bed lies at -5";
    EXPECT_FALSE(AddProfileLine(Make(), curve.track, curve.curve, 700, 1)) << "nobody knows the bed there";
    EXPECT_EQ(Data().InitList.GetCount(), 7u);
}

TEST_F(ProfileTest, APointThatIsMovedIsOneStepOfTheTable)
{
    const Profile profile = Make();
    SetProfileValue(profile, Find(profile, QStringLiteral("Initial h"), 1), 4.25);
    EXPECT_EQ(Line(0).InitialH, 4.25);
    EXPECT_EQ(Line(0).InitialQ, 30);
    MoveProfileLine(Make(), Find(profile, QStringLiteral("Initial h"), 1), 320);
    EXPECT_EQ(Line(0).Chainage, 320);
    EXPECT_EQ(Steps().count(), 2);
    RemoveProfileLine(Make(), Find(profile, QStringLiteral("Initial h"), 0));
    EXPECT_EQ(Data().InitList.GetCount(), 5u);
    EXPECT_EQ(Line(2).RiverName, "") << "the line of \"main\" is gone";
    Steps().setIndex(0);
    EXPECT_EQ(Line(0).Chainage, 300);
    EXPECT_EQ(Line(0).InitialH, 4);
    EXPECT_EQ(Line(2).RiverName, "main");
    EXPECT_TRUE(boxes.isEmpty()) << boxes.join('|').toStdString();

    // In units of the user's, of a line that a filter hides, and where the cell does not take it.
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    const Profile feet = Make();
    EXPECT_NEAR(Curve(feet, "Initial h").y[0], 2 / 0.3048, 1e-9);
    feet.tables.front().grid->ChangeView([](CGridModel& model) { model.Filter({QStringLiteral("SIDE")}); });
    SetProfileValue(feet, Find(feet, QStringLiteral("Initial h"), 0), 10);
    EXPECT_DOUBLE_EQ(Line(2).InitialH, 3.048);
    EXPECT_EQ(Line(1).InitialH, 9) << "of the branch that is shown";
}

TEST_F(ProfileTest, ANewLineLeavesTheOtherCurvesAsTheyRun)
{
    const Profile profile = Make();
    const PlotPoint discharge = Find(profile, QStringLiteral("Initial Q"));
    const auto place = AddProfileLine(profile, discharge.track, discharge.curve, 400, 35);
    ASSERT_EQ(place, 1u);
    EXPECT_EQ(Line(1).RiverName, "MAIN");
    EXPECT_EQ(Line(1).Chainage, 400);
    EXPECT_EQ(Line(1).InitialQ, 35);
    EXPECT_EQ(Line(1).InitialH, 6) << "between 4 and 8";
    const PlotPoint again = Find(Make(), QStringLiteral("Initial Q"));
    ASSERT_EQ(AddProfileLine(Make(), again.track, again.curve, 50, 35), 3u) << "before the first line of the branch";
    EXPECT_EQ(Line(3).InitialH, 1.5) << "the global value";
    EXPECT_EQ(Steps().count(), 2);
    Steps().undo();
    Steps().undo();
    EXPECT_EQ(Data().InitList.GetCount(), 6u);
}

TEST_F(ProfileTest, ThePanelFollowsTheCurrentLineAndLeadsToIt)
{
    CProfilePanel panel(*view, Steps());
    panel.resize(600, 300);
    panel.show();
    QTest::qWait(5);
    if (!panel.Plot())
        GTEST_SKIP() << "built without plots";
    panel.SetCurrent(0, 1, QStringLiteral("Side"), 100);
    EXPECT_EQ(panel.Shown().branch, QStringLiteral("SIDE"));
    EXPECT_EQ(Curve(panel.Shown(), "Initial h").y, Numbers{9});
    panel.SetCurrent(0, 0, QStringLiteral("MAIN"), 300);
    const ProfileTable table = panel.Shown().tables.front();
    ASSERT_TRUE(view->ShowCell(table, 5, 3));
    EXPECT_EQ(table.grid->CurrentLine(), 6);
    EXPECT_EQ(table.grid->CurrentColumn(), 4);
    SetProfileValue(panel.Shown(), Find(panel.Shown(), QStringLiteral("Initial h"), 0), 2.5);
    EXPECT_EQ(Curve(panel.Shown(), "Initial h").y.front(), 2.5) << "what changed is shown";
    Steps().undo();
    EXPECT_EQ(Curve(panel.Shown(), "Initial h").y.front(), 2);
    EXPECT_TRUE(view->Sheet()->SetActivePage(2));
    EXPECT_EQ(Curve(panel.Shown(), "Zone 1").y, Numbers{31}) << "the values of the page in front";
}

} // namespace
