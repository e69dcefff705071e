// Import of lines: what a GIS file gives, and how branches are made of it.
#include "editors/network/import_branches.h"
#include "editors/network/import_dialog.h"
#include "network_fixture.h"

#include <QComboBox>

namespace {

using testing::HasSubstr;

const char* const Utm = R"("crs":{"type":"name","properties":{"name":"urn:ogc:def:crs:EPSG::25832"}},)";

QByteArray Collection(const QByteArray& features, const char* crs = Utm)
{
    return QByteArray("{\"type\":\"FeatureCollection\",") + crs + "\"features\":[" + features + "]}";
}

QByteArray Feature(const char* properties, const char* type, const char* coordinates)
{
    return QByteArray(R"({"type":"Feature","properties":{)") + properties + R"(},"geometry":{"type":")" + type +
           R"(","coordinates":)" + coordinates + "}}";
}

const QByteArray Rivers = Collection(
    Feature(R"("ID":1,"River":"Große Elbe","from":100,"to":700)", "LineString", "[[500000,0],[500300,400,7]]") + "," +
    Feature(R"("ID":2,"River":"MAIN","from":5,"to":5)", "LineString", "[[500000,0],[500000,0],[500000,90]]") + "," +
    Feature(R"("ID":3,"River":null,"from":null,"to":9)", "MultiLineString",
            "[[[500000,0],[500000,10]],[[500000,20],[500000,50]]]") +
    "," + Feature(R"("ID":4,"River":"Lake")", "Point", "[500000,1]"));

TEST_F(NetworkTest, LinesAreReadAndBecomeBranches)
{
    const CGisFile file = ReadGisFile(Write("rivers.geojson", Rivers));
    ASSERT_EQ(file.error.toStdString(), "");
    ASSERT_EQ(file.layers.size(), 1u);
    const CGisLayer& layer = file.layers[0];
    EXPECT_EQ(layer.others, 1);
    const CImportFields fields = ProposeFields(layer);
    EXPECT_EQ(layer.fields.value(fields.name), "River");
    EXPECT_EQ(layer.fields.value(fields.start), "from");

    CNetwork network;
    network.branches.emplace_back().name = "MAIN";
    QStringList notes;
    const auto branches = MakeBranches(layer, fields, network, notes);
    struct Expected
    {
        const char* name;
        double start, end;
        std::size_t vertices;
    };
    const Expected expected[] = {
        {"Große Elbe", 100, 700, 2}, {"MAIN (2)", 0, 90, 2}, {"Branch", 0, 10, 2}, {"Branch (2)", 0, 30, 2}};
    ASSERT_EQ(branches.size(), std::size(expected));
    for (std::size_t i = 0; i < branches.size(); ++i) {
        EXPECT_EQ(branches[i].name.toStdString(), expected[i].name);
        EXPECT_NEAR(branches[i].start, expected[i].start, 1e-9) << expected[i].name;
        EXPECT_NEAR(branches[i].end, expected[i].end, 1e-9) << expected[i].name;
        EXPECT_EQ(branches[i].line.size(), expected[i].vertices) << expected[i].name;
    }
    EXPECT_EQ(branches[0].Length(), 500);
    EXPECT_THAT(notes.join('\n').toStdString(), HasSubstr("\"MAIN\" is taken and becomes \"MAIN (2)\"."));
    EXPECT_THAT(notes.join('\n').toStdString(), HasSubstr("\"MAIN (2)\": no two different chainages"));

    notes.clear(); // without fields
    const auto numbered = MakeBranches(layer, {}, {}, notes);
    EXPECT_EQ(numbered[0].name, "Branch");
    EXPECT_EQ(numbered[0].end, 500);
    EXPECT_TRUE(notes.isEmpty());
}

TEST_F(NetworkTest, FilesThatGiveNoBranchesSayWhy)
{
    struct Case
    {
        const char* name;
        QByteArray text;
        const char* message;
    };
    const QByteArray line = Feature("", "LineString", "[[9.1,48.2],[9.2,48.3]]");
    const Case cases[] = {
        {"text.txt", "no map at all", "text.txt could not be read as a GIS file: "},
        {"cut.geojson", Rivers.left(200), "cut.geojson could not be read as a GIS file: "},
        {"points.geojson", Collection(Feature("", "Point", "[1,2]")), "points.geojson holds no lines (1 features"},
        {"degrees.geojson", Collection(line, ""), "is in degrees of longitude and latitude"},
        {"missing.geojson", "", "missing.geojson could not be read as a GIS file: "},
    };
    for (const Case& each : cases) {
        const QString path = each.text.isEmpty() ? folder.filePath(each.name) : Write(each.name, each.text);
        const CGisFile file = ReadGisFile(path);
        EXPECT_THAT(file.error.toStdString(), HasSubstr(each.message));
        EXPECT_TRUE(file.layers.empty());
    }
    // Many programs write metres without saying so.
    EXPECT_EQ(ReadGisFile(Write("metres.geojson",
                                Collection(Feature("", "LineString", "[[512000,5600000],[512100,5600000]]"), "")))
                  .error,
              "");
    // In feet of the coordinate system the branch is still in metres.
    const char* feet = R"("crs":{"type":"name","properties":{"name":"urn:ogc:def:crs:EPSG::2263"}},)";
    const CGisFile file =
        ReadGisFile(Write("feet.geojson", Collection(Feature("", "LineString", "[[0,0],[1000,0]]"), feet)));
    ASSERT_EQ(file.error.toStdString(), "");
    EXPECT_NEAR(file.layers[0].lines[0].points[1].x(), 304.8006, 1e-3); // US survey feet
}

TEST_F(NetworkTest, TheCommandAsksForFileAndFieldsAndCanBeUndone)
{
    CNetworkView* view = Open();
    QStringList seen;
    const QString path = Write("rivers.geojson", Rivers);
    KsSetFileDialogHandler([&](const KsFileQuestion&) { return path; });
    const auto answer = [&](QDialog::DialogCode code) {
        QTimer::singleShot(0, view, [&seen, code] {
            auto* dialog = qobject_cast<CImportDialog*>(QApplication::activeModalWidget());
            ASSERT_NE(dialog, nullptr);
            seen << dialog->findChild<QComboBox*>("nameField")->currentText()
                 << dialog->findChild<QComboBox*>("endField")->currentText();
            dialog->done(code);
        });
    };
    answer(QDialog::Rejected);
    EXPECT_TRUE(view->OnCommand(NetworkCommand::Import));
    EXPECT_EQ(view->Document()->Network().branches.size(), 2u);
    answer(QDialog::Accepted);
    EXPECT_TRUE(view->OnCommand(NetworkCommand::Import));
    EXPECT_EQ(seen.mid(2), (QStringList{"River", "to"}));
    EXPECT_EQ(view->Document()->Network().branches.size(), 6u);
    EXPECT_EQ(view->Branches()->currentIndex().row(), 2); // the first new one
    ASSERT_EQ(boxes.size(), 1);
    EXPECT_THAT(boxes[0].toStdString(), HasSubstr("MAIN (2)"));
    view->Document()->UndoStack().undo();
    EXPECT_EQ(view->Document()->Network().branches.size(), 2u);
    view->Import(folder.filePath("missing.shp"));
    EXPECT_EQ(boxes.size(), 2);
}

} // namespace
