// "Quasi Steady": the solver of quasi-steady computations, contraction and expansion losses.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/load_option_dlg.h"
#include "pages/page_table.h"
#include "ui_quasi_page.h"

namespace {

class CQuasiPage : public CDialogPage<Ui::CQuasiPage, CLocationPage>
{
public:
    explicit CQuasiPage(CKavo0_hdDoc* document);
};

CQuasiPage::CQuasiPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::QSSContractionExpansionList)
{
    HD_Global_Var& globals = Globals();
    Bindings().Add(m_ui.relax_1024, globals.relax);
    Bindings().Add(m_ui.betaLimit_1028, globals.beta_limit);
    Bindings().Add(m_ui.fac0_1030, globals.fac_0);
    Bindings().Add(m_ui.qconvFactor_1032, globals.qconv_factor);
    Bindings().Add(m_ui.hconvFactor_1034, globals.hconv_factor);
    Bindings().Add(m_ui.minHconv_1036, globals.min_hconv);
    Bindings().Add(m_ui.qStrucFactor_1038, globals.qstruc_factor);
    Bindings().Add(m_ui.hstop_1041, globals.hstop);

    Bindings().Add(m_ui.energyEquation_1187, globals.EnergyEquation);
    Bindings().Add(m_ui.contractExpansion_1188, globals.ContractExpansion);
    Bindings().Add(m_ui.slopeUpstream_1189, globals.SlopeUpstream);
    Bindings().Add(m_ui.velocityCoefficient_1190, globals.VelocityCoefficient);
    Bindings().Add(m_ui.noSuppression_1191, globals.NoConvectiveSuppression);
    Bindings().Add(m_ui.frictionSlope_1194, globals.FrictionSlope);
    Bindings().Add(m_ui.contraction_1042, globals.G_Contraction);
    Bindings().Add(m_ui.expansion_1043, globals.G_Expansion);

    const auto usesEnergy = [&globals] { return globals.EnergyEquation; };
    Bindings().EnableWhen(usesEnergy, {m_ui.contractExpansion_1188, m_ui.slopeUpstream_1189,
                                       m_ui.velocityCoefficient_1190, m_ui.noSuppression_1191, m_ui.frictionSlope_1194,
                                       m_ui.contraction_1042, m_ui.expansion_1043, m_ui.loadBranches_1104});
    Bindings().ShowWhen(usesEnergy, {m_ui.grid_1197});
    connect(m_ui.loadBranches_1104, &QPushButton::clicked, this, [this] { AskForLocations(*this); });

    Grid(m_ui.grid_1197)
        .BranchName({.width = 110})
        .Chainage({})
        .Value(&HDContraExpan::Contraction, {.fill = &globals.G_Contraction})
        .Value(&HDContraExpan::Expansion, {.fill = &globals.G_Expansion});
}

} // namespace

const PageMaker MakeQuasiPage = &MakePage<CQuasiPage>;
