// "Load Branch and Chainage": which editors of the project a page's locations are loaded from.
#pragma once

#include "ks/fc/types.h"

#include <QDialog>
#include <memory>

class CGenPropertyPage;
namespace Ui {
class CEditorsLoadOptionDlg;
}

class CEditorsLoadOptionDlg : public QDialog
{
    Q_OBJECT
public:
    explicit CEditorsLoadOptionDlg(QWidget* parent = nullptr);
    ~CEditorsLoadOptionDlg() override;

    /// 0 branch and chainage, 1 also the radius, 2 also the channel width.
    int Option() const { return m_option; }
    void accept() override;

private:
    std::unique_ptr<Ui::CEditorsLoadOptionDlg> m_ui;
    int m_option = 0;
};

/// Asks the user what to load and the project's editors for it, and puts it into the page's grid (location_loader.h).
/// The user is told how many lines came, when the document belongs to no project, and when no editor answers.
void AskForLocations(CGenPropertyPage& page);
