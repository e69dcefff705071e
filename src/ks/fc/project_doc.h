// The document of an editor that takes part in projects: joins and leaves them, tells the others of changes, asks them.
// It knows the file that it was read from, and what of that was not taken as it stands.
#pragma once

#include "ks/fc/doc.h"
#include "ks/fc/document_file.h"
#include "ks/fc/file_notice.h"
#include "ks/fc/file_use.h"
#include "ks/fc/package.h"

#include <QStringList>
#include <memory>

class CKsOutsideChange;
class QUndoCommand;

class KS_API CKsProjectDoc : public CKsDoc
{
    Q_OBJECT
public:
    /// `kind`: what the editor's packages call themselves.
    explicit CKsProjectDoc(int kind);

    /// The file last opened or saved.
    const CKsDocumentFile& File() const { return m_file; }
    /// Another program has the file, or it could not be parsed and nobody has asked to edit what is shown instead.
    bool IsReadOnly() const final { return IsInUse() || m_showsDefaults; }
    bool IsInUse() const final { return m_use.IsElsewhere(); }
    bool ShowsDefaults() const { return m_showsDefaults; }
    /// What is shown instead of a file that could not be parsed may be edited.
    void EditUnreadable();
    /// So may a file that nobody else has any more; what has been written to it meanwhile is read first.
    void EditFreed();
    /// The document becomes one of another name, for which the user is asked.
    void EditCopy();
    void HoldFile(const CString& path) final { m_use.Take(path); }
    CString HolderOf(const CString& path) const final { return m_use.HolderOf(path); }
    /// The file has got further names (hard links).
    void FileHasMoreNames() { m_use.Follow(m_file.Path()); }
    /// What there is to say of the file, for the bar above the views; in the order in which it is shown.
    std::vector<KsFileNotice> Notices();
    /// Who has something to say of the file adds it here for as long as the document lives, and has the notices shown
    /// anew (FileStateChanged) when it is another.
    void AddNoticeSource(KsNoticeSource source);
    bool TakeContent(std::string text, const CString& step) final;
    FileStatus Seen() const final { return m_file.Seen(); }
    bool IsFileGone() const final;

    /// What the file holds now becomes the document's content, as one step to undo; the document is not modified then.
    /// What is being typed is asked for first. False, with the reason in `why` if it is the file's, when nothing has
    /// changed.
    bool Reload(CString& why);
    /// Saves over what another program has written, which is kept in a copy; the user has been told.
    bool SaveOverOthers();
    /// What other programs do to the file; the views say when that matters.
    CKsOutsideChange& Outside() { return *m_outside; }

    /// Joins the project that the document's file is a member of; false when there is none.
    bool JoinProject(CView* view);
    void LeaveProject(CView* view);
    /// 0 outside a project.
    std::intptr_t ProjectHandle() const { return m_project; }

    /// Tells the other editors of the project that data changed. Every step on the undo stack, forth or back, is told
    /// by itself, once, when the event that it belongs to is over.
    void DataChanged() { TellProject(KsRequest::DataChanged, nullptr); }
    /// Tells at once what waits to be told.
    void TellChanges();
    /// Tells the other editors of the project that the user of `view` looks at a place.
    void LocationShown(CView* view, const CString& branch, double chainage);

    /// Sends a request to the shell's switchboard; its answer, 0 outside a project. What the other editors have to say
    /// is appended to `objects`, which stays the caller's.
    LRESULT AskProject(WPARAM request, CView* view, CObList* objects = nullptr) const;
    /// Tells the other editors of the project something (KsRequest); nothing outside a project.
    void TellProject(WPARAM news, CView* view, CObList* objects = nullptr) const;
    /// Sends a request with `objects` to one view of another editor.
    LRESULT AskView(CView* receiver, WPARAM request, CView* sender, CObList* objects) const;
    /// The views of the project's other documents, for the duration of the present event.
    std::vector<CView*> ProjectViews(CView* view) const;
    /// The names of the branches that the project's other editors know, as they spell them; none is empty.
    QStringList BranchNames(CView* view) const;

signals:
    /// What is known of File(), IsReadOnly() or Notices() is another.
    void FileStateChanged();

protected:
    /// `load` takes what a file holds, see CKsDocumentFile::Read.
    void ReadFile(const CString& path, const std::function<void(tqlHandle, LoadReport&)>& load);
    /// Has `write` write to `target` (CKsDocumentFile::Write); on failure the user is told why.
    bool WriteFile(const CString& target, const KsFileWriter& write);
    /// A step that makes what a file holds the document's content; null for an editor that has none.
    virtual std::unique_ptr<QUndoCommand> MakeContentStep(tqlHandle structure, LoadReport& report, const CString& text);
    /// The file has been written: it is what the document holds, and its name the document's.
    void FileWritten();

    CKsDocumentFile m_file;

private:
    void FileIsKnown();
    void StepMade();
    CString WhyReadOnly() const final;
    void ReadOnlyChanged();
    void UseNotice(std::vector<KsFileNotice>& notices);
    void OwnNotice(std::vector<KsFileNotice>& notices);
    LRESULT Send(CKsWindow* window, unsigned message, WPARAM request, CView* sender, CObList* objects) const;

    int m_kind;
    CKsFileUse m_use;
    bool m_showsDefaults = false;
    bool m_isUseClosed = false; // the notice that the file cannot be kept from others
    std::vector<KsNoticeSource> m_noticeSources;
    bool m_isNoticeClosed = false; // what was to be said of the last open or save
    std::intptr_t m_project = 0;
    int m_untold = 0; // steps that the project has not heard of
    CKsOutsideChange* m_outside; // child; it adds a notice source
};
