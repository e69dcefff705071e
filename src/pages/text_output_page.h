// "Time Series Output": which results go into time series files, of which grid points, in which form.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CTextOutputPage;
}

class CTextOutputPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CTextOutputPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CTextOutputPage() override;

    void LoadFromDocument(CKavo0_hdDoc* document) override;
    void ButtonClicked(CGenGrid& grid, int row, int column) override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CTextOutputPage> m_ui;
};
