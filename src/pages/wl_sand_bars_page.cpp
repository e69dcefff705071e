// "W. L. Incr. - Sand Bars": increment of the water level over sand bars, at locations.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/load_option_dlg.h"
#include "pages/page_table.h"
#include "ui_wl_sand_bars_page.h"

namespace {

constexpr std::int32_t ObservedMethod = 1; // the increment itself is given, not what it is computed from

class CWLSandBarsPage : public CDialogPage<Ui::CWLSandBarsPage, CLocationPage>
{
public:
    explicit CWLSandBarsPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::WLSandBarsList)
    {
        HDSandBarIncrement& sand = Globals().SandBarIncrement;
        Bindings().Add(m_ui.enable_1098, sand.Enabled);
        Bindings().Add({m_ui.slope_1108, m_ui.observed_1109}, sand.Method);
        Bindings().EnableWhen([&sand] { return sand.Enabled; }, {m_ui.method, m_ui.load_1104, m_ui.grid_1103});
        connect(m_ui.load_1104, &QPushButton::clicked, this, [this] { AskForLocations(*this); });

        const auto number = [&sand](double& global) {
            const bool isObserved = &global == &sand.Observed;
            return ColumnSpec{
                .width = 62,
                .asFormatted = &global == &sand.Slope, // slopes are far below one, three decimals show nothing of them
                .emptyIsNotGiven = true,
                .locked = [&sand, isObserved](const void*) { return (sand.Method == ObservedMethod) != isObserved; },
                .locationValue = &global == &sand.Width ? LocationValue::Width : LocationValue::None,
                .globalNumber = &global};
        };
        using R = HDWLSandBars;
        GridWithGlobals(m_ui.grid_1103, &sand)
            .BranchName({.width = 71})
            .Chainage({.width = 71})
            .Value(&R::SandBarValue1, number(sand.Slope))
            .Value(&R::SandBarValue2, number(sand.Width))
            .Value(&R::SandBarValue3, number(sand.Area))
            .Value(&R::SandBarValue4, number(sand.Observed));
    }
};

} // namespace

const PageMaker MakeWLSandBarsPage = &MakePage<CWLSandBarsPage>;
