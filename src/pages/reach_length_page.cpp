// "Reach Lengths": lengths of the reaches over the left and the right bank, for the energy equation.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/load_option_dlg.h"
#include "pages/page_table.h"
#include "ui_reach_length_page.h"

namespace {

class CReachLengthPage : public CDialogPage<Ui::CReachLengthPage, CLocationPage>
{
public:
    explicit CReachLengthPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::QSSReachLengthsList)
    {
        Bindings().Add(m_ui.energyEquation_1187, Globals().EnergyEquation);
        const auto usesEnergy = [this] { return Globals().EnergyEquation; };
        Bindings().ShowWhen(usesEnergy, {m_ui.loadBranches_1104, m_ui.grid_1186});
        connect(m_ui.loadBranches_1104, &QPushButton::clicked, this, [this] { AskForLocations(*this); });

        Grid(m_ui.grid_1186)
            .BranchName({.width = 100})
            .Chainage({.width = 100})
            .Value(&HDReachLength::ReachLength1, {.width = 90})
            .Value(&HDReachLength::ReachLength2, {.width = 90});
    }
};

} // namespace

const PageMaker MakeReachLengthPage = &MakePage<CReachLengthPage>;
