// "Initial": the initial state of the computation, global and per location.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CInitPage;
}

class CInitPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CInitPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CInitPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CInitPage> m_ui;
};
