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

private:
    void LoadBranches();
};

CQuasiPage::CQuasiPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::QSSContractionExpansionList)
{
    using G = HD_Global_Var;
    Bind(m_ui.relax_1024, &G::relax);
    Bind(m_ui.betaLimit_1028, &G::beta_limit);
    Bind(m_ui.fac0_1030, &G::fac_0);
    Bind(m_ui.qconvFactor_1032, &G::qconv_factor);
    Bind(m_ui.hconvFactor_1034, &G::hconv_factor);
    Bind(m_ui.minHconv_1036, &G::min_hconv, {.unitLabel = m_ui.unit_1036});
    Bind(m_ui.qStrucFactor_1038, &G::qstruc_factor);
    Bind(m_ui.hstop_1041, &G::hstop, {.unitLabel = m_ui.unit_1041});

    Bind(m_ui.energyEquation_1187, &G::EnergyEquation);
    Bind(m_ui.contractExpansion_1188, &G::ContractExpansion);
    Bind(m_ui.slopeUpstream_1189, &G::SlopeUpstream);
    Bind(m_ui.velocityCoefficient_1190, &G::VelocityCoefficient);
    Bind(m_ui.noSuppression_1191, &G::NoConvectiveSuppression);
    Bind(m_ui.frictionSlope_1194, &G::FrictionSlope);
    Bind(m_ui.contraction_1042, &G::G_Contraction);
    Bind(m_ui.expansion_1043, &G::G_Expansion);

    const auto usesEnergy = [this] { return Globals().EnergyEquation; };
    Bindings().EnableWhen(usesEnergy,
                          {m_ui.contractExpansion_1188, m_ui.slopeUpstream_1189, m_ui.velocityCoefficient_1190,
                           m_ui.noSuppression_1191, m_ui.frictionSlopeLabel_1193, m_ui.frictionSlope_1194,
                           m_ui.contractionLabel_1198, m_ui.contraction_1042, m_ui.expansionLabel_1199,
                           m_ui.expansion_1043, m_ui.loadBranches_1104});
    Bindings().ShowWhen(usesEnergy, {m_ui.grid_1197});
    connect(m_ui.loadBranches_1104, &QPushButton::clicked, this, &CQuasiPage::LoadBranches);

    Grid(m_ui.grid_1197)
        .BranchName({.width = 110})
        .Chainage({})
        .Value(&HDContraExpan::Contraction, {.fill = &Globals().G_Contraction})
        .Value(&HDContraExpan::Expansion, {.fill = &Globals().G_Expansion});
}

void CQuasiPage::LoadBranches()
{
    AskForLocations(*this);
}

} // namespace

std::unique_ptr<CGenPropertyPage> MakeQuasiPage(CKavo0_hdDoc* document)
{
    return std::make_unique<CQuasiPage>(document);
}
