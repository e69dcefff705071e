// Cross-section files: what comes back, what is kept, and what is said about bad ones.
#include "cross_sections_fixture.h"
#include "data/hd_file.h"
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

TEST_F(CrossSectionTest, WhatCannotBeTakenIsToldAndTheRestIsRead)
{
    struct Case
    {
        const char *from, *to, *told;
    };
    const Case cases[] = {
        {"    Branch = \"SIDE\"\n", "", "21 Branch:  -> \"BRANCH\""},
        {"Branch = \"SIDE\"", "Branch = 7", "22 Branch: 7 -> \"BRANCH\""},
        {"    Chainage = 300\n", "", "21 Chainage:  -> 0"},
        {"Chainage = 300", "Chainage = \"300\"", "23 Chainage: \"300\" -> 0"},
        {"Chainage = 300", "Chainage = nan", "23 Chainage: nan -> 0"},
        {"Chainage = 300", "Chainage = 300, 4", "23 Chainage: 4 -> "},
        {"Width = 7", "Width =", "24 Width:  -> nan"},
        {"Width = 7", "Width = -0.25", "24 Width: -0.25 -> nan"},
        {"Width = 7", "Width = 7\n    Width = 8", "25 Width: 8 -> "},
        {"    [Roughness]", "    [Profile]\n    [/Profile]\n    [Roughness]", "17 [Profile]:  -> "},
        {"Point = 20, 100", "Point = 20", "13 Point: 20 -> "},
        {"Point = 20, 100", "Point = 9.5, 100", "13 Point: 9.5, 100 -> 10, 100"},
        {"Point = 10, 100\n      Point = 20, 100", "Point = 10\n      Point = -1, 100",
         "12 Point: 10 -> ; 13 Point: -1, 100 -> 0, 100"}, // without the one that is left out
        {"\"2021\"", "\"2019\"", "28 TopoID: \"2019\" -> \"2019-2\""},
        {"KVR_CROSS_SECTIONS", "KVR_NETWORK",
         "river.kvxs is no file of this kind: it has no section [KVR_CROSS_SECTIONS]."},
    };
    for (const Case& each : cases) {
        QByteArray text = SmallSections;
        ASSERT_TRUE(text.contains(each.from)) << each.from;
        text.replace(each.from, each.to);
        CCrossSections read;
        EXPECT_EQ(ReadCrossSections(Write("river.kvxs", text), read).toStdString(), each.told);
        EXPECT_EQ(read.sections.size(), std::size_t(qstrcmp(each.to, "KVR_NETWORK") ? SmallRows : 0)) << each.told;
    }
    CCrossSections read;
    EXPECT_NE(ReadCrossSections(folder.filePath("none.kvxs"), read), "");
    QByteArray text = SmallSections;
    const QString twice = Write("twice.kvxs", text.replace("Width = 20", "Width = 20\n    Width = 8"));
    CKsDocumentFile file;
    file.Read(twice, twice, [&](tqlHandle structure, LoadReport& report) { LoadCrossSections(structure, report); });
    ASSERT_EQ(file.Findings().size(), 1u);
    EXPECT_EQ(file.Findings()[0].section, "CrossSection") << "though sections stand in it";
    EXPECT_EQ(Open("[KVR_CROSS_SECTIONS]\n  [CrossSection]\n"), nullptr);
    EXPECT_EQ(boxes.size(), 1);
}

TEST_F(CrossSectionTest, AFileWithFaultsOpensUnderABarAndIsKeptWhenSavedOver)
{
    QByteArray text = SmallSections;
    text.replace("\"2021\"", "\"2019\"").replace("Width = 7", "Width = -7");
    CheckFindings(Open(text),
                  {"24, expected a width that is not negative.",
                   "28, there is a cross section of branch \"MAIN\" at chainage 2500.5 m with the topo ID \"2019\" "
                   "already."});
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
