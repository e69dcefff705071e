// "User Def. Marks": titles of water level marks, and a level a title at locations.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CWLMarkPage;
}

class CWLMarkPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CWLMarkPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CWLMarkPage() override;

    void AppendLine() override;
    void DeleteLines() override;
    void LoadFromDocument(CKavo0_hdDoc* document) override;

protected:
    void Retranslate() override;

private:
    void ShowLevelColumns();
    void ShowStatus();

    std::unique_ptr<Ui::CWLMarkPage> m_ui;
};
