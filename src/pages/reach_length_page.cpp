#include "pages/reach_length_page.h"

#include "pages/load_option_dlg.h"
#include "ui_reach_length_page.h"

CReachLengthPage::CReachLengthPage(CKavo0_hdDoc* document, QWidget* parent)
    : CLocationPage(document, &HD_Parameters::QSSReachLengthsList, parent),
      m_ui(std::make_unique<Ui::CReachLengthPage>())
{
    m_ui->setupUi(this);
    Bind(m_ui->energyEquation_1187, &HD_Global_Var::EnergyEquation);
    const auto usesEnergy = [this] { return Globals().EnergyEquation; };
    Bindings().ShowWhen(usesEnergy, {m_ui->loadBranches_1104, m_ui->grid_1186});
    connect(m_ui->loadBranches_1104, &QPushButton::clicked, this, [this] { AskForLocations(*this); });

    Grid(m_ui->grid_1186)
        .BranchName({.width = 100})
        .Chainage({.width = 100})
        .Value(&HDReachLength::ReachLength1, {.width = 90})
        .Value(&HDReachLength::ReachLength2, {.width = 90});
}

CReachLengthPage::~CReachLengthPage() = default;

void CReachLengthPage::Retranslate()
{
    m_ui->retranslateUi(this);
}
