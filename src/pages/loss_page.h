// "Water Loss": four loss coefficients per location. The sheet does not show this page.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CLossPage;
}

class CLossPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CLossPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CLossPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CLossPage> m_ui;
};
