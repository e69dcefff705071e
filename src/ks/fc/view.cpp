#include "ks/fc/doc.h"

CHint::~CHint() = default;

CView::CView(QWidget* parent) : QWidget(parent) {}

CView::~CView()
{
    if (m_document)
        m_document->RemoveView(this);
}

void CView::OnInitialUpdate() {}

void CView::OnUpdate(CView*, int, CHint*) {}

void CView::OnActivateView(bool, CView*, CView*) {}

bool CView::MayLeave(KsLeave)
{
    return true;
}
