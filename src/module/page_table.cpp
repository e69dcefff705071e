#include "module/page_table.h"

#include "pages/bed_page.h"
#include "pages/bed_toolbox_page.h"
#include "pages/default_page.h"
#include "pages/encroach_page.h"
#include "pages/flood_page.h"
#include "pages/heat_balance_page.h"
#include "pages/init_page.h"
#include "pages/klr_init_page.h"
#include "pages/klr_param_page.h"
#include "pages/leakage_page.h"
#include "pages/loss_page.h"
#include "pages/maps_page.h"
#include "pages/mixing_coef_page.h"
#include "pages/output_page.h"
#include "pages/quasi_page.h"
#include "pages/reach_length_page.h"
#include "pages/stratification_page.h"
#include "pages/text_output_page.h"
#include "pages/wave_page.h"
#include "pages/wind_page.h"
#include "pages/wl_curve_page.h"
#include "pages/wl_mark_page.h"
#include "pages/wl_sand_bars_page.h"

namespace {

template <typename Page>
std::unique_ptr<CGenPropertyPage> Make(CKavo0_hdDoc* document)
{
    return std::make_unique<Page>(document);
}

constexpr PageEntry Pages[] = {
    {&Make<CInitPage>, Str::InitialCaption, 1, true},
    {&Make<CWindPage>, Str::WindCaption, 2, true},
    {&Make<CBedPage>, Str::BedCaption, 3, true},
    {&Make<CBedToolboxPage>, Str::BedToolboxCaption, 4, true},
    {&Make<CWavePage>, Str::WaveCaption, 5, true},
    {&Make<CDefaultPage>, Str::DefaultCaption, 6, false},
    {&Make<CQuasiPage>, Str::QuasiCaption, 7, true},
    {&Make<CFloodPage>, Str::FloodCaption, 10, true},
    {&Make<CMixingCoefPage>, Str::MixingCaption, 20, true},
    {&Make<CWLMarkPage>, Str::WLMarkCaption, 11, true},
    {&Make<CLossPage>, Str::LossCaption, NotOnSheet, false},
    {&Make<COutputPage>, Str::OutputCaption, 9, false},
    {&Make<CWLCurvePage>, Str::WLCurveCaption, 21, true},
    {&Make<CWLSandBarsPage>, Str::WLSandBarsCaption, 22, true},
    {&Make<CEncroachPage>, Str::EncroachCaption, 12, true},
    {&Make<CHeatBalancePage>, Str::HeatBalanceCaption, 13, false},
    {&Make<CStratificationPage>, Str::StratificationCaption, 14, false},
    {&Make<CKlrParamPage>, Str::KlrParamCaption, 18, true},
    {&Make<CKlrInitPage>, Str::KlrInitCaption, 19, true},
    {&Make<CReachLengthPage>, Str::ReachLengthCaption, 8, true},
    {&Make<CTextOutputPage>, Str::TextOutputCaption, 15, true},
    {&Make<CMapsPage>, Str::MapsCaption, 16, false},
    {&Make<CLeakagePage>, Str::LeakageCaption, 17, true},
};

} // namespace

std::span<const PageEntry> PageTable()
{
    return Pages;
}
