// The view of an editor that takes part in projects: belongs to its project from its first update to its end, shows the
// editor's tool bar while it is active, and hands on the requests of other editors.
#pragma once

#include "editors/common/project_doc.h"
#include "ks/fc/frames.h"

class CProjectView : public CView, public CCommandTarget
{
    Q_OBJECT
public:
    explicit CProjectView(QWidget* parent = nullptr) : CView(parent) {}
    ~CProjectView() override;

    CProjectDoc* ProjectDoc() const { return static_cast<CProjectDoc*>(GetDocument()); }

    void OnInitialUpdate() override;
    void OnActivateView(bool activate, CView* activated, CView* deactivated) override;
    LRESULT WindowProc(unsigned message, WPARAM wParam, LPARAM lParam) override;

protected:
    /// A request of another editor; the base answers 0. Neither the package nor what it points to is kept.
    virtual LRESULT OnRequest(WPARAM request, CKSComm_Package& package);
    /// A project was opened or is about to close.
    virtual void OnProjectsChanged() {}

private:
    void SendToolbarMessage(unsigned message);
};
