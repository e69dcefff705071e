// "Initial": the initial state of the computation, global and per location.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_init_page.h"

namespace {

class CInitPage : public CDialogPage<Ui::CInitPage, CLocationPage>
{
public:
    explicit CInitPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::InitList)
    {
        HD_Global_Var& globals = Globals();
        const auto isDepth = [&globals] { return globals.iLevelDepth == 1; };

        Bindings().Add({m_ui.level_1201, m_ui.depth_1202}, globals.iLevelDepth);
        Bindings().Add(m_ui.levelOrDepth_1001, globals.G_waterlevel,
                       {.title = [isDepth] { return isDepth() ? Str::GlobalWaterDepth : Str::GlobalWaterLevel; }});
        Bindings().Add(m_ui.discharge_1002, globals.G_discharge);

        Grid(m_ui.grid_1003)
            .BranchName({.width = 71})
            .Chainage({.width = 60})
            .Value(&HD_Initial::InitialH,
                   {.header = [isDepth] { return LoadString(isDepth() ? Str::InitialY : Str::InitialH); },
                    .width = 58,
                    .fill = &globals.G_waterlevel})
            .Value(&HD_Initial::InitialQ, {.width = 58, .fill = &globals.G_discharge});
    }
};

} // namespace

const PageMaker MakeInitPage = &MakePage<CInitPage>;
