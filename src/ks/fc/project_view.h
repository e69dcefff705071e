// The view of an editor that takes part in projects: belongs to its project from its first update to its end, shows the
// editor's tool bar while it is active, hands on the requests of other editors, and tells what was done and where the
// user is in the status bar.
#pragma once

#include "ks/fc/frames.h"
#include "ks/fc/project_doc.h"

#include <QVariantMap>

class KS_API CKsProjectView : public CView, public CCommandTarget
{
    Q_OBJECT
public:
    explicit CKsProjectView(QWidget* parent = nullptr) : CView(parent) {}
    ~CKsProjectView() override;

    CKsProjectDoc* ProjectDoc() const { return static_cast<CKsProjectDoc*>(GetDocument()); }

    void OnInitialUpdate() override;
    void OnUpdate(CView* sender, int hint, CHint* object) override;
    void OnActivateView(bool activate, CView* activated, CView* deactivated) override;
    LRESULT WindowProc(unsigned message, WPARAM wParam, LPARAM lParam) override;

protected:
    /// A request of another editor; the base answers 0. Neither the package nor what it points to is kept.
    virtual LRESULT OnRequest(WPARAM request, CKSComm_Package& package);
    /// A project was opened or is about to close.
    virtual void OnProjectsChanged() {}
    /// Brings a change that was undone or redone into view.
    virtual void RevealChange(const ChangePlace&) {}
    /// How the user has arranged the view, for the next time that its file is opened; empty for a view as it comes.
    virtual QVariantMap Arrangement() const { return {}; }
    /// The derived view does so when it goes, before its content does.
    void KeepArrangement() const;
    /// What was kept for the file.
    QVariantMap KeptArrangement() const;
    /// Where the user is, for the status bar.
    virtual CString PlaceText() const { return {}; }
    /// What is selected there. It may come later, and ends nothing that is told.
    virtual CString SelectionText() const { return {}; }
    /// The content below the bar that tells of the document's file.
    void SetContent(QWidget* content);
    /// In the status bar, while this view is the active one: where the user is, and what has just been done.
    void ShowStatus();
    /// The user has turned to something else: what was done before is no longer told.
    void MovedOn();
    bool IsActive() const; // a view outside a frame is
    CKsMDIFrameWnd* MainFrame() const;

private:
    void Say(const CString& text);
    void SendToolbarMessage(unsigned message);
    CString m_said;   // in the status bar behind the place, until the user moves on
    CString m_saidAt; // the place where it was said
};
