// "Heat Balance": whether the heat balance is calculated, and its parameters.
#include "pages/framework/dialog_page.h"
#include "pages/page_table.h"
#include "ui_heat_balance_page.h"

namespace {

class CHeatBalancePage : public CDialogPage<Ui::CHeatBalancePage>
{
public:
    explicit CHeatBalancePage(CKavo0_hdDoc* document) : CDialogPage(document)
    {
        HDHeatBalance& heat = Globals().HeatBalance;
        Bindings().Add(m_ui.included_1148, heat.Calc);
        Bindings().TellMeanings();
        Bindings().Add(m_ui.latitude_1149, heat.Latitude);
        Bindings().Add(m_ui.longitude_1150, heat.Longitude);
        Bindings().Add(m_ui.timeMeridian_1151, heat.TimeZone);
        Bindings().Add(m_ui.displacement_1152, heat.DisTime);
        Bindings().Add(m_ui.lightAttenuation_1153, heat.LightAtt);
        Bindings().Add(m_ui.beer_1154, heat.betaBeer);
        Bindings().Add(m_ui.radiationA_1155, heat.RadA);
        Bindings().Add(m_ui.radiationB_1156, heat.RadB);
        Bindings().Add(m_ui.vaporizationA_1157, heat.VapA);
        Bindings().Add(m_ui.vaporizationB_1158, heat.VapB);
        // With a group its fields and labels are disabled; they keep their values.
        Bindings().EnableWhen([&heat] { return heat.Calc; },
                              {m_ui.location, m_ui.solarAbsorption, m_ui.radiation, m_ui.vaporization});
    }
};

} // namespace

const PageMaker MakeHeatBalancePage = &MakePage<CHeatBalancePage>;
