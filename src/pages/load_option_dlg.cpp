#include "pages/load_option_dlg.h"

#include "document/document.h"
#include "ks/fc/message_box.h"
#include "pages/framework/page.h"
#include "pages/location_loader.h"
#include "res/strings.h"
#include "ui_load_option_dlg.h"

void AskForLocations(CGenPropertyPage& page)
{
    CKavo0_hdDoc& document = *page.GetDocument();
    if (!document.ProjectHandle()) {
        KsMessageBox(LoadString(Str::LoadNeedsProject), QMessageBox::Ok, &page);
        return;
    }
    if (!document.MayChange())
        return;
    QDialog dialog(&page);
    Ui::CEditorsLoadOptionDlg ui;
    ui.setupUi(&dialog);
    ui.branch_1105->setChecked(true);
    if (dialog.exec() != QDialog::Accepted)
        return;
    const bool withWidth = ui.width_1107->isChecked(), withRadius = withWidth || ui.radius_1106->isChecked();
    const WPARAM request = withRadius ? KsRequest::LoadLocationsAndChannel : KsRequest::LoadLocations;
    CObList places;
    if (!document.AskProject(request, page.GetHost() ? page.GetHost()->HostView() : nullptr, &places)) {
        KsMessageBox(LoadString(Str::LoadNoAnswer), QMessageBox::Ok, &page);
        return;
    }
    const LoadedLocations loaded = LoadLocations(page, places, {withRadius, withWidth});
    document.Say(loaded.changed
                     ? LoadString(Str::LocationsLoadedChanged).arg(loaded.added).arg(loaded.known).arg(loaded.changed)
                     : LoadString(Str::LocationsLoaded).arg(loaded.added).arg(loaded.known));
}
