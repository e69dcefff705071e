// "Flood Plain Resist.": the resistance of the flood plains, global and per location.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CFloodPage;
}

class CFloodPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CFloodPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CFloodPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CFloodPage> m_ui;
};
