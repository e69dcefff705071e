// "Mixing Coef.": exchange of momentum between the zones of a compound section.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CMixingCoefPage;
}

class CMixingCoefPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CMixingCoefPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CMixingCoefPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CMixingCoefPage> m_ui;
};
