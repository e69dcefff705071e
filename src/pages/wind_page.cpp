// "Wind": whether wind acts on the water surface, and how strongly.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_wind_page.h"

namespace {

class CWindPage : public CDialogPage<Ui::CWindPage, CLocationPage>
{
public:
    explicit CWindPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::WindList)
    {
        Bindings().Add(m_ui.includeWind_1159, Globals().wind_shear_stress);
        Bindings().TellMeanings();
        Bindings().Add(m_ui.topographical_1004, Globals().G_wind_factor);
        Bindings().Add(m_ui.friction_1006, Globals().G_friction_factor);

        Grid(m_ui.grid_1005)
            .BranchName({.width = 80})
            .Chainage({.width = 72})
            .Value(&HD_Windfact::WindFactor, {.fill = &Globals().G_wind_factor});
    }
};

} // namespace

const PageMaker MakeWindPage = &MakePage<CWindPage>;
