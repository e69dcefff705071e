// "Maps": the result maps that the simulation writes, and the topography that they are made with.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CMapsPage;
}

class CMapsPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CMapsPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CMapsPage() override;

    void LoadFromDocument(CKavo0_hdDoc* document) override;
    void ButtonClicked(CGenGrid& grid, int row, int column) override;

protected:
    void Retranslate() override;

private:
    void DeclareMaps();
    void ShowStatus();

    std::unique_ptr<Ui::CMapsPage> m_ui;
};
