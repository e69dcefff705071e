// "Wind": whether wind acts on the water surface, and how strongly.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CWindPage;
}

class CWindPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CWindPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CWindPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CWindPage> m_ui;
};
