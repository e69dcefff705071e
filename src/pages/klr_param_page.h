// "KLR Parameters": constants of the two-layer model, Richardson bulk flux numbers global and per location.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CKlrParamPage;
}

class CKlrParamPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CKlrParamPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CKlrParamPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CKlrParamPage> m_ui;
};
