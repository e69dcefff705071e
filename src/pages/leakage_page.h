// "Groundwater Leakage": whether water leaks to or from the groundwater, and how easily.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CLeakagePage;
}

class CLeakagePage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CLeakagePage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CLeakagePage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CLeakagePage> m_ui;
};
