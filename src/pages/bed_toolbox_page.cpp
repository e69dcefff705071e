// "Bed Resist. Toolbox": bed resistance that follows the flow, by coefficients or by a table over the velocity.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "pages/resistance_formula.h"
#include "ui_bed_toolbox_page.h"

namespace {

enum Method
{
    NotUsed,
    Coefficients,
    Table,
    MethodCount
};

class CBedToolboxPage : public CDialogPage<Ui::CBedToolboxPage, CLocationPage>
{
public:
    explicit CBedToolboxPage(CKavo0_hdDoc* document);
};

CBedToolboxPage::CBedToolboxPage(CKavo0_hdDoc* document)
    : CDialogPage(document, &HD_Parameters::BedResistanceToolboxList)
{
    HDBedResistTools& tools = Globals().BedResist;
    const auto unit = [this] { return ResistanceUnit(Globals().resist_num); };
    Bindings().Add(m_ui.method_1310, tools.Method);
    Bindings().Add(m_ui.zone1_1311, tools.Option1);
    Bindings().Add(m_ui.zone2_1312, tools.Option2);
    Bindings().Add(m_ui.zone3_1313, tools.Option3);
    // A method that nobody knows may use anything.
    const auto uses = [&tools](Method method) { return tools.Method == method || tools.Method >= MethodCount; };
    Bindings().EnableWhen([&tools] { return tools.Method != NotUsed; },
                          {m_ui.zonesLabel, m_ui.zone1_1311, m_ui.zone2_1312, m_ui.zone3_1313});
    Bindings().EnableWhen([uses] { return uses(Coefficients); },
                          {m_ui.coefA_1314, m_ui.coefB_1315, m_ui.minRes_1316, m_ui.maxRes_1317, m_ui.formulaLabel});
    Bindings().Add(m_ui.coefA_1314, tools.CoefA);
    Bindings().Add(m_ui.coefB_1315, tools.CoefB);
    Bindings().Add(m_ui.minRes_1316, tools.MinRes, {.unitText = unit});
    Bindings().Add(m_ui.maxRes_1317, tools.MaxRes, {.unitText = unit});

    const auto lockUnless = [uses](Method method) { return [uses, method](const void*) { return !uses(method); }; };
    const auto coefficient = [&](const double& global) {
        return ColumnSpec{.width = 60, .fill = &global, .locked = lockUnless(Coefficients)};
    };
    const auto bound = [&](const double& global) {
        ColumnSpec options = coefficient(global);
        options.unitText = unit;
        return options;
    };
    using R = HDBedResTool;
    Grid(m_ui.grid_1319)
        .BranchName({.width = 71})
        .Chainage({})
        .Value(&R::CoefA, coefficient(tools.CoefA))
        .Value(&R::CoefB, coefficient(tools.CoefB))
        .Value(&R::MinRes, bound(tools.MinRes))
        .Value(&R::MaxRes, bound(tools.MaxRes));
    for (GridColumns pairs : {PairsGrid(m_ui.pairs_1318, tools.VeloRes), PairsGrid(m_ui.linePairs_1320, &R::VeloRes)})
        pairs.Value(&CBRTVeloRes::Velocity, {.locked = lockUnless(Table)})
            .Value(&CBRTVeloRes::ResValue, {.locked = lockUnless(Table), .unitText = unit});
    Bindings().Always([this] { m_ui.formulaLabel->setText(LoadString(Str::CoefFormula)); });
}

} // namespace

const PageMaker MakeBedToolboxPage = &MakePage<CBedToolboxPage>;
