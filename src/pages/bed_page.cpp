// "Bed Resist.": resistance of the bed, of the whole section or of its three zones.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "pages/resistance_formula.h"
#include "ui_bed_page.h"

namespace {

class CBedPage : public CDialogPage<Ui::CBedPage, CLocationPage>
{
public:
    explicit CBedPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::BedList)
    {
        HD_Global_Var& globals = Globals();
        const auto usesZones = [&globals] { return globals.ResisZone == 1; };
        const auto isUniform = [&globals] { return globals.ResisZone != 1; };
        const auto unit = [&globals] { return ResistanceUnit(globals.resist_num); };

        Bindings().Add(m_ui.formula_1300, globals.resist_num, [this](std::int32_t chosen) {
            StoreToDocument(); // what is typed is meant in the formula that stood there
            SwitchResistanceFormula(*GetDocument(), chosen, *m_ui.formula_1300);
        });
        Bindings().Add({m_ui.uniform_1301, m_ui.zones_1302}, globals.ResisZone);
        Bindings().Add(m_ui.resistance_1303, globals.G_resistance, {.unitText = unit});
        Bindings().Add(m_ui.zone_1304, globals.ZoneResistance1, {.unitText = unit});
        Bindings().Add(m_ui.zone_1305, globals.ZoneResistance2, {.unitText = unit});
        Bindings().Add(m_ui.zone_1306, globals.ZoneResistance3, {.unitText = unit});
        Bindings().EnableWhen(isUniform, {m_ui.resistance_1303});
        Bindings().EnableWhen(usesZones, {m_ui.zone_1304, m_ui.zone_1305, m_ui.zone_1306});

        // The values of the approach not in use are kept.
        const auto column = [&](const double& global, bool ofZones) {
            return ColumnSpec{.fill = &global,
                              .locked = [usesZones, ofZones](const void*) { return usesZones() != ofZones; },
                              .unitText = unit};
        };
        using R = HD_Resistfact;
        Grid(m_ui.grid_1307)
            .BranchName({.width = 110})
            .Chainage({})
            .Value(&R::Resistance, column(globals.G_resistance, false))
            .Value(&R::ZoneResistance1, column(globals.ZoneResistance1, true))
            .Value(&R::ZoneResistance2, column(globals.ZoneResistance2, true))
            .Value(&R::ZoneResistance3, column(globals.ZoneResistance3, true));
    }
};

} // namespace

const PageMaker MakeBedPage = &MakePage<CBedPage>;
