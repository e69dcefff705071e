#include "module/page_table.h"

#include "pages/bed_page.h"
#include "pages/bed_toolbox_page.h"
#include "pages/default_page.h"
#include "pages/encroach_page.h"
#include "pages/flood_page.h"
#include "pages/heat_balance_page.h"
#include "pages/init_page.h"
#include "pages/leakage_page.h"
#include "pages/loss_page.h"
#include "pages/mixing_coef_page.h"
#include "pages/quasi_page.h"
#include "pages/stratification_page.h"
#include "pages/wave_page.h"
#include "pages/wind_page.h"

namespace {

template <typename Page>
std::unique_ptr<CGenPropertyPage> Make(CKavo0_hdDoc* document)
{
    return std::make_unique<Page>(document);
}

constexpr PageEntry Pages[] = {
    {&Make<CInitPage>, 1, true},
    {&Make<CWindPage>, 2, true},
    {&Make<CBedPage>, 3, true},
    {&Make<CBedToolboxPage>, 4, true},
    {&Make<CWavePage>, 5, true},
    {&Make<CDefaultPage>, 6, false},
    {&Make<CQuasiPage>, 7, true},
    {&Make<CFloodPage>, 10, true},
    {&Make<CMixingCoefPage>, 20, true},
    {&Make<CLossPage>, NotOnSheet, false},
    {&Make<CEncroachPage>, 12, true},
    {&Make<CHeatBalancePage>, 13, false},
    {&Make<CStratificationPage>, 14, false},
    {&Make<CLeakagePage>, 17, true},
};

} // namespace

std::span<const PageEntry> PageTable()
{
    return Pages;
}
