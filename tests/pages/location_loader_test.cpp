// Places of other editors in a page's grid.
#include "page_fixture.h"

#include "pages/location_loader.h"

namespace {

/// The increment curves, with the columns that hold radius and width; the radius may be locked.
class CurvesPage : public CLocationPage
{
public:
    explicit CurvesPage(CKavo0_hdDoc* document) : CLocationPage(document, &HD_Parameters::WLCurveList)
    {
        auto* grid = new CGenGrid;
        (new QVBoxLayout(this))->addWidget(grid);
        Grid(grid)
            .BranchName({})
            .Chainage({})
            .Value(&HDWLCurve::CurveValue1, {.fill = &width, .locationValue = LocationValue::Width})
            .Value(&HDWLCurve::CurveValue2,
                   {.locked = [this](const auto&) { return locked; }, .locationValue = LocationValue::Radius});
    }
    double width = 7;
    bool locked = false;
};

class LocationLoaderTest : public PageTest
{
protected:
    void Give(const char* branch, double chainage, double radius = KsUnset, double width = KsUnset)
    {
        auto place = std::make_unique<CKvrCBELocation>();
        place->branch = branch;
        place->chainage = chainage;
        place->radius = radius;
        place->width = width;
        places.push_back(std::move(place));
    }
    std::string Load(CGenPropertyPage& page, LocationValues values)
    {
        const LoadedLocations loaded = LoadLocations(page, places, values);
        return QString("%1 %2 %3").arg(loaded.added).arg(loaded.known).arg(loaded.changed).toStdString();
    }
    std::string Curves() const
    {
        QStringList texts;
        for (std::size_t i = 0; i < list.GetCount(); ++i) {
            const HDWLCurve& curve = list.GetAt(i);
            texts << QString("%1 %2 w%3 r%4")
                         .arg(QString::fromStdString(curve.RiverName))
                         .arg(curve.Chainage)
                         .arg(curve.CurveValue1)
                         .arg(curve.CurveValue2);
        }
        return texts.join(", ").toStdString();
    }
    CGenParamList<HDWLCurve>& list = document.Parameters().WLCurveList;
    CObList places;
};

TEST_F(LocationLoaderTest, NewPlacesBecomeLinesAndKnownOnesGetTheValuesAskedFor)
{
    HDWLCurve old;
    old.RiverName = "Main";
    old.Chainage = 10;
    list.Add(old);
    auto& page = Open<CurvesPage>();
    Give("MAIN", 10, 100, 20);
    Give("Main", 10.5, 110, 21);
    Give("SIDE", 10);
    Give("side", 10, 120, 22); // came already
    const std::string before = Curves();

    struct Case
    {
        LocationValues values;
        bool locked;
        const char *counts, *lines;
    };
    for (const Case& c : {
             Case{{}, false, "2 1 0", "Main 10 w0 r0, MAIN 10.5 w7 r0, SIDE 10 w7 r0"},
             Case{{true, false}, false, "2 1 1", "Main 10 w0 r100, MAIN 10.5 w7 r110, SIDE 10 w7 r0"},
             Case{{true, true}, false, "2 1 1", "Main 10 w20 r100, MAIN 10.5 w21 r110, SIDE 10 w7 r0"},
             Case{{true, true}, true, "2 1 1", "Main 10 w20 r0, MAIN 10.5 w21 r0, SIDE 10 w7 r0"},
             Case{{true, false}, true, "2 1 0", "Main 10 w0 r0, MAIN 10.5 w7 r0, SIDE 10 w7 r0"},
         }) {
        SCOPED_TRACE(c.lines);
        page.locked = c.locked;
        EXPECT_EQ(Load(page, c.values), c.counts);
        EXPECT_EQ(Curves(), c.lines);
        EXPECT_EQ(grid->RowCount(), 3);
        const std::string after = Curves();
        EXPECT_EQ(Load(page, c.values), "0 3 0") << "nothing is doubled or changed again";
        EXPECT_EQ(document.UndoStack().index(), 1);
        document.UndoStack().undo();
        EXPECT_EQ(Curves(), before);
        document.UndoStack().redo();
        EXPECT_EQ(Curves(), after);
        document.UndoStack().undo();
    }
}

TEST_F(LocationLoaderTest, WhatIsTypedStaysAndWhatIsNoPlaceIsPassedOver)
{
    auto& page = Open<CurvesPage>();
    Type(1, 1, "MAIN");
    Give("MAIN", 5);
    Give("", 6);
    Give("MAIN", KsUnset);
    places.push_back(std::make_unique<CKvrCBEText>());
    places.push_back(nullptr);
    EXPECT_EQ(Load(page, {true, true}), "1 0 0");
    EXPECT_EQ(Curves(), "MAIN 1e+10 w7 r0, MAIN 5 w7 r0");
    places.clear();
    EXPECT_EQ(Load(page, {}), "0 0 0");
    EXPECT_TRUE(boxes.isEmpty());
}

} // namespace
