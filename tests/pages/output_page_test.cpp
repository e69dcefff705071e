// The page of additional output: a box a keyword.
#include "flow_page_fixture.h"
#include "pages/page_table.h"

#include <QCheckBox>
#include <QScrollArea>

namespace {

const struct
{
    int control;
    const char* keyword;
    const char* name; // row and column
} OutputBoxes[] = {
    {1037, "Velo_H", "Velocity, H and Q points"},
    {1056, "Velo_struc", "Velocity, Structures"},
    {1039, "Discharge_H", "Discharge, H or Q points"},
    {1042, "CrossSec_H", "Cross Section Area, H or Q points"},
    {1044, "FlowWidth_H", "Flow Width, H or Q points"},
    {1046, "Radius_H", "Radius, H or Q points"},
    {1047, "Resistance_H", "Resistance, H or Q points"},
    {1048, "Conveyance_H", "Conveyance, H or Q points"},
    {1049, "FroudeNum_H", "Froude Number, H or Q points"},
    {1055, "Volume_H", "Volume, H or Q points"},
    {1057, "Volume_Total", "Volume, Total"},
    {1050, "FloodArea_H", "Flood Area, H or Q points"},
    {1054, "FloodArea_Total", "Flood Area, Total"},
    {1051, "MassError_H", "Mass Error, H or Q points"},
    {1053, "MassError_Total", "Mass Error, Total"},
    {1052, "AcumMassError_Total", "Accumulated Mass Error, Total"},
    {1180, "LatInflows_H", "Lateral Inflows, H or Q points"},
    {1181, "WaterSlope", "Water level slope, H or Q points"},
    {1182, "EnergySlope", "Energy level slope, H or Q points"},
    {1183, "EnergyLevel", "Energy level, H or Q points"},
    {1184, "BedShearStress", "Bed shear stress, H or Q points"},
    {1228, "GroundwaterHead", "Groundwater head, H or Q points"},
    {1200, "TimeStep", "Time Step, Total"},
};

} // namespace

using OutputPageTest = FlowPagesTest;

TEST_F(OutputPageTest, EveryOutputBoxIsOneKeyword)
{
    globals.AddOutput.ReducedOut = 3;
    globals.AddOutput.Topo_print = globals.AddOutput.Test_print = true;
    Open(MakeOutputPage);
    EXPECT_FALSE(view->linesMenu);
    EXPECT_EQ(view->page->findChildren<QCheckBox*>().size(), int(std::size(OutputBoxes)));
    QPoint last;
    for (const auto& box : OutputBoxes) {
        EXPECT_EQ(Find(box.control)->accessibleName(), box.name);
        EXPECT_FALSE(Find<QCheckBox>(box.control)->isChecked());
        const QPoint at = Find(box.control)->pos();
        EXPECT_TRUE(at.y() > last.y() || (at.y() == last.y() && at.x() > last.x())) << box.name;
        last = at;
        const std::string line = std::string(box.keyword) + " = ";
        EachChangesItsKeyword({{box.control, " ", (line + "true").c_str()}});
        EachChangesItsKeyword({{box.control, " ", (line + "false").c_str()}});
    }
    EXPECT_EQ(globals.AddOutput.ReducedOut, 3);
}

TEST_F(OutputPageTest, TheOutputMatrixScrollsToTheFocusWhenThePageIsLow)
{
    Open(MakeOutputPage);
    view->resize(500, 200);
    QTest::qWait(0);
    const auto* area = view->page->findChild<QScrollArea*>();
    const auto inSight = [&](int number) {
        QWidget* box = Find(number);
        return area->viewport()->rect().contains(QRect(box->mapTo(area->viewport(), QPoint()), box->size()));
    };
    Find(1037)->setFocus();
    EXPECT_TRUE(inSight(1037));
    EXPECT_FALSE(inSight(1200));
    for (std::size_t i = 1; i < std::size(OutputBoxes); ++i)
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    EXPECT_EQ(QApplication::focusWidget(), Find(1200));
    EXPECT_TRUE(inSight(1200));
}
