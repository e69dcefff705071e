#include "pages/wave_page.h"

#include "ui_wave_page.h"

namespace {

constexpr std::int32_t FullyDynamic = 1, KinematicWave = 3;

} // namespace

CWavePage::CWavePage(CKavo0_hdDoc* document, QWidget* parent)
    : CLocationPage(document, &HD_Parameters::WaveList, parent), m_ui(std::make_unique<Ui::CWavePage>())
{
    m_ui->setupUi(this);
    Bind(m_ui->wave_1010, &HD_Global_Var::G_wave);
    Grid(m_ui->grid_1011)
        .BranchName({.width = 110})
        .Chainage({.caption = Str::UpstreamChainage})
        .Value(&HD_Wavetype::DownstreamChainage, {.emptyIsNotGiven = true})
        .Value(&HD_Wavetype::WaveApproximation,
               {.width = 150, .choice = {.inNewLines = FullyDynamic, .whenEmptied = KinematicWave}});
}

CWavePage::~CWavePage() = default;

void CWavePage::Retranslate()
{
    m_ui->retranslateUi(this);
}
