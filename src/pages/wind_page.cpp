#include "pages/wind_page.h"

#include "ui_wind_page.h"

CWindPage::CWindPage(CKavo0_hdDoc* document, QWidget* parent)
    : CLocationPage(document, &HD_Parameters::WindList, parent), m_ui(std::make_unique<Ui::CWindPage>())
{
    m_ui->setupUi(this);
    Bind(m_ui->includeWind_1159, &HD_Global_Var::wind_shear_stress);
    Bind(m_ui->topographical_1004, &HD_Global_Var::G_wind_factor, {});
    Bind(m_ui->friction_1006, &HD_Global_Var::G_friction_factor, {});

    Grid(m_ui->grid_1005)
        .BranchName({.width = 80})
        .Chainage({.width = 72})
        .Value(&HD_Windfact::WindFactor, {.fill = &Globals().G_wind_factor});
}

CWindPage::~CWindPage() = default;

void CWindPage::Retranslate()
{
    m_ui->retranslateUi(this);
}
