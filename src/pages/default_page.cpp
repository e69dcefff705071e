// "Default Values": the numerical scheme of the flow computation.
#include "pages/framework/dialog_page.h"
#include "pages/page_table.h"
#include "res/strings.h"
#include "ui_default_page.h"

namespace {

class CDefaultPage : public CDialogPage<Ui::CDefaultPage, CGenPropertyPage>
{
public:
    explicit CDefaultPage(CKavo0_hdDoc* document) : CDialogPage(document)
    {
        using G = HD_Global_Var;
        Bind(m_ui.delta_1012, &G::delta);
        Bind(m_ui.delhs_1013, &G::delhs, {.unitLabel = m_ui.unit_1013});
        Bind(m_ui.delh_1014, &G::delh, {.unitLabel = m_ui.unit_1014});
        Bind(m_ui.alpha_1015, &G::alpha);
        Bind(m_ui.theta_1016, &G::theta);
        Bind(m_ui.eps_1017, &G::eps);
        Bind(m_ui.dhNode_1018, &G::dh_node, {.unitLabel = m_ui.unit_1018});
        Bind(m_ui.zetaMin_1019, &G::zeta_min);
        Bind(m_ui.strucFac_1020, &G::struc_fac);
        Bind(m_ui.froudeMax_1027, &G::froude_max);
        Bind(m_ui.froudeExp_1028, &G::froude_exp);
        Bind(m_ui.inter1Max_1021, &G::inter1_max);
        Bind(m_ui.maxIterSteady_1026, &G::max_iter);
        Bind(m_ui.noIter_1024, &G::no_iter);
        Bindings().AddUnbound(m_ui.nodeCompatibility_1025); // the computation has this one mode so far
    }
};

} // namespace

std::unique_ptr<CGenPropertyPage> MakeDefaultPage(CKavo0_hdDoc* document)
{
    return std::make_unique<CDefaultPage>(document);
}
