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
        auto& globals = Globals();
        const auto isDepth = [&globals] { return globals.iLevelDepth == 1; };
        const auto isLevel = [&globals] { return globals.iLevelDepth != 1; };

        Bind({m_ui.level_1201, m_ui.depth_1202}, &HD_Global_Var::iLevelDepth);
        Bind(m_ui.levelOrDepth_1001, &HD_Global_Var::G_waterlevel, {.unitLabel = m_ui.unit_1001});
        Bind(m_ui.discharge_1002, &HD_Global_Var::G_discharge, {.unitLabel = m_ui.unit_1002});
        Bindings().ShowWhen(isLevel, {m_ui.levelLabel_1203});
        Bindings().ShowWhen(isDepth, {m_ui.depthLabel_1204});

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

std::unique_ptr<CGenPropertyPage> MakeInitPage(CKavo0_hdDoc* document)
{
    return std::make_unique<CInitPage>(document);
}
