#include "pages/klr_param_page.h"

#include "ui_klr_param_page.h"

CKlrParamPage::CKlrParamPage(CKavo0_hdDoc* document, QWidget* parent)
    : CLocationPage(document, &HD_Parameters::KlrParamList, parent), m_ui(std::make_unique<Ui::CKlrParamPage>())
{
    m_ui->setupUi(this);
    HDKlrConstants& klr = Globals().Klr;
    Bindings().Add(m_ui->frictionFactor_1006, klr.fricfac);
    Bindings().Add(m_ui->maxVolume_1153, klr.maxvol, {.unitLabel = m_ui->unit_1153});
    Bindings().Add(m_ui->maxVelocity_1154, klr.maxvelo, {.unitLabel = m_ui->unit_1154});
    Bindings().Add(m_ui->minThickness_1155, klr.minthick, {.unitLabel = m_ui->unit_1155});
    Bindings().Add(m_ui->densityDifference_1156, klr.densdiff);
    Bindings().Add(m_ui->action_1182, klr.action);
    Bindings().Add(m_ui->upward_1157, klr.R1);
    Bindings().Add(m_ui->downward_1158, klr.R2); // whatever its label says
    Bindings().Add(m_ui->upwardAtControls_1159, klr.Rs);

    Grid(m_ui->grid_1186)
        .BranchName({.width = 100})
        .Chainage({.width = 100})
        .Value(&HDKlrParam::R1, {.width = 50})
        .Value(&HDKlrParam::R2, {.width = 50});
}

CKlrParamPage::~CKlrParamPage() = default;

void CKlrParamPage::Retranslate()
{
    m_ui->retranslateUi(this);
}
