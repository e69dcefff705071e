// "Heat Balance": whether the heat balance is calculated, and its parameters.
#pragma once

#include "pages/framework/page.h"
#include "res/strings.h"

#include <memory>

namespace Ui {
class CHeatBalancePage;
}

class CHeatBalancePage : public CGenPropertyPage
{
    Q_OBJECT
public:
    explicit CHeatBalancePage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CHeatBalancePage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CHeatBalancePage> m_ui;
};
