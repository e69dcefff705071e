#include "pages/bed_toolbox_page.h"

#include "pages/resistance_unit.h"
#include "ui_bed_toolbox_page.h"

CBedToolboxPage::CBedToolboxPage(CKavo0_hdDoc* document, QWidget* parent)
    : CLocationPage(document, &HD_Parameters::BedResistanceToolboxList, parent),
      m_ui(std::make_unique<Ui::CBedToolboxPage>())
{
    m_ui->setupUi(this);
    HDBedResistTools& tools = Globals().BedResist;
    const auto unit = [this] { return ResistanceUnit(Globals().resist_num); };
    Bindings().Add(m_ui->method_1310, tools.Method);
    Bindings().Add(m_ui->zone1_1311, tools.Option1);
    Bindings().Add(m_ui->zone2_1312, tools.Option2);
    Bindings().Add(m_ui->zone3_1313, tools.Option3);
    Bindings().Add(m_ui->coefA_1314, tools.CoefA);
    Bindings().Add(m_ui->coefB_1315, tools.CoefB);
    Bindings().Add(m_ui->minRes_1316, tools.MinRes, {.unitText = unit, .unitLabel = m_ui->unit_1316});
    Bindings().Add(m_ui->maxRes_1317, tools.MaxRes, {.unitText = unit, .unitLabel = m_ui->unit_1317});

    using R = HDBedResTool;
    Grid(m_ui->grid_1319)
        .BranchName({.width = 110})
        .Chainage({})
        .Value(&R::CoefA, {.caption = Str::CoefA, .width = 60, .fill = &tools.CoefA})
        .Value(&R::CoefB, {.caption = Str::CoefB, .width = 60, .fill = &tools.CoefB})
        .Value(&R::MinRes, {.caption = Str::MinRes, .width = 60, .fill = &tools.MinRes, .unitText = unit})
        .Value(&R::MaxRes, {.caption = Str::MaxRes, .width = 60, .fill = &tools.MaxRes, .unitText = unit});
    for (GridColumns pairs : {PairsGrid(m_ui->pairs_1318, tools.VeloRes), PairsGrid(m_ui->linePairs_1320, &R::VeloRes)})
        pairs.Value(VelocityResistances.elements[0], {.caption = Str::Velocity})
            .Value(VelocityResistances.elements[1], {.caption = Str::Resistance, .unitText = unit});
}

CBedToolboxPage::~CBedToolboxPage() = default;

void CBedToolboxPage::Retranslate()
{
    m_ui->retranslateUi(this);
}
