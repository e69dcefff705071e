// "Reach Lengths": lengths of the reaches over the left and the right bank, for the energy equation.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CReachLengthPage;
}

class CReachLengthPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CReachLengthPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CReachLengthPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CReachLengthPage> m_ui;
};
