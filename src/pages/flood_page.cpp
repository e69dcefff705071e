#include "pages/flood_page.h"

#include "ui_flood_page.h"

CFloodPage::CFloodPage(CKavo0_hdDoc* document, QWidget* parent)
    : CLocationPage(document, &HD_Parameters::FloodList, parent), m_ui(std::make_unique<Ui::CFloodPage>())
{
    m_ui->setupUi(this);
    Bind(m_ui->resistance_1040, &HD_Global_Var::G_flood_plan_res, {});

    Grid(m_ui->grid_1043)
        .BranchName({.width = 100})
        .Chainage({.width = 72})
        .Value(&HD_Flood_resist::FloodPlainResistance);
}

CFloodPage::~CFloodPage() = default;

void CFloodPage::Retranslate()
{
    m_ui->retranslateUi(this);
}
