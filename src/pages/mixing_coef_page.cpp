#include "pages/mixing_coef_page.h"

#include "ui_mixing_coef_page.h"

CMixingCoefPage::CMixingCoefPage(CKavo0_hdDoc* document, QWidget* parent)
    : CLocationPage(document, &HD_Parameters::MixingCoefList, parent), m_ui(std::make_unique<Ui::CMixingCoefPage>())
{
    m_ui->setupUi(this);
    HDMixingCoefficients& mixing = Globals().Mixing;
    Bindings().Add(m_ui->coef_1330, mixing.MixCoef1);
    Bindings().Add(m_ui->coef_1331, mixing.MixCoef2);
    Bindings().Add(m_ui->coef_1332, mixing.MixCoef3);
    Bindings().Add(m_ui->coef_1333, mixing.MixCoef4);

    const auto coefficient = [](int number, const double& global) {
        return ColumnOptions{
            .header = [number] { return LoadString(Str::MixCoefNumber).arg(number); }, .width = 60, .fill = &global};
    };
    using R = HDMixingCoef;
    Grid(m_ui->grid_1335)
        .BranchName({.width = 110})
        .Chainage({})
        .Value(&R::MixCoef1, coefficient(1, mixing.MixCoef1))
        .Value(&R::MixCoef2, coefficient(2, mixing.MixCoef2))
        .Value(&R::MixCoef3, coefficient(3, mixing.MixCoef3))
        .Value(&R::MixCoef4, coefficient(4, mixing.MixCoef4));
    for (GridColumns pairs :
         {PairsGrid(m_ui->pairs_1334, mixing.CoefPairs), PairsGrid(m_ui->linePairs_1336, &R::CoefPairs)})
        pairs.Value(&CMixingWCCoef::First).Value(&CMixingWCCoef::Second);
}

CMixingCoefPage::~CMixingCoefPage() = default;

void CMixingCoefPage::Retranslate()
{
    m_ui->retranslateUi(this);
}
