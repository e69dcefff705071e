// A page made of a dialog file.
#pragma once

#include "pages/framework/page.h"

#include <utility>

/// Sets up the dialog that the dialog compiler made, and says its texts again in another language. `Base` is what kind of
/// page it is; the page itself binds controls and declares columns in its constructor.
template <typename Dialog, typename Base = CGenPropertyPage>
class CDialogPage : public Base
{
protected:
    /// Arguments beyond the document are those of the base.
    template <typename... Args>
    explicit CDialogPage(CKavo0_hdDoc* document, Args&&... args) : Base(document, std::forward<Args>(args)...)
    {
        m_ui.setupUi(this);
    }
    void Retranslate() override { m_ui.retranslateUi(this); }

    Dialog m_ui;
};
