// Network files: what is read, what is written back, and what is told about bad ones.
#include "network_fixture.h"
#include "sample_network.h"
#include "sample_river.h"

#include <chrono>
#include <set>

namespace {

using testing::HasSubstr;

TEST_F(NetworkTest, AFileIsReadAndWrittenBackWithWhatTheEditorDoesNotKnow)
{
    QByteArray source = SmallNetwork;
    source.replace("    [/Line]\n    [Channel]\n      DATA = 2000",
                   "      Datum = \"NHN\"\n    [/Line]\n    [Channel]\n"
                   "      [Gauge]\n        Zero = 98.5\n      [/Gauge]\n      DATA = 2000");
    CNetwork network;
    ASSERT_EQ(ReadNetwork(Write("a.kvnw", source), network).toStdString(), "");
    ASSERT_EQ(network.branches.size(), 2u);
    const CNetworkBranch& main = network.branches[0];
    EXPECT_EQ(main.name, "MAIN");
    EXPECT_EQ(main.start, 1000);
    EXPECT_EQ(main.end, 8000);
    EXPECT_EQ(main.line, (std::vector<QPointF>{{0, 0}, {3000, 0}, {3000, 4000}}));
    ASSERT_EQ(main.channel.size(), 3u);
    EXPECT_EQ(main.channel[0].width, 30);
    EXPECT_TRUE(std::isnan(main.channel[1].radius));
    EXPECT_TRUE(main.FlowsAlongLine());
    EXPECT_FALSE(network.branches[1].FlowsAlongLine()); // its chainages increase towards the last vertex

    const QString copy = folder.filePath("b.kvnw");
    ASSERT_EQ(WriteNetwork(copy, network), "");
    const QByteArray text = Read(copy);
    for (const char* kept : {"Survey = \"2019\", 3", "Owner = <C:\\\\data\\\\owner.txt>", "At = 2500, \"RAILWAY\"",
                             "[Piers]", "Count = 2", "Datum = \"NHN\"\n    [/Line]", "[Gauge]\n        Zero = 98.5",
                             "[OTHER_PROGRAM]", "Colour = 7", "DATA = 4000, nan, 50"})
        EXPECT_THAT(text.toStdString(), HasSubstr(kept));
    CNetwork again;
    ASSERT_EQ(ReadNetwork(copy, again), "");
    EXPECT_EQ(again.branches[0].kept.sections, main.kept.sections);
    const QString third = folder.filePath("c.kvnw");
    ASSERT_EQ(WriteNetwork(third, again), "");
    EXPECT_EQ(Read(third), text);
    EXPECT_THAT(text.toStdString(), testing::Not(HasSubstr("CoordinateSystem")));
    again.system = "EPSG:25832";
    ASSERT_EQ(WriteNetwork(third, again), "");
    ASSERT_EQ(ReadNetwork(third, network), "");
    EXPECT_EQ(network.system, "EPSG:25832");
}

TEST_F(NetworkTest, WhatCannotBeTakenIsToldAndTheRestIsRead)
{
    struct Case
    {
        const char *from, *to, *told;
        std::size_t vertices = 3, rows = 3; // without lines that are left out
    };
    const Case cases[] = {
        {"Name = \"MAIN\"", "Title = \"MAIN\"", "3 Name:  -> \"BRANCH\""},
        {"Name = \"SIDE\"", "Name = \"\"", "26 Name: \"\" -> \"BRANCH\""},
        {"Name = \"SIDE\"", "Name = \" \u200e\"", "26 Name: \" \u200e\" -> \"BRANCH\""}, // nobody sees it
        {"Name = \"SIDE\"", "Name = \"Main\"", "26 Name: \"Main\" -> \"Main-2\""},
        {"    Chainage = 1000, 8000\n", "", "3 Chainage:  -> 0, 7000"},
        {"Chainage = 1000, 8000", "Chainage = 1000", "5 Chainage: 1000 -> 0"},
        {"Chainage = 1000, 8000", "Chainage = 8, 8.0", "5 Chainage: 8, 8.0 -> 8, 7008"},
        {"Chainage = 1000, 8000", "Chainage = 1e300, 1e300", "5 Chainage: 1e300, 1e300 -> 0, 7000"},
        {"FlowsDownstream = true", "FlowsDownstream = 1", "6 FlowsDownstream: 1 -> true"},
        {"FlowsDownstream = true", "FlowsDownstream = true\n    FlowsDownstream = false",
         "7 FlowsDownstream: false -> "},
        {"    [Channel]\n", "    [Line]\n    [/Line]\n    [Channel]\n", "13 [Line]:  -> "},
        {"Survey = \"2019\", 3", "CoordinateSystem = 25832", "2 CoordinateSystem: 25832 -> \"\""},
        {"Vertex = 3000, 0\n", "Vertex = 3000, \"north\"\n", "10 Vertex: \"north\" -> ", 2},
        {"Vertex = 3000, 4000", "Vertex = inf, 4000", "11 Vertex: inf -> ", 2},
        {"DATA = 2000, 400, 30", "DATA = nan, inf, 30", "14 DATA: nan -> ; 14 DATA: inf -> ", 3, 2},
        {"DATA = 2000, 400, 30", "DATA = 2000, 400, 30, 1", "14 DATA: 1 -> "},
    };
    for (const Case& each : cases) {
        QByteArray text(SmallNetwork);
        const auto at = text.indexOf(each.from);
        ASSERT_GE(at, 0) << each.from;
        text.replace(at, qsizetype(qstrlen(each.from)), each.to);
        CNetwork network;
        EXPECT_EQ(ReadNetwork(Write("bad.kvnw", text), network).toStdString(), each.told);
        ASSERT_EQ(network.branches.size(), 2u) << each.told;
        EXPECT_EQ(network.branches[0].line.size(), each.vertices) << each.told;
        EXPECT_EQ(network.branches[0].channel.size(), each.rows) << each.told;
        ASSERT_EQ(WriteNetwork(folder.filePath("mended.kvnw"), network), "");
        const bool twice = QByteArray(each.to).contains("[Line]") || QByteArray(each.to).contains("= false");
        EXPECT_EQ(ReadNetwork(folder.filePath("mended.kvnw"), network).isEmpty(), !twice) << "what repeats is kept";
    }
}

TEST_F(NetworkTest, ManyBranchesOfOneNameAreToldApartAtOnce)
{
    constexpr int count = 20000;
    QByteArray text = "[KVR_NETWORK]\n";
    for (int i = 0; i < count; ++i)
        text += i % 2 ? "[Branch]\nName = \"A\"\n[/Branch]\n" : "[Branch]\n[/Branch]\n";
    CNetwork network;
    const auto start = std::chrono::steady_clock::now();
    EXPECT_NE(ReadNetwork(Write("many.kvnw", text + "[/KVR_NETWORK]\n"), network), "");
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(10));
    std::set<std::string> names;
    for (const CNetworkBranch& branch : network.branches)
        names.insert(branch.name);
    EXPECT_EQ(names.size(), std::size_t(count));
    EXPECT_TRUE(names.contains("A-10000") && names.contains("BRANCH-10000"));
}

TEST_F(NetworkTest, AFileWithFaultsOpensUnderABarAndIsKeptWhenSavedOver)
{
    QByteArray text(SmallNetwork);
    text.replace("\"SIDE\"", "\"MAIN\"").replace("DATA = 2000, 400, 30", "DATA = 2000, \"x\", 30");
    CheckFindings(Open(text), {"14, a number", "26, there is a branch \"MAIN\" already."});
    const QByteArray saved = Read(folder.filePath("river.kvnw"));
    EXPECT_THAT(saved.toStdString(), HasSubstr("Name = \"MAIN-2\""));
    EXPECT_THAT(saved.toStdString(), HasSubstr("DATA = 2000, nan, 30"));
}

TEST_F(NetworkTest, TheSampleNetworkFitsTheSampleParameters)
{
    const QString committed = QStringLiteral(KVR_SOURCE_DIR "/examples/river/river.kvnw");
    EXPECT_EQ(Read(committed).toStdString(), SampleNetworkText());
    CNetwork network;
    ASSERT_EQ(ReadNetwork(committed, network), "");
    for (const CNetworkBranch& branch : network.branches)
        EXPECT_NEAR(branch.Length(), branch.end, 0.02 * branch.end) << branch.name;
    HD_Parameters parameters = SampleRiver();
    const CLinearReference reference(network);
    for (std::size_t i = 0; i < parameters.InitList.GetCount(); ++i) {
        const auto& record = parameters.InitList.GetAt(i);
        const int branch = network.FindBranch(QString::fromStdString(record.RiverName));
        EXPECT_TRUE(reference.PointAt(branch, record.Chainage)) << record.RiverName << ' ' << record.Chainage;
        EXPECT_FALSE(std::isnan(
            ChannelValue(network.branches[std::size_t(branch)].channel, &CChannelRow::width, record.Chainage)));
    }
}

} // namespace
