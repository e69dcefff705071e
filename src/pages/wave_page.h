// "Wave Approx": which approximation of the momentum equation is used, everywhere and in reaches.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CWavePage;
}

class CWavePage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CWavePage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CWavePage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CWavePage> m_ui;
};
