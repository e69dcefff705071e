// "Default Values": the numerical scheme of the flow computation.
#include "pages/framework/dialog_page.h"
#include "pages/page_table.h"
#include "ui_default_page.h"

namespace {

class CDefaultPage : public CDialogPage<Ui::CDefaultPage>
{
public:
    explicit CDefaultPage(CKavo0_hdDoc* document) : CDialogPage(document)
    {
        HD_Global_Var& globals = Globals();
        Bindings().TellMeanings();
        Bindings().Add(m_ui.delta_1012, globals.delta);
        Bindings().Add(m_ui.delhs_1013, globals.delhs);
        Bindings().Add(m_ui.delh_1014, globals.delh);
        Bindings().Add(m_ui.alpha_1015, globals.alpha);
        Bindings().Add(m_ui.theta_1016, globals.theta);
        Bindings().Add(m_ui.eps_1017, globals.eps);
        Bindings().Add(m_ui.dhNode_1018, globals.dh_node);
        Bindings().Add(m_ui.zetaMin_1019, globals.zeta_min);
        Bindings().Add(m_ui.strucFac_1020, globals.struc_fac);
        Bindings().Add(m_ui.froudeMax_1027, globals.froude_max);
        Bindings().Add(m_ui.froudeExp_1028, globals.froude_exp);
        Bindings().Add(m_ui.inter1Max_1021, globals.inter1_max);
        Bindings().Add(m_ui.maxIterSteady_1026, globals.max_iter);
        Bindings().Add(m_ui.noIter_1024, globals.no_iter);
        Bindings().AddUnbound(m_ui.nodeCompatibility_1025); // the computation has this one mode so far
    }
};

} // namespace

const PageMaker MakeDefaultPage = &MakePage<CDefaultPage>;
