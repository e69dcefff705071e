#include "pages/init_page.h"

#include "ui_init_page.h"

CInitPage::CInitPage(CKavo0_hdDoc* document, QWidget* parent)
    : CLocationPage(document, &HD_Parameters::InitList, parent), m_ui(std::make_unique<Ui::CInitPage>())
{
    m_ui->setupUi(this);
    auto& globals = Globals();
    const auto isDepth = [&globals] { return globals.iLevelDepth == 1; };
    const auto isLevel = [&globals] { return globals.iLevelDepth != 1; };

    Bind({m_ui->level_1201, m_ui->depth_1202}, &HD_Global_Var::iLevelDepth);
    Bind(m_ui->levelOrDepth_1001, &HD_Global_Var::G_waterlevel, {.unitLabel = m_ui->unit_1001});
    Bind(m_ui->discharge_1002, &HD_Global_Var::G_discharge, {.unitLabel = m_ui->unit_1002});
    Bindings().ShowWhen(isLevel, {m_ui->levelLabel_1203});
    Bindings().ShowWhen(isDepth, {m_ui->depthLabel_1204});

    Grid(m_ui->grid_1003)
        .BranchName({.width = 71})
        .Chainage({.width = 60})
        .Value(&HD_Initial::InitialH,
               {.header = [isDepth] { return LoadString(isDepth() ? Str::InitialY : Str::InitialH); },
                .width = 58,
                .fill = &globals.G_waterlevel})
        .Value(&HD_Initial::InitialQ, {.width = 58, .fill = &globals.G_discharge});
}

CInitPage::~CInitPage() = default;

void CInitPage::Retranslate()
{
    m_ui->retranslateUi(this);
}
