// "Quasi Steady": the solver of quasi-steady computations, contraction and expansion losses.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CQuasiPage;
}

class CQuasiPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CQuasiPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CQuasiPage() override;

protected:
    void Retranslate() override;

private:
    void LoadBranches();

    std::unique_ptr<Ui::CQuasiPage> m_ui;
};
