// "Wave Approx": which approximation of the momentum equation is used, everywhere and in reaches.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_wave_page.h"

namespace {

constexpr std::int32_t FullyDynamic = 1, KinematicWave = 3;

class CWavePage : public CDialogPage<Ui::CWavePage, CLocationPage>
{
public:
    explicit CWavePage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::WaveList)
    {
        Bindings().Add(m_ui.wave_1010, Globals().G_wave);
        Grid(m_ui.grid_1011)
            .BranchName({.width = 110})
            .Chainage({.header = LineOf(Str::UpstreamChainage)})
            .Value(&HD_Wavetype::DownstreamChainage, {.emptyIsNotGiven = true})
            .Value(&HD_Wavetype::WaveApproximation,
                   {.width = 150,
                    .global = {.index = &Globals().G_wave},
                    .choices = {.inNewLines = FullyDynamic, .whenEmptied = KinematicWave}});
    }
};

} // namespace

const PageMaker MakeWavePage = &MakePage<CWavePage>;
