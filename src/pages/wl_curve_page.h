// "W. L. Incr. - Curves": increment of the water level in the bends of a river, at locations.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CWLCurvePage;
}

class CWLCurvePage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CWLCurvePage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CWLCurvePage() override;

protected:
    void Retranslate() override;

private:
    std::unique_ptr<Ui::CWLCurvePage> m_ui;
};
