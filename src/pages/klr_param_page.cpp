// "KLR Parameters": constants of the two-layer model, Richardson bulk flux numbers global and per location.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_klr_param_page.h"

namespace {

class CKlrParamPage : public CDialogPage<Ui::CKlrParamPage, CLocationPage>
{
public:
    explicit CKlrParamPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::KlrParamList)
    {
        HDKlrConstants& klr = Globals().Klr;
        Bindings().TellMeanings();
        Bindings().Add(m_ui.frictionFactor_1006, klr.fricfac);
        Bindings().Add(m_ui.maxVolume_1153, klr.maxvol);
        Bindings().Add(m_ui.maxVelocity_1154, klr.maxvelo);
        Bindings().Add(m_ui.minThickness_1155, klr.minthick);
        Bindings().Add(m_ui.densityDifference_1156, klr.densdiff);
        Bindings().TellMeanings(false);
        Bindings().Add(m_ui.action_1182, klr.action);
        Bindings().Add(m_ui.upward_1157, klr.R1);
        Bindings().Add(m_ui.downward_1158, klr.R2); // whatever its label says
        Bindings().Add(m_ui.upwardAtControls_1159, klr.Rs);

        Grid(m_ui.grid_1186)
            .BranchName({.width = 100})
            .Chainage({.width = 100})
            .Value(&HDKlrParam::R1, {.width = 50, .global = {.number = &klr.R1}})
            .Value(&HDKlrParam::R2, {.width = 50, .global = {.number = &klr.R2}});
    }
};

} // namespace

const PageMaker MakeKlrParamPage = &MakePage<CKlrParamPage>;
