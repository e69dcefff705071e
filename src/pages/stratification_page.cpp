// "Stratification": layers, densities, turbulence models and reductions of stratified flow.
#include "pages/framework/dialog_page.h"
#include "pages/page_table.h"
#include "ui_stratification_page.h"

namespace {

class CStratificationPage : public CDialogPage<Ui::CStratificationPage>
{
public:
    explicit CStratificationPage(CKavo0_hdDoc* document) : CDialogPage(document)
    {
        HDStratification& flow = Globals().Stratification;
        Bindings().TellMeanings();
        Bindings().Add(m_ui.layers_1175, flow.npv);
        Bindings().Add(m_ui.densities_1148, flow.dens);
        Bindings().Add(m_ui.viscosity_1176, flow.visc);
        Bindings().Add(m_ui.fluidModel_1177, flow.vmf);
        Bindings().Add(m_ui.bedModel_1178, flow.vmb);
        Bindings().TellMeanings(false); // two groups stand beside each other
        Bindings().Add(m_ui.richardson_1179, flow.Rich);
        Bindings().Add(m_ui.baroclinic_1180, flow.bpr1);
        Bindings().Add(m_ui.bedSlope_1181, flow.bpr2);
        Bindings().Add(m_ui.horizontalMomentum_1184, flow.uu);
        Bindings().Add(m_ui.verticalMomentum_1185, flow.uw);
        Bindings().Add(m_ui.advection_1186, flow.uwc);
        Bindings().Add(m_ui.horizontalViscosity_1182, flow.dfx);
        Bindings().Add(m_ui.verticalViscosity_1183, flow.dfz);
        Bindings().EnableWhen([&flow] { return flow.dens; }, {m_ui.richardson_1179});
    }
};

} // namespace

const PageMaker MakeStratificationPage = &MakePage<CStratificationPage>;
