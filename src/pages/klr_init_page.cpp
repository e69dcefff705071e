// "KLR Initial": initial values of the two layers, global and per location.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_klr_init_page.h"

namespace {

class CKlrInitPage : public CDialogPage<Ui::CKlrInitPage, CLocationPage>
{
public:
    explicit CKlrInitPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::KlrInitList)
    {
        // Eight digits: millimetres and litres also of large levels and discharges.
        HDKlrInitial& klr = Globals().KlrInit;
        Bindings().Add(m_ui.waterLevel_1183, klr.h1);
        Bindings().Add(m_ui.interfaceLevel_1184, klr.h0);
        Bindings().Add(m_ui.topDischarge_1185, klr.Q1);
        Bindings().Add(m_ui.bottomDischarge_1161, klr.Q0);

        Grid(m_ui.grid_1186)
            .BranchName({.width = 100})
            .Chainage({.width = 100})
            .Value(&HDKlrInit::h1, {.width = 50, .global = {.number = &klr.h1}})
            .Value(&HDKlrInit::h0, {.width = 50, .global = {.number = &klr.h0}})
            .Value(&HDKlrInit::Q1, {.width = 50, .global = {.number = &klr.Q1}})
            .Value(&HDKlrInit::Q0, {.width = 50, .global = {.number = &klr.Q0}});
    }
};

} // namespace

const PageMaker MakeKlrInitPage = &MakePage<CKlrInitPage>;
