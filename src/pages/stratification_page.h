// "Stratification": layers, densities, turbulence models and reductions of stratified flow.
#pragma once

#include "pages/framework/page.h"
#include "res/strings.h"

#include <memory>

namespace Ui {
class CStratificationPage;
}

class CStratificationPage : public CGenPropertyPage
{
    Q_OBJECT
public:
    explicit CStratificationPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CStratificationPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CStratificationPage> m_ui;
};
