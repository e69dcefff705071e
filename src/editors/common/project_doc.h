// The document of an editor that takes part in projects: joins and leaves them, tells the others of changes, asks them.
#pragma once

#include "ks/fc/doc.h"
#include "ks/fc/package.h"

class CProjectDoc : public CKsDoc
{
    Q_OBJECT
public:
    /// `kind`: what the editor's packages call themselves.
    explicit CProjectDoc(int kind);

    /// A file that cannot be read is not opened, after a message that names the line.
    BOOL OnOpenDocument(const CString& path) override;
    /// When that fails, the document stays as it is, after a message that tells why.
    BOOL OnSaveDocument(const CString& path) override;

    /// Joins the project that the document's file is a member of; false when there is none.
    bool JoinProject(CView* view);
    void LeaveProject(CView* view);
    /// Tells the other editors of the project that data changed.
    void DataChanged() const;
    /// Tells the other editors of the project that the user of `view` looks at a place.
    void LocationShown(CView* view, const CString& branch, double chainage) const;
    std::intptr_t ProjectHandle() const { return m_project; }

    /// Sends a request to the shell's switchboard, which answers into `objects`; 0 outside a project.
    LRESULT AskProject(WPARAM request, CView* view, CObList* objects) const;
    /// Sends a request with `objects` to one view of another editor.
    LRESULT AskView(CView* receiver, WPARAM request, CView* sender, CObList* objects) const;
    /// The views of the project's other documents, for the duration of the present event.
    std::vector<CView*> ProjectViews(CView* view) const;

protected:
    /// Both return why not, for the user; nothing when it went well.
    virtual QString ReadFile(const CString& path) = 0;
    virtual QString WriteFile(const CString& path) const = 0;

private:
    CKSComm_Package Package(CView* view, CObList* objects) const;

    int m_kind;
    std::intptr_t m_project = 0;
};
