#include "pages/leakage_page.h"

#include "ui_leakage_page.h"

CLeakagePage::CLeakagePage(CKavo0_hdDoc* document, QWidget* parent)
    : CLocationPage(document, &HD_Parameters::LeakageList, parent), m_ui(std::make_unique<Ui::CLeakagePage>())
{
    m_ui->setupUi(this);
    HDLeakageGlobal& leakage = Globals().Leakage;
    const auto included = [&leakage] { return leakage.IncludeLeakage; };
    Bindings().Add(m_ui->includeLeakage_1228, leakage.IncludeLeakage);
    Bindings().Add(m_ui->coefficient_1238, leakage.LeakageCoefficient);
    Bindings().EnableWhen(included, {m_ui->globalCoefficient, m_ui->localCoefficients_1262});
    Bindings().ShowWhen(included, {m_ui->grid_1186});

    Grid(m_ui->grid_1186)
        .BranchName({.width = 100})
        .Chainage({.width = 72})
        .Value(&HDLeakage::LeakageCoefficient, {.width = 82});
}

CLeakagePage::~CLeakagePage() = default;

void CLeakagePage::Retranslate()
{
    m_ui->retranslateUi(this);
}
