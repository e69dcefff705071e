// "Add. Output": which quantities a computation stores besides water level and discharge.
#pragma once

#include "pages/framework/page.h"

#include <memory>

namespace Ui {
class COutputPage;
}

class COutputPage : public CGenPropertyPage
{
    Q_OBJECT
public:
    explicit COutputPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~COutputPage() override;

protected:
    void Retranslate() override;

private:
    void NameBoxes();

    std::unique_ptr<Ui::COutputPage> m_ui;
};
