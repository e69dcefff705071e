// "Add. Output": which quantities a computation stores besides water level and discharge.
#include "pages/framework/dialog_page.h"
#include "pages/page_table.h"
#include "ui_output_page.h"

namespace {

class COutputPage : public CDialogPage<Ui::COutputPage>
{
public:
    explicit COutputPage(CKavo0_hdDoc* document) : CDialogPage(document)
    {
        HDAddOutput& output = Globals().AddOutput;
        Bindings().Add(m_ui.velocity_1037, output.Velo_H);
        Bindings().Add(m_ui.velocityStructures_1056, output.Velo_struc);
        Bindings().Add(m_ui.discharge_1039, output.Discharge_H);
        Bindings().Add(m_ui.crossSectionArea_1042, output.CrossSec_H);
        Bindings().Add(m_ui.flowWidth_1044, output.FlowWidth_H);
        Bindings().Add(m_ui.radius_1046, output.Radius_H);
        Bindings().Add(m_ui.resistance_1047, output.Resistance_H);
        Bindings().Add(m_ui.conveyance_1048, output.Conveyance_H);
        Bindings().Add(m_ui.froudeNumber_1049, output.FroudeNum_H);
        Bindings().Add(m_ui.volume_1055, output.Volume_H);
        Bindings().Add(m_ui.volumeTotal_1057, output.Volume_Total);
        Bindings().Add(m_ui.floodArea_1050, output.FloodArea_H);
        Bindings().Add(m_ui.floodAreaTotal_1054, output.FloodArea_Total);
        Bindings().Add(m_ui.massError_1051, output.MassError_H);
        Bindings().Add(m_ui.massErrorTotal_1053, output.MassError_Total);
        Bindings().Add(m_ui.accumulatedMassError_1052, output.AcumMassError_Total);
        Bindings().Add(m_ui.lateralInflows_1180, output.LatInflows_H);
        Bindings().Add(m_ui.waterLevelSlope_1181, output.WaterSlope);
        Bindings().Add(m_ui.energyLevelSlope_1182, output.EnergySlope);
        Bindings().Add(m_ui.energyLevel_1183, output.EnergyLevel);
        Bindings().Add(m_ui.bedShearStress_1184, output.BedShearStress);
        Bindings().Add(m_ui.groundwaterHead_1228, output.GroundwaterHead);
        Bindings().Add(m_ui.timeStep_1200, output.TimeStep);
    }
};

} // namespace

const PageMaker MakeOutputPage = &MakePage<COutputPage>;
