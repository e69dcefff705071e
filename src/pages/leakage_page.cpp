// "Groundwater Leakage": whether water leaks to or from the groundwater, and how easily.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_leakage_page.h"

namespace {

class CLeakagePage : public CDialogPage<Ui::CLeakagePage, CLocationPage>
{
public:
    explicit CLeakagePage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::LeakageList)
    {
        HDLeakageGlobal& leakage = Globals().Leakage;
        const auto included = [&leakage] { return leakage.IncludeLeakage; };
        Bindings().Add(m_ui.includeLeakage_1228, leakage.IncludeLeakage);
        Bindings().TellMeanings();
        Bindings().Add(m_ui.coefficient_1238, leakage.LeakageCoefficient);
        Bindings().EnableWhen(included, {m_ui.globalCoefficient, m_ui.localCoefficients_1262});
        Bindings().ShowWhen(included, {m_ui.grid_1186});

        Grid(m_ui.grid_1186)
            .BranchName({.width = 100})
            .Chainage({.width = 72})
            .Value(&HDLeakage::LeakageCoefficient, {.width = 82, .global = {.number = &leakage.LeakageCoefficient}});
    }
};

} // namespace

const PageMaker MakeLeakagePage = &MakePage<CLeakagePage>;
