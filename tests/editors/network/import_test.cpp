// Import of lines: what a GIS file gives, what becomes of every line of it, and in which coordinate system.
#include "editors/network/import_dialog.h"
#include "editors/network/join_lines.h"
#include "gis_files.h"
#include "network_fixture.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFile>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QPointer>
#include <QPushButton>
#include <QTableWidget>

namespace {

using testing::HasSubstr;
using testing::Not;

class ImportTest : public NetworkTest
{
protected:
    static const CGisLibrary& Library()
    {
        QString reason;
        const CGisLibrary* library = GisLibrary(reason);
        EXPECT_NE(library, nullptr) << reason.toStdString();
        return *library;
    }
    QString Make(const char* name, const std::vector<CTestLayer>& layers) const
    {
        const QString path = folder.filePath(name);
        MakeGisFile(path.endsWith(".shp") ? "ESRI Shapefile" : "GPKG", path, layers);
        return path;
    }
    static std::string Notes(const QStringList& notes) { return notes.join('\n').toStdString(); }
    static QStringList Names(const CImportPlan& plan)
    {
        QStringList names;
        for (const CNetworkBranch& branch : plan.branches)
            names << QString("%1 %2-%3").arg(branch.Name()).arg(branch.start).arg(branch.end);
        return names;
    }
    /// What the only layer gives in its own coordinate system.
    CImportPlan PlanOf(const CTestLayer& layer, CImportOptions options, const CNetwork& network = {}) const
    {
        static int number = 0;
        const CGisFile file = Library().Read(Make(qPrintable(QString("plan%1.gpkg").arg(++number)), {layer}));
        EXPECT_EQ(file.layers.size(), 1u) << file.error.toStdString();
        options.fields = ProposeFields(file.layers[0]);
        return PlanImport(file.layers[0], Library().MapOf(file.layers[0], file.layers[0].system), options, network);
    }

    /// Answers the next modal dialogs one after the other.
    void Answer(std::vector<std::function<void(QDialog*)>> answers)
    {
        m_answers = std::move(answers);
        m_clock.disconnect();
        QObject::connect(&m_clock, &QTimer::timeout, [this] {
            auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            if (!dialog || m_answers.empty() || dialog == m_answered)
                return;
            m_answered = dialog;
            const auto act = m_answers.front();
            m_answers.erase(m_answers.begin());
            act(dialog);
        });
        m_clock.start(20);
    }
    ~ImportTest() override { EXPECT_TRUE(m_answers.empty()) << m_answers.size() << " dialogs were not shown"; }

    static QString Report(const QDialog* dialog) { return dialog->findChild<QPlainTextEdit*>("report")->toPlainText(); }
    static void Press(QDialog* dialog, const QString& text)
    {
        const auto buttons = dialog->findChildren<QPushButton*>();
        for (QPushButton* button : buttons) {
            if (button->text().remove('&') == text) {
                EXPECT_TRUE(button->isEnabled()) << text.toStdString();
                button->click();
                if (!button->isEnabled())
                    dialog->reject();
                return;
            }
        }
        ADD_FAILURE() << "no button " << text.toStdString();
    }

private:
    QTimer m_clock;
    std::vector<std::function<void(QDialog*)>> m_answers;
    QPointer<QDialog> m_answered;
};

const CTestLayer Rivers{"rivers",
                        25832,
                        {{"Große Elbe", "LINESTRING Z (500000 0 1, 500300 400 7)", 100, 600},
                         {"MAIN", "LINESTRING (500000 0, 500000 0, 500000 90)", 5, 5},
                         {"", "LINESTRING (500000 0, 500000 10)", 0, 10},
                         {"LAKE", "POINT (500000 1)"},
                         {"DRY", ""},
                         {"HOLLOW", "LINESTRING EMPTY"},
                         {"SPRING", "LINESTRING (5 5, 5 5)"},
                         {"große elbe", "LINESTRING (500000 0, 500000 1000)", 0, 10}}};

TEST_F(ImportTest, EveryLineBecomesABranchOrIsNamedWithAReason)
{
    CNetwork network;
    network.branches.emplace_back().name = "MAIN";
    const CImportPlan plan = PlanOf(Rivers, {}, network);
    EXPECT_EQ(Names(plan), (QStringList{"Große Elbe 100-600", "MAIN (2) 0-90", "Branch 0-10", "große elbe (2) 0-10"}));
    EXPECT_EQ(plan.branches[1].line.size(), 2u);
    EXPECT_EQ(plan.leftOut.size(), 4);
    const std::string left = Notes(plan.leftOut), changed = Notes(plan.changed);
    for (const char* note :
         {"\"LAKE\" (feature 4): is no line (Point).", "\"DRY\" (feature 5): has no geometry.",
          "\"HOLLOW\" (feature 6): the line is empty.", "\"SPRING\" (feature 7): the line has no length."})
        EXPECT_THAT(left, HasSubstr(note));
    for (const char* note :
         {"\"MAIN\" (feature 2): this name is taken; the branch becomes \"MAIN (2)\".",
          "\"MAIN\" (feature 2): no two different chainages; it goes from 0 to its length, 90 m.",
          "feature 3: has no name and becomes \"Branch\".",
          "\"große elbe\" (feature 8): its chainages go from 0 m to 10 m, but the line is 1000 m long."})
        EXPECT_THAT(changed, HasSubstr(note));
    EXPECT_THAT(changed, Not(HasSubstr("Große")));

    const CImportPlan named = PlanOf(Rivers, {.unnamed = false});
    EXPECT_EQ(named.branches.size(), 3u);
    EXPECT_THAT(Notes(named.leftOut), HasSubstr("feature 3: has no name."));
}

TEST_F(ImportTest, PartsThatMeetAreOneBranchAndOthersDoNotRepeatChainages)
{
    const CTestLayer layer{
        "rivers",
        25832,
        {{"JOINED", "MULTILINESTRING ((500000 20, 500000 30), (500000 0, 500000 20), (500000 50, 500000 30))", 0, 50},
         {"SPLIT", "MULTILINESTRING ((500000 0, 500000 30), (500000 40, 500000 110), (7 7, 7 7))", 1000, 1100},
         {"FORK", "MULTILINESTRING ((500000 0, 500000 10), (500000 10, 500005 20), (500000 10, 499995 20))", 0, 20}}};
    const CImportPlan plan = PlanOf(layer, {});
    EXPECT_EQ(Names(plan).mid(0, 3), (QStringList{"JOINED 0-50", "SPLIT-1 0-30", "SPLIT-2 0-70"}));
    EXPECT_EQ(plan.branches.size(), 6u) << "where three ends meet, none goes on";
    EXPECT_EQ(plan.branches[0].line, (CGisLine{{500000, 0}, {500000, 20}, {500000, 30}, {500000, 50}}));
    const std::string changed = Notes(plan.changed);
    EXPECT_THAT(changed, HasSubstr("its 3 parts meet and become one branch. Parts that ran the other way, turned: 1."));
    EXPECT_THAT(changed, HasSubstr("\"SPLIT\" (feature 2): parts without a length, left out: 1 of 3."));
    EXPECT_THAT(changed, HasSubstr("become \"SPLIT-1\" (30 m), \"SPLIT-2\" (70 m). Each goes from 0 to its length."));

    EXPECT_EQ(Names(PlanOf(layer, {.parts = CImportParts::ShareChainages})).mid(1, 2),
              (QStringList{"SPLIT-1 1000-1030", "SPLIT-2 1030-1100"}));
    const CImportPlan without = PlanOf(layer, {.parts = CImportParts::LeaveOut});
    EXPECT_EQ(without.branches.size(), 1u);
    EXPECT_THAT(Notes(without.leftOut), HasSubstr("\"SPLIT\" (feature 2): its parts do not meet: 2 pieces."));

    const auto ring = JoinLines({{{0, 0}, {1, 0}}, {{1, 1}, {0, 0}}, {{1, 0}, {1, 1}}});
    ASSERT_EQ(ring.size(), 1u);
    EXPECT_EQ(ring[0].line, (CGisLine{{0, 0}, {1, 0}, {1, 1}, {0, 0}}));
}

/// The same 20 km of a river north of the Alps in four coordinate systems.
TEST_F(ImportTest, LengthsOnTheMapAreComparedWithTheGround)
{
    const CTestFeature inDegrees{"INN", "LINESTRING (12.0 48.0, 12.2 48.1, 12.2 48.15)"};
    const CGisFile file = Library().Read(Make("degrees.gpkg", {{"degrees", 4326, {inDegrees}}}));
    ASSERT_EQ(file.layers.size(), 1u);
    const CGisLayer& layer = file.layers[0];
    EXPECT_TRUE(layer.system.degrees);
    EXPECT_EQ(layer.system.definition, "EPSG:4326");
    const CGisSystem zone = Library().UtmZone(layer);
    EXPECT_EQ(zone.definition, "EPSG:32633");
    EXPECT_THAT(Library().MapOf(layer, layer.system).error.toStdString(), HasSubstr("is in degrees"));

    const double ground = 24159.69; // T. Vincenty, Direct and inverse solutions of geodesics on the ellipsoid, 1975
    const auto length = [](const CGisMap& map) {
        CNetworkBranch branch;
        branch.line = map.parts.at(0).at(0);
        return branch.Length();
    };
    struct Case
    {
        const char* code;
        double scale, tolerance;
    };
    for (const Case& each : {Case{"EPSG:32633", 1.0002, 1e-4}, Case{"EPSG:3857", 1.4959, 1e-4},
                             Case{"31468", 1.0000, 2e-4}, Case{"EPSG:2056", 1.0002, 2e-4}}) {
        const CGisMap map = Library().MapOf(layer, Library().FindSystem(each.code));
        EXPECT_EQ(map.error.toStdString(), "") << each.code;
        EXPECT_NEAR(map.scale, each.scale, each.tolerance) << each.code;
        EXPECT_NEAR(length(map) / map.scale, ground, 0.0005 * ground) << each.code;
    }
    for (const char* code : {"", "99999999", "river", "EPSG:5703", "EPSG:4978"}) // heights; places in space
        EXPECT_FALSE(Library().FindSystem(code).IsKnown()) << code;

    // In feet of the coordinate system the branch is still in metres.
    const CGisFile feet =
        Library().Read(Make("feet.gpkg", {{"feet", 2263, {{"A", "LINESTRING (980000 200000, 981000 200000)"}}}}));
    EXPECT_NEAR(length(Library().MapOf(feet.layers[0], feet.layers[0].system)), 304.8006, 1e-3); // US survey feet
    // What no coordinate system is named for stays as it is, and nothing is said of the ground.
    for (const char* name : {"plain.shp", "plain.gpkg"}) {
        const CGisFile plain = Library().Read(Make(name, {{"plain", 0, {{"A", "LINESTRING (1 2, 4 6)"}}}}));
        EXPECT_FALSE(plain.layers.at(0).system.IsKnown()) << name;
        const CGisMap asItIs = Library().MapOf(plain.layers.at(0), plain.layers.at(0).system);
        EXPECT_EQ(length(asItIs), 5);
        EXPECT_TRUE(std::isnan(asItIs.scale));
    }
    // Many programs write metres without saying so, and GeoJSON then means degrees.
    const CGisFile metres = Library().Read(Write("metres.geojson", R"({"type":"LineString","coordinates":
        [[512000,5600000],[512100,5600000]]})"));
    EXPECT_FALSE(metres.layers.at(0).system.IsKnown());
}

TEST_F(ImportTest, DamagedFilesSayWhichFeaturesAreMissing)
{
    CTestLayer layer{"rivers", 25832, {}};
    for (int i = 0; i < 20; ++i)
        layer.features.push_back({"R" + std::to_string(i), "LINESTRING (500000 0, 500000 100, 500000 200)", 0, 200});
    const QString path = Make("rivers.shp", {layer});
    EXPECT_TRUE(Library().Read(path).layers.at(0).IsComplete());
    const auto cut = [&](const char* name) {
        QFile file(folder.filePath(name));
        EXPECT_TRUE(file.resize(file.size() / 2));
    };
    cut("rivers.shp");
    const CGisLayer shapes = Library().Read(path).layers.at(0);
    EXPECT_FALSE(shapes.IsComplete());
    const CImportPlan plan = PlanImport(shapes, Library().MapOf(shapes, shapes.system), {ProposeFields(shapes)}, {});
    EXPECT_EQ(plan.branches.size() + std::size_t(plan.leftOut.size()), 20u);
    EXPECT_THAT(Notes(plan.leftOut), HasSubstr("\"R19\" (feature 19): could not be read: Error in fread()"));

    Make("table.shp", {layer});
    cut("table.dbf"); // read without a word up to where it ends
    const CGisLayer table = Library().Read(folder.filePath("table.shp")).layers.at(0);
    EXPECT_FALSE(table.IsComplete());
    EXPECT_EQ(table.announced, 20);
    EXPECT_LT(table.features.size(), 20u);

    for (const auto& [name, text] : {std::pair("text.txt", "no map at all"), {"cut.geojson", "{\"type\":\"Feat"}}) {
        const CGisFile file = Library().Read(Write(name, text));
        EXPECT_THAT(file.error.toStdString(), HasSubstr(std::string(name) + " could not be read as a GIS file: "));
    }
    CNetworkView* view = Open();
    view->Import(folder.filePath("missing.shp"));
    view->Import(Make("points.gpkg", {{"wells", 25832, {{"A", "POINT (1 2)"}, {"B", "POINT (3 4)"}}}}));
    ASSERT_EQ(boxes.size(), 2);
    EXPECT_THAT(boxes[0].toStdString(), HasSubstr("missing.shp could not be read as a GIS file: "));
    EXPECT_THAT(boxes[1].toStdString(), HasSubstr("points.gpkg holds no lines."));
    EXPECT_THAT(boxes[1].toStdString(), HasSubstr("wells: Unknown (any) (2)"));

    Answer({[](QDialog* dialog) {
                auto* import = dialog->findChild<QPushButton*>();
                for (QPushButton* button : dialog->findChildren<QPushButton*>())
                    import = button->text() == "&Import" ? button : import;
                EXPECT_FALSE(import->isEnabled()) << "half a file is not taken before the user says so";
                EXPECT_THAT(dialog->findChild<QLabel*>("warning")->text().toStdString(),
                            HasSubstr("The file is incomplete or damaged. Features with errors: 11 of 20."));
                dialog->findChild<QCheckBox*>("damaged")->click();
                Press(dialog, "Import");
            },
            [](QDialog* dialog) { Press(dialog, "Close"); }});
    view->Import(path);
    EXPECT_EQ(view->Document()->Network().branches.size(), 11u);
}

TEST_F(ImportTest, TheDialogShowsWhatItGivesAndDoesNothingBeforeItIsAccepted)
{
    CNetworkView* view = Open();
    const QString path =
        Make("rivers.gpkg", {{"wells", 25832, {{"A", "POINT (1 2)"}}},
                             Rivers,
                             {"fine", 4326, {{"RIVER WITH A RATHER LONG NAME", "LINESTRING (9 50, 9.1 50)"}}}});
    KsSetFileDialogHandler([&](const KsFileQuestion&) { return path; });
    const auto check = [](QDialog* dialog) {
        auto* layers = dialog->findChild<QTableWidget*>("layers");
        EXPECT_EQ(layers->rowCount(), 3);
        EXPECT_EQ(layers->item(0, 4)->text(), "cannot be taken: no lines among 1 features");
        EXPECT_FALSE(layers->item(0, 0)->flags().testFlag(Qt::ItemIsSelectable));
        EXPECT_EQ(layers->item(2, 3)->text(), "WGS 84 (EPSG:4326)");
        EXPECT_EQ(layers->item(1, 1)->text(), "Line String, Point");
        EXPECT_EQ(layers->currentRow(), 1);
        EXPECT_EQ(dialog->findChild<QComboBox*>("nameField")->currentText(), "River");
        EXPECT_EQ(dialog->findChild<QComboBox*>("endField")->currentText(), "to");
        for (const char* text : {"Branches: 4", "Left out (4)", "\"LAKE\" (feature 4): is no line (Point).",
                                 "Changed (", "  Große Elbe: 500 m long, chainages from 100 m to 600 m"})
            EXPECT_THAT(Report(dialog).toStdString(), HasSubstr(text));
    };
    Answer({[&](QDialog* dialog) {
        check(dialog);
        Press(dialog, "Cancel");
    }});
    EXPECT_TRUE(view->OnCommand(NetworkCommand::Import));
    EXPECT_EQ(view->Document()->UndoStack().count(), 0);

    QString preview, report;
    Answer({[&](QDialog* dialog) {
                dialog->findChild<QTableWidget*>("layers")->selectRow(2);
                EXPECT_EQ(dialog->findChild<QComboBox*>("target")->currentText(),
                          "projected to WGS 84 / UTM zone 32N (EPSG:32632)");
                preview = Report(dialog);
                Press(dialog, "Import");
            },
            [&](QDialog* dialog) {
                report = Report(dialog);
                Press(dialog, "Close");
            }});
    EXPECT_TRUE(view->OnCommand(NetworkCommand::Import));
    EXPECT_EQ(report, preview);
    EXPECT_THAT(report.toStdString(), HasSubstr("Lengths on this map are 0.9996 times those on the ground."));
    EXPECT_THAT(report.toStdString(), HasSubstr("away from the branches of the network"));
    EXPECT_EQ(view->Document()->Network().branches.size(), 3u);
    EXPECT_EQ(view->Document()->Network().system, "") << "where its other branches lie is not known";
    EXPECT_EQ(view->Branches()->currentIndex().row(), 2);
    const int name = view->Branches()->fontMetrics().horizontalAdvance("RIVER WITH A RATHER LONG NAME");
    EXPECT_GT(view->Branches()->columnWidth(BranchName), name);
    EXPECT_TRUE(boxes.isEmpty());
    EXPECT_EQ(view->Document()->UndoStack().count(), 1);
    view->Document()->UndoStack().undo();
    EXPECT_EQ(view->Document()->Network().branches.size(), 2u);
    EXPECT_EQ(view->Branches()->currentIndex().row(), 1) << "the last one that is left";
    EXPECT_FALSE(view->Document()->IsModified());
}

TEST_F(ImportTest, TheNetworkRemembersItsCoordinateSystem)
{
    CNetworkView* view = Open("[KVR_NETWORK]\n[/KVR_NETWORK]\n");
    const QString mercator =
        Make("mercator.gpkg", {{"m", 3857, {{"INN", "LINESTRING (1335834 6106855, 1358098 6123512)"}}}});
    Answer({[](QDialog* dialog) {
                auto* target = dialog->findChild<QComboBox*>("target");
                EXPECT_EQ(target->currentText(), "projected to WGS 84 / UTM zone 33N (EPSG:32633)");
                target->setCurrentIndex(0); // as in the file
                EXPECT_THAT(dialog->findChild<QLabel*>("warning")->text().toStdString(),
                            HasSubstr("Lengths on this map are 1.49 times those on the ground."));
                target->setCurrentIndex(2);
                EXPECT_THAT(dialog->findChild<QLabel*>("warning")->text().toStdString(), HasSubstr("is no EPSG code"));
                dialog->findChild<QLineEdit*>("code")->setText("25832");
                EXPECT_TRUE(dialog->findChild<QLabel*>("warning")->text().isEmpty());
                Press(dialog, "Import");
            },
            [](QDialog* dialog) { Press(dialog, "Close"); }});
    view->Import(mercator);
    const CNetwork& network = view->Document()->Network();
    EXPECT_EQ(network.system, "EPSG:25832");
    ASSERT_EQ(network.branches.size(), 1u);
    EXPECT_NEAR(network.branches[0].Length(), 18606.6, 0.1); // 27805 m on the map of the file
    EXPECT_TRUE(view->Document()->DoSave(folder.filePath("river.kvnw")));
    EXPECT_THAT(Read(folder.filePath("river.kvnw")).toStdString(), HasSubstr("CoordinateSystem = \"EPSG:25832\""));
    Answer({[](QDialog* dialog) {
                auto* target = dialog->findChild<QComboBox*>("target");
                EXPECT_EQ(target->count(), 1);
                EXPECT_THAT(target->currentText().toStdString(), HasSubstr("the network's: ETRS89 / UTM zone 32N"));
                Press(dialog, "Import");
            },
            [](QDialog* dialog) { Press(dialog, "Close"); }});
    view->Import(mercator);
    ASSERT_EQ(network.branches.size(), 2u);
    EXPECT_EQ(network.branches[1].line, network.branches[0].line);
    view->Document()->UndoStack().undo();
    view->Document()->UndoStack().undo();
    EXPECT_EQ(network.system, "");
}

} // namespace
