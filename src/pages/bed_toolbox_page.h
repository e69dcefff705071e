// "Bed Resist. Toolbox": bed resistance that follows the flow, by coefficients or by a table over the velocity.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CBedToolboxPage;
}

class CBedToolboxPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CBedToolboxPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CBedToolboxPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CBedToolboxPage> m_ui;
};
