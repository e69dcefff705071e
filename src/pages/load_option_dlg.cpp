#include "pages/load_option_dlg.h"

#include "ks/fc/message_box.h"
#include "document/document.h"
#include "pages/framework/page.h"
#include "pages/location_loader.h"
#include "res/strings.h"
#include "ui_load_option_dlg.h"

CEditorsLoadOptionDlg::CEditorsLoadOptionDlg(QWidget* parent)
    : QDialog(parent), m_ui(std::make_unique<Ui::CEditorsLoadOptionDlg>())
{
    m_ui->setupUi(this);
    m_ui->branch_1105->setChecked(true);
}

CEditorsLoadOptionDlg::~CEditorsLoadOptionDlg() = default;

void CEditorsLoadOptionDlg::accept()
{
    m_option = m_ui->width_1107->isChecked() ? 2 : m_ui->radius_1106->isChecked() ? 1 : 0;
    QDialog::accept();
}

void AskForLocations(CGenPropertyPage& page)
{
    CKavo0_hdDoc& document = *page.GetDocument();
    if (!document.ProjectHandle()) {
        KsMessageBox(LoadString(Str::LoadNeedsProject), QMessageBox::Ok, &page);
        return;
    }
    CEditorsLoadOptionDlg dialog(&page);
    if (dialog.exec() != QDialog::Accepted)
        return;
    const WPARAM request = dialog.Option() == 0 ? KsRequest::LoadLocations : KsRequest::LoadLocationsAndChannel;
    CObList places;
    if (!document.AskProject(request, page.GetHost() ? page.GetHost()->HostView() : nullptr, &places)) {
        KsMessageBox(LoadString(Str::LoadNoAnswer), QMessageBox::Ok, &page);
        return;
    }
    const LoadedLocations loaded = LoadLocations(page, places, {dialog.Option() >= 1, dialog.Option() == 2});
    document.Say(loaded.changed
                     ? LoadString(Str::LocationsLoadedChanged).arg(loaded.added).arg(loaded.known).arg(loaded.changed)
                     : LoadString(Str::LocationsLoaded).arg(loaded.added).arg(loaded.known));
}
