// "KLR Initial": initial values of the two layers, global and per location.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CKlrInitPage;
}

class CKlrInitPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CKlrInitPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CKlrInitPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CKlrInitPage> m_ui;
};
