// "Flood Plain Resist.": the resistance of the flood plains, global and per location.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_flood_page.h"

namespace {

class CFloodPage : public CDialogPage<Ui::CFloodPage, CLocationPage>
{
public:
    explicit CFloodPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::FloodList)
    {
        Bindings().TellMeanings();
        Bindings().Add(m_ui.resistance_1040, Globals().G_flood_plan_res);

        Grid(m_ui.grid_1043)
            .BranchName({.width = 100})
            .Chainage({.width = 72})
            .Value(&HD_Flood_resist::FloodPlainResistance, {.global = {.number = &Globals().G_flood_plan_res}});
    }
};

} // namespace

const PageMaker MakeFloodPage = &MakePage<CFloodPage>;
