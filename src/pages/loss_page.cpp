#include "pages/loss_page.h"

#include "ui_loss_page.h"

CLossPage::CLossPage(CKavo0_hdDoc* document, QWidget* parent)
    : CLocationPage(document, &HD_Parameters::WaterList, parent), m_ui(std::make_unique<Ui::CLossPage>())
{
    m_ui->setupUi(this);
    auto columns = Grid(m_ui->grid);
    columns.BranchName({.width = 100}).Chainage({.width = 72});
    int number = 0;
    for (const Field& field : HD_Waterloss::DeclaredFields())
        columns.Value(field,
                      {.header = [n = ++number] { return LoadString(Str::WaterLossNumber).arg(n); }, .width = 82});
}

CLossPage::~CLossPage() = default;

void CLossPage::Retranslate()
{
    m_ui->retranslateUi(this);
}
