// "Mixing Coef.": exchange of momentum between the zones of a compound section.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_mixing_coef_page.h"

namespace {

class CMixingCoefPage : public CDialogPage<Ui::CMixingCoefPage, CLocationPage>
{
public:
    explicit CMixingCoefPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::MixingCoefList)
    {
        HDMixingCoefficients& mixing = Globals().Mixing;
        Bindings().Add(m_ui.coef_1330, mixing.MixCoef1);
        Bindings().Add(m_ui.coef_1331, mixing.MixCoef2);
        Bindings().Add(m_ui.coef_1332, mixing.MixCoef3);
        Bindings().Add(m_ui.coef_1333, mixing.MixCoef4);

        using R = HDMixingCoef;
        Grid(m_ui.grid_1335)
            .BranchName({.width = 71})
            .Chainage({})
            .Value(&R::MixCoef1, {.width = 60, .fill = &mixing.MixCoef1})
            .Value(&R::MixCoef2, {.width = 60, .fill = &mixing.MixCoef2})
            .Value(&R::MixCoef3, {.width = 60, .fill = &mixing.MixCoef3})
            .Value(&R::MixCoef4, {.width = 60, .fill = &mixing.MixCoef4});
        for (GridColumns pairs :
             {PairsGrid(m_ui.pairs_1334, mixing.CoefPairs), PairsGrid(m_ui.linePairs_1336, &R::CoefPairs)})
            pairs.Value(&CMixingWCCoef::First).Value(&CMixingWCCoef::Second);
    }
};

} // namespace

const PageMaker MakeMixingCoefPage = &MakePage<CMixingCoefPage>;
