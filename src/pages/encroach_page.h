// "Encroachment": set-ups of narrowed flood plains, each a list of locations.
#pragma once

#include "pages/framework/location_page.h"

#include <memory>

namespace Ui {
class CEncroachPage;
}

class CEncroachPage : public CLocationPage
{
    Q_OBJECT
public:
    explicit CEncroachPage(CKavo0_hdDoc* document, QWidget* parent = nullptr);
    ~CEncroachPage() override;
    void LoadFromDocument(CKavo0_hdDoc* document) override;
    bool Shows(const ChangePlace& place) const override;
    void Reveal(const ChangePlace& place, bool focus) override;

protected:
    void Retranslate() override;

private:
    using Setup = CGenParamList<HDEncroach>;
    CGenMetaList<HDEncroach>& Setups() const;
    std::size_t SetupOf(const void* list) const;
    bool HasSetup() const { return m_current < Setups().GetCount(); }

    void DeclareColumns();
    /// Stores what is being edited and shows another set-up.
    void GoTo(std::size_t setup);
    /// Puts a new set-up behind the current one.
    void Insert(std::unique_ptr<Setup> setup);
    std::unique_ptr<Setup> NewSetup() const;
    void Delete();
    void ShowSetups();

    std::unique_ptr<Ui::CEncroachPage> m_ui;
    std::size_t m_current = 0; // the set-up in the grid
};
