#include "pages/load_option_dlg.h"

#include "ks/fc/message_box.h"
#include "module/document.h"
#include "pages/framework/page.h"
#include "res/strings.h"
#include "ui_load_option_dlg.h"

namespace {

// Requests of the shell's switchboard to the editors of a project.
constexpr WPARAM LoadFromCrossSections = 40;
constexpr WPARAM LoadFromCrossSectionsAndNetwork = 49;

} // namespace

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
    const WPARAM request = dialog.Option() == 0 ? LoadFromCrossSections : LoadFromCrossSectionsAndNetwork;
    if (!document.AskShell(request, page.GetHost() ? page.GetHost()->HostView() : nullptr))
        KsMessageBox(LoadString(Str::LoadNoAnswer), QMessageBox::Ok, &page);
}
