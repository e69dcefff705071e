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
        Bind(m_ui.includeWind_1159, &HD_Global_Var::wind_shear_stress);
        Bind(m_ui.topographical_1004, &HD_Global_Var::G_wind_factor, {});
        Bind(m_ui.friction_1006, &HD_Global_Var::G_friction_factor, {});

        Grid(m_ui.grid_1005)
            .BranchName({.width = 80})
            .Chainage({.width = 72})
            .Value(&HD_Windfact::WindFactor, {.fill = &Globals().G_wind_factor});
    }
};

} // namespace

std::unique_ptr<CGenPropertyPage> MakeWindPage(CKavo0_hdDoc* document)
{
    return std::make_unique<CWindPage>(document);
}
