// A page outside the program, hosted as the program's view hosts it.
#pragma once

#include "document/document.h"
#include "pages/framework/page.h"

#include <QApplication>

/// Relays updates of the document to the page, as the program's view does.
class PageView : public CView, public IPageHost
{
public:
    PageView(CKavo0_hdDoc& document, CGenPropertyPage& page) : m_document(document), m_page(page)
    {
        page.SetHost(this);
        document.AddView(this);
    }
    void OnUpdate(CView*, int, CHint*) override { m_page.LoadFromDocument(&m_document); }
    CView* HostView() override { return this; }
    void EditedLineChanged() override
    {
        m_page.StoreToDocument();
        m_document.UpdateAllViews(nullptr, CKsDoc::ReloadHint);
    }
    void CurrentLocationChanged() override {}
    void Execute(int) override {}
    QStringList BranchNames() override { return {}; }
    void EnableLinesMenu(bool) override {}

private:
    CKavo0_hdDoc& m_document;
    CGenPropertyPage& m_page;
};

inline void Show(QWidget& widget)
{
    widget.resize(800, 700);
    widget.show();
    widget.repaint();
    QApplication::processEvents();
}
