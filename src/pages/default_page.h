// "Default Values": the numerical scheme of the flow computation.
#pragma once

#include "pages/framework/page.h"
#include "res/strings.h"

#include <memory>

namespace Ui {
class CDefaultPage;
}

class CDefaultPage : public CGenPropertyPage
{
    Q_OBJECT
public:
    explicit CDefaultPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CDefaultPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CDefaultPage> m_ui;
};
