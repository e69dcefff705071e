// Cross-section files: what comes back, what is kept, and what is said about bad ones.
#include "cross_sections_fixture.h"
#include "data/hd_file.h"
#include "editors/cross_sections/section_file.h"
#include "sample_river.h"
#include "sample_sections.h"

namespace {

TEST_F(CrossSectionTest, FilesComeBackWithWhatTheEditorDoesNotKnow)
{
    CCrossSections read;
    ASSERT_EQ(ReadCrossSections(Write("a.kvxs", SmallSections), read), "");
    ASSERT_EQ(read.sections.size(), std::size_t(SmallRows));
    const CCrossSection& main = read.sections[Main2500];
    EXPECT_EQ(main.Key(), std::tuple(QString("MAIN"), QString("2019"), 2500500.0));
    EXPECT_EQ(main.radius, 400);
    EXPECT_EQ(main.width, 20);
    EXPECT_THAT(main.points, testing::ElementsAre(CSectionPoint{0, 110}, CSectionPoint{10, 100}, CSectionPoint{20, 100},
                                                  CSectionPoint{30, 110}));
    EXPECT_EQ(read.sections[Side300].topoId, "");
    EXPECT_TRUE(std::isnan(read.sections[Side300].radius));
    EXPECT_EQ(read.sections[Main1000].points.size(), 2u);

    ASSERT_EQ(WriteCrossSections(folder.filePath("b.kvxs"), read), "");
    const QByteArray written = Read(folder.filePath("b.kvxs"));
    for (const char* kept : {"Datum = \"NHN\", 3", "Surveyor = <C:\\\\data\\\\owner.txt>", "Scale = 2",
                             "Zone = 1, \"reed\"", "[OTHER_PROGRAM]", "Colour = 7"})
        EXPECT_TRUE(written.contains(kept)) << kept << " in\n" << written.toStdString();
    CCrossSections again;
    ASSERT_EQ(ReadCrossSections(folder.filePath("b.kvxs"), again), "");
    ASSERT_EQ(WriteCrossSections(folder.filePath("c.kvxs"), again), "");
    EXPECT_EQ(Read(folder.filePath("c.kvxs")), written);
}

TEST_F(CrossSectionTest, AnErrorNamesTheLineAndWhatWasExpected)
{
    struct Case
    {
        const char *from, *to, *message;
    };
    const Case cases[] = {
        {"    Branch = \"SIDE\"\n", "", "river.kvxs, line 21: a cross section needs the name of its branch."},
        {"Branch = \"SIDE\"", "Branch = \"\"", "line 22: a cross section needs the name of its branch."},
        {"Branch = \"SIDE\"", "Branch = 7", "line 22: expected a text, Branch = \"...\"."},
        {"    Chainage = 300\n", "", "line 21: expected a number after \"Chainage =\"."},
        {"Chainage = 300", "Chainage = \"300\"", "line 23: expected a number after \"Chainage =\"."},
        {"Chainage = 300", "Chainage = nan", "line 23: expected a number after \"Chainage =\"."},
        {"Chainage = 300", "Chainage = 300, 4", "line 23: expected a number after \"Chainage =\"."},
        {"Width = 7", "Width =", "line 24: expected a number after \"Width =\"."},
        {"Width = 7", "Width = -7", "line 24: expected a width that is not negative."},
        {"Width = 7", "Width = 7\n    Width = 8", "line 25: expected only one Width in [CrossSection]."},
        {"    [Roughness]", "    [Profile]\n    [/Profile]\n    [Roughness]",
         "line 17: expected only one Profile in [CrossSection]."},
        {"Point = 20, 100", "Point = 20", "line 13: expected 2 numbers after \"Point =\"."},
        {"Point = 20, 100", "Point = 9.5, 100", "line 13: expected offsets that do not decrease from point to point."},
        {"\"2021\"", "\"2019\"",
         "line 26: there is a cross section of branch \"MAIN\" at chainage 2500.5 m with the topo ID \"2019\" "
         "already."},
        {"KVR_CROSS_SECTIONS", "KVR_NETWORK",
         "river.kvxs is no file of this kind: it has no section [KVR_CROSS_SECTIONS]."},
        {"[/Roughness]", "[/Rough]", "river.kvxs"},
    };
    for (const Case& each : cases) {
        QByteArray text = SmallSections;
        ASSERT_TRUE(text.contains(each.from)) << each.from;
        text.replace(each.from, each.to);
        CCrossSections read;
        read.sections.resize(3);
        const QString error = ReadCrossSections(Write("river.kvxs", text), read);
        EXPECT_TRUE(error.contains(each.message)) << error.toStdString() << "\nexpected " << each.message;
        EXPECT_EQ(read.sections.size(), 3u) << "untouched";
    }
    CCrossSections read;
    EXPECT_NE(ReadCrossSections(folder.filePath("none.kvxs"), read), "");
    EXPECT_EQ(Open("[KVR_CROSS_SECTIONS]\n  [CrossSection]\n"), nullptr);
    EXPECT_EQ(boxes.size(), 1);
}

TEST_F(CrossSectionTest, TheSampleHasSectionsWithWaterAtTheInitialLevel)
{
    const QString path = QString(KVR_SOURCE_DIR) + "/examples/river/river.kvxs";
    EXPECT_EQ(Read(path).toStdString(), SampleSectionsText()) << "make_examples writes it anew";
    CCrossSections sample;
    ASSERT_EQ(ReadCrossSections(path, sample), "");
    EXPECT_EQ(sample.Branches(), QStringList({"AELDER UPPER", "AELDER LOWER", "MOORBECK"}));
    const HD_Parameters river = SampleRiver();
    std::map<std::pair<std::string, double>, double> levels;
    for (std::size_t i = 0; i < river.InitList.GetCount(); ++i) {
        const HD_Initial& at = river.InitList.GetAt(i);
        levels[{at.RiverName, at.Chainage}] = at.InitialH;
    }
    for (const CCrossSection& section : sample.sections) {
        const auto level = levels.find({section.branch, section.chainage});
        ASSERT_NE(level, levels.end()) << section.branch << ' ' << section.chainage;
        const auto water = WaterSurface(section);
        ASSERT_TRUE(water.has_value()) << section.branch << ' ' << section.chainage;
        EXPECT_NEAR(water->level, level->second, 0.02);
        EXPECT_GT(section.radius, section.width);
    }
}

} // namespace
