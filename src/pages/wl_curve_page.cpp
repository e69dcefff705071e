// "W. L. Incr. - Curves": increment of the water level in the bends of a river, at locations.
#include "document/store_value.h"
#include "pages/framework/dialog_page.h"
#include "pages/framework/location_page.h"
#include "pages/load_option_dlg.h"
#include "pages/page_table.h"
#include "ui_wl_curve_page.h"

namespace {

class CWLCurvePage : public CDialogPage<Ui::CWLCurvePage, CLocationPage>
{
public:
    explicit CWLCurvePage(CKavo0_hdDoc* document) : CDialogPage(document, &HD_Parameters::WLCurveList)
    {
        HDCurveIncrement& curve = Globals().CurveIncrement;
        Bindings().Add(m_ui.enable_1098, curve.Enabled);
        Bindings().Add(m_ui.range_1099, curve.SystemRange);
        // Only who gives radius and width can give a velocity: what the system defines of these takes the velocity
        // along.
        const auto velocityToo = [this, &curve](bool checked) {
            if (checked)
                StoreValue(*GetDocument(), curve.SystemVelocity, true);
        };
        Bindings().Add(m_ui.width_1100, curve.SystemWidth, velocityToo);
        Bindings().Add(m_ui.radius_1101, curve.SystemRadius, velocityToo);
        Bindings().Add(m_ui.velocity_1102, curve.SystemVelocity, [this, &curve](bool checked) {
            if (checked)
                return;
            StoreValue(*GetDocument(), curve.SystemRadius, false);
            StoreValue(*GetDocument(), curve.SystemWidth, false);
        });
        Bindings().EnableWhen([&curve] { return curve.Enabled; },
                              {m_ui.systemDefinition, m_ui.load_1104, m_ui.grid_1103});
        connect(m_ui.load_1104, &QPushButton::clicked, this, [this] { AskForLocations(*this); });

        const auto velocityIsSystems = [&curve](const void*) {
            return curve.SystemVelocity || curve.SystemRadius || curve.SystemWidth;
        };
        using R = HDWLCurve;
        GridWithGlobals(m_ui.grid_1103, &curve)
            .BranchName({.width = 71})
            .Chainage({.width = 71})
            .Value(&R::CurveOption, {.width = 89,
                                     .locked = [&curve](const void*) { return curve.SystemRange; },
                                     .globalIndex = &curve.Range})
            .Value(&R::CurveValue1, {.width = 53,
                                     .emptyIsNotGiven = true,
                                     .locked = [&curve](const void*) { return curve.SystemWidth; },
                                     .locationValue = LocationValue::Width,
                                     .globalNumber = &curve.Width})
            .Value(&R::CurveValue2, {.width = 53,
                                     .emptyIsNotGiven = true,
                                     .locked = [&curve](const void*) { return curve.SystemRadius; },
                                     .locationValue = LocationValue::Radius,
                                     .globalNumber = &curve.Radius})
            .Value(
                &R::CurveValue3,
                {.width = 53, .emptyIsNotGiven = true, .locked = velocityIsSystems, .globalNumber = &curve.Velocity});
    }
};

} // namespace

const PageMaker MakeWLCurvePage = &MakePage<CWLCurvePage>;
