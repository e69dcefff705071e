// "Bed Resist.": resistance of the bed, of the whole section or of its three zones.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CBedPage;
}

class CBedPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CBedPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CBedPage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CBedPage> m_ui;
};
