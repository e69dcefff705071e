// "W. L. Incr. - Sand Bars": increment of the water level over sand bars, at locations.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CWLSandBarsPage;
}

class CWLSandBarsPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CWLSandBarsPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CWLSandBarsPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CWLSandBarsPage> m_ui;
};
