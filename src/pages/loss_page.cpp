// "Water Loss": four loss coefficients per location. The sheet does not show this page.
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/page_table.h"
#include "ui_loss_page.h"

namespace {

class CLossPage : public CDialogPage<Ui::CLossPage, CLocationPage>
{
public:
    explicit CLossPage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::WaterList)
    {
        auto columns = Grid(m_ui.grid);
        columns.BranchName({.width = 100}).Chainage({.width = 72});
        for (const Field& field : HD_Waterloss::DeclaredFields())
            columns.Value(field, {.width = 82});
    }
};

} // namespace

const PageMaker MakeLossPage = &MakePage<CLossPage>;
