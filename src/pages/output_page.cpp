// "Add. Output": which quantities a computation stores besides water level and discharge.
#include "pages/framework/dialog_page.h"
#include "pages/page_table.h"
#include "ui_output_page.h"

namespace {

using Boxes = Ui::COutputPage;
constexpr struct
{
    QCheckBox* Ui_COutputPage::*box;
    bool HDAddOutput::*flag;
} Flags[] = {
    {&Boxes::velocity_1037, &HDAddOutput::Velo_H},
    {&Boxes::velocityStructures_1056, &HDAddOutput::Velo_struc},
    {&Boxes::discharge_1039, &HDAddOutput::Discharge_H},
    {&Boxes::crossSectionArea_1042, &HDAddOutput::CrossSec_H},
    {&Boxes::flowWidth_1044, &HDAddOutput::FlowWidth_H},
    {&Boxes::radius_1046, &HDAddOutput::Radius_H},
    {&Boxes::resistance_1047, &HDAddOutput::Resistance_H},
    {&Boxes::conveyance_1048, &HDAddOutput::Conveyance_H},
    {&Boxes::froudeNumber_1049, &HDAddOutput::FroudeNum_H},
    {&Boxes::volume_1055, &HDAddOutput::Volume_H},
    {&Boxes::volumeTotal_1057, &HDAddOutput::Volume_Total},
    {&Boxes::floodArea_1050, &HDAddOutput::FloodArea_H},
    {&Boxes::floodAreaTotal_1054, &HDAddOutput::FloodArea_Total},
    {&Boxes::massError_1051, &HDAddOutput::MassError_H},
    {&Boxes::massErrorTotal_1053, &HDAddOutput::MassError_Total},
    {&Boxes::accumulatedMassError_1052, &HDAddOutput::AcumMassError_Total},
    {&Boxes::lateralInflows_1180, &HDAddOutput::LatInflows_H},
    {&Boxes::waterLevelSlope_1181, &HDAddOutput::WaterSlope},
    {&Boxes::energyLevelSlope_1182, &HDAddOutput::EnergySlope},
    {&Boxes::energyLevel_1183, &HDAddOutput::EnergyLevel},
    {&Boxes::bedShearStress_1184, &HDAddOutput::BedShearStress},
    {&Boxes::groundwaterHead_1228, &HDAddOutput::GroundwaterHead},
    {&Boxes::timeStep_1200, &HDAddOutput::TimeStep},
};

class COutputPage : public CDialogPage<Ui::COutputPage, CGenPropertyPage>
{
public:
    explicit COutputPage(CKavo0_hdDoc* document);

protected:
    void Retranslate() override;

private:
    void NameBoxes();
};

COutputPage::COutputPage(CKavo0_hdDoc* document) : CDialogPage(document)
{
    for (const auto& [box, flag] : Flags)
        Bindings().Add(m_ui.*box, Globals().AddOutput.*flag);
    NameBoxes();
}

void COutputPage::NameBoxes()
{
    // A box has no text of its own; its row and its column say what it is.
    const QGridLayout& cells = *m_ui.matrixLayout;
    const auto textAt = [&cells](int row, int column) {
        return qobject_cast<const QLabel*>(cells.itemAtPosition(row, column)->widget())->text();
    };
    for (const auto& [box, flag] : Flags) {
        int row = 0, column = 0, rows = 0, columns = 0;
        cells.getItemPosition(cells.indexOf(m_ui.*box), &row, &column, &rows, &columns);
        (m_ui.*box)->setAccessibleName(textAt(row, 0) + ", " + textAt(0, column));
    }
}

void COutputPage::Retranslate()
{
    CDialogPage::Retranslate();
    NameBoxes();
}

} // namespace

std::unique_ptr<CGenPropertyPage> MakeOutputPage(CKavo0_hdDoc* document)
{
    return std::make_unique<COutputPage>(document);
}
