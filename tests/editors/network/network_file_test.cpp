// Network files: what is read, what is written back, and what is refused.
#include "editors/network/network_file.h"
#include "network_fixture.h"
#include "sample_network.h"
#include "sample_river.h"

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
    EXPECT_EQ(again.branches[0].kept, main.kept);
    const QString third = folder.filePath("c.kvnw");
    ASSERT_EQ(WriteNetwork(third, again), "");
    EXPECT_EQ(Read(third), text);
    EXPECT_THAT(text.toStdString(), testing::Not(HasSubstr("CoordinateSystem")));
    again.system = "EPSG:25832";
    ASSERT_EQ(WriteNetwork(third, again), "");
    ASSERT_EQ(ReadNetwork(third, network), "");
    EXPECT_EQ(network.system, "EPSG:25832");
}

TEST_F(NetworkTest, ABadFileSaysWhereAndWhat)
{
    struct Case
    {
        const char *from, *to, *message;
    };
    const Case cases[] = {
        {"[/Channel]\n    [Bridges]", "[Bridges]", "bad.kvnw, line "},
        {"KVR_NETWORK", "KAVO0_HD", "bad.kvnw is no file of this kind: it has no section [KVR_NETWORK]."},
        {"Name = \"MAIN\"", "Title = \"MAIN\"", "line 3: expected a text, Name = \"...\"."},
        {"Name = \"SIDE\"", "Name = \"\"", "line 26: expected the branch's name, Name = \"...\"."},
        {"Name = \"SIDE\"", "Name = \"MAIN\"", "line 26: there is a branch \"MAIN\" already."},
        {"Chainage = 1000, 8000", "Chainage = 1000", "line 5: expected 2 numbers after \"Chainage =\"."},
        {"Chainage = 1000, 8000", "Chainage = 8, 8.0", "line 5: the chainages of the two ends have to differ."},
        {"FlowsDownstream = true", "FlowsDownstream = 1",
         "line 6: expected true or false after \"FlowsDownstream =\"."},
        {"FlowsDownstream = true", "FlowsDownstream = true\n    FlowsDownstream = false",
         "line 7: expected only one FlowsDownstream in [Branch]."},
        {"    [Channel]\n", "    [Line]\n    [/Line]\n    [Channel]\n", "line 13: expected only one Line in [Branch]."},
        {"Survey = \"2019\", 3", "CoordinateSystem = 25832", "line 2: expected a text, CoordinateSystem = \"...\"."},
        {"Vertex = 3000, 0\n", "Vertex = 3000, \"north\"\n", "line 10: expected 2 numbers after \"Vertex =\"."},
        {"Vertex = 3000, 4000", "Vertex = inf, 4000", "line 11: expected 2 numbers"},
        {"DATA = 2000, 400, 30", "DATA = nan, 400, 30", "line 14: expected 3 numbers after \"DATA =\"."},
        {"DATA = 2000, 400, 30", "DATA = 2000, 400, 30, 1", "line 14: expected 3 numbers"},
    };
    for (const Case& each : cases) {
        QByteArray text(SmallNetwork);
        for (qsizetype at = 0; (at = text.indexOf(each.from, at)) >= 0; at += qstrlen(each.to)) {
            text.replace(at, qsizetype(qstrlen(each.from)), each.to);
            if (qstrcmp(each.from, "KVR_NETWORK") != 0)
                break;
        }
        ASSERT_NE(text, QByteArray(SmallNetwork)) << each.from;
        CNetwork network;
        network.branches.resize(1);
        const QString error = ReadNetwork(Write("bad.kvnw", text), network);
        EXPECT_THAT(error.toStdString(), HasSubstr(each.message));
        EXPECT_EQ(network.branches.size(), 1u) << each.message; // untouched
        boxes.clear();
        EXPECT_EQ(Open(text), nullptr);
        EXPECT_EQ(boxes.size(), 1) << each.message;
    }
}

TEST_F(NetworkTest, ASaveThatFailsTellsWhyAndLeavesTheDocumentModified)
{
    CNetworkView* view = Open();
    EXPECT_TRUE(Edit(view->Branches(), 0, BranchName, "OTHER"));
    const QString nowhere = folder.filePath("missing/river.kvnw");
    EXPECT_FALSE(view->Document()->DoSave(nowhere));
    ASSERT_EQ(boxes.size(), 1);
    EXPECT_THAT(boxes[0].toStdString(), HasSubstr("river.kvnw could not be saved.\n"));
    EXPECT_TRUE(view->Document()->IsModified());
    EXPECT_TRUE(view->Document()->DoSave(folder.filePath("river.kvnw")));
    EXPECT_FALSE(view->Document()->IsModified());
    EXPECT_THAT(Read(folder.filePath("river.kvnw")).toStdString(), HasSubstr("Name = \"OTHER\""));
}

#ifndef Q_OS_WIN
TEST_F(NetworkTest, ASaveKeepsWhatIsAboutTheFile)
{
    CNetwork network;
    const QString file = Write("own.kvnw", SmallNetwork), link = folder.filePath("link.kvnw");
    ASSERT_EQ(ReadNetwork(file, network), "");
    const auto ofOwner = QFile::ReadOwner | QFile::WriteOwner;
    ASSERT_TRUE(QFile::setPermissions(file, ofOwner) && QFile::link("own.kvnw", link));
    network.branches[0].name = "OTHER";
    ASSERT_EQ(WriteNetwork(link, network), "");
    EXPECT_TRUE(QFileInfo(link).isSymLink());
    EXPECT_TRUE(Read(file).contains("OTHER"));
    EXPECT_FALSE(QFile::permissions(file) & (QFile::ReadGroup | QFile::ReadOther));
}
#endif

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
