// Documents and views of the shell.
#pragma once

#include "base/result.h"
#include "files/field.h"
#include "files/platform_file.h"
#include "ks/fc/change_place.h"
#include "ks/fc/messages.h"
#include "ks/fc/types.h"

#include <QObject>
#include <QWidget>
#include <memory>
#include <optional>
#include <vector>

class CKsDoc;
class CKsUnsavedChanges;
class CMultiDocTemplate;
class QUndoStack;

/// Something handed along with an update; owned by the sender.
class KS_API CHint
{
public:
    virtual ~CHint();
};

/// How much of what is being edited is about to be left.
enum class KsLeave
{
    Field, // the field or cell; its page stays in front
    Page   // the page with all that is on it
};

/// A window on a document. Owned by its frame.
class KS_API CView : public QWidget, public CKsWindow
{
    Q_OBJECT
public:
    explicit CView(QWidget* parent = nullptr);
    ~CView() override; // leaves its document

    CKsDoc* GetDocument() const { return m_document; }

    /// Called once, when the document has been opened or created.
    virtual void OnInitialUpdate();
    /// The document changed: see CKsDoc::UpdateAllViews. `sender` is null when no view caused it.
    virtual void OnUpdate(CView* sender, int hint, CHint* object);
    /// A view's window became active or stopped being active. Either view may be null.
    virtual void OnActivateView(bool activate, CView* activated, CView* deactivated);
    /// Asked before anything changes the page, the window, the document or the program: what is being edited stores,
    /// refuses (the user has been told once; the field is in sight and has the focus) or reverts. False: nothing may
    /// change. Requests that only read never ask.
    virtual bool MayLeave(KsLeave what);

private:
    friend class CKsDoc;
    CKsDoc* m_document = nullptr;
};

/// What a user wants to become of a document that is about to close.
enum class KsClosing
{
    Keep, // nothing closes
    Save,
    Close // as it is: there is nothing to save, or it is discarded
};

/// While one lives, documents that are made take this for the dates that their file lacks: those that are compared with
/// each other have the same. One that is not set changes nothing.
class KS_API CKsDatesOfFiles
{
public:
    explicit CKsDatesOfFiles(const HDDateTime& date);
    ~CKsDatesOfFiles();
    CKsDatesOfFiles(const CKsDatesOfFiles&) = delete;
    CKsDatesOfFiles& operator=(const CKsDatesOfFiles&) = delete;

private:
    std::optional<HDDateTime> m_before;
};

/// A document: one file, its views, its modified flag and its undo stack. Owned by its template.
class KS_API CKsDoc : public QObject
{
    Q_OBJECT
public:
    CKsDoc();
    ~CKsDoc() override;

    // What the shell calls; an editor's document overrides them. Paths are absolute.
    virtual BOOL OnNewDocument();
    /// The base checks that the file is there and can be read (a message names path and reason), then empties the
    /// document.
    virtual BOOL OnOpenDocument(const CString& path);
    virtual BOOL OnSaveDocument(const CString& path) = 0;
    /// Empties the document; before new and open, and at close.
    virtual void DeleteContents();
    /// Called last, when the document's windows are gone.
    virtual void OnCloseDocument();

    /// The file that OnSaveDocument really writes when it is given `path`. A document that chooses the extension itself
    /// says so here, so that the question before overwriting is asked about that file.
    virtual CString SavePathFor(const CString& path) const;

    // What keeps a document's changes for the case that the program ends without a save.
    /// Everything that the document holds, unfinished lines included, as the text of a file of its kind; an error when
    /// there is no such text. Computes only: a copy of the process calls it, without a user interface.
    virtual Result<std::string> ContentText() const;
    /// Such a text becomes what the document holds, as one step to undo that is called `step`. False, and nothing has
    /// changed, when it is no file of the kind.
    virtual bool TakeContent(std::string text, const CString& step);
    /// Keeps other programs from writing a file that is about to be opened in a window, for as long as the document is
    /// its.
    virtual void HoldFile(const CString& path);
    /// Another program edits the file.
    virtual bool IsInUse() const { return false; }
    /// Which other program has a file that a save might write, as users are told; empty when none has.
    virtual CString HolderOf(const CString& path) const;
    /// Nothing may be changed.
    virtual bool IsReadOnly() const { return false; }
    /// Asked before whatever changes the content; undo steps ask by themselves. False: the user has been told why not,
    /// in passing.
    bool MayChange();

    /// The file is there no more, as somebody else has removed or renamed it: what is shown is nowhere else, changed or
    /// not.
    virtual bool IsFileGone() const { return false; }
    /// Something would be lost if the document were closed now.
    bool IsUnsaved() const { return m_modified || IsFileGone(); }
    /// What the file on the disk was when the document was read from it or written to it.
    virtual FileStatus Seen() const { return {}; }
    /// What stands in the document for dates that its file lacked: the time when it was made, unless CKsDatesOfFiles
    /// say another.
    const HDDateTime& DateOfFile() const { return m_dateOfFile; }
    /// The content has come from a document of this date; one that is not set is none.
    void TakeDateOfFile(const HDDateTime& date)
    {
        if (date.IsValid())
            m_dateOfFile = date;
    }

    /// Saves to `path` and takes the name that was written (the one set by SetPathName during OnSaveDocument, otherwise
    /// SavePathFor(path)) when it worked; an empty path asks for one, as Save As. When it could not be written, the
    /// user is asked for another name, too, if he wants. `proposal` is what a question for the name begins with.
    BOOL DoSave(const CString& path, const CString& proposal = {});
    /// Has the views take over what is being typed, then asks whether to save when something is unsaved. Nothing is saved
    /// yet.
    KsClosing AskToClose();
    /// Asks, and saves when that is the answer; false when the user cancelled or the save failed.
    BOOL SaveModified();
    /// Asks every view whether what is being typed there can be taken; see CView::MayLeave.
    bool MayLeave();
    bool IsExecuting() const { return m_executing; } // in the middle of an open or a save
    /// A document without a file belongs beside this one: its first save proposes the name, or a free one like it.
    void StandBeside(const CString& path) { m_beside = path; }
    const CString& StandsBeside() const { return m_beside; }

    const CString& GetPathName() const { return m_path; } // empty until first saved
    void SetPathName(const CString& path);
    CString GetTitle() const; // file name as it can be seen, or the template's document name with a number
    void SetTitle(const CString& title);

    bool IsModified() const { return m_modified; }
    void SetModifiedFlag(bool modified = true);

    // Hints by which every editor's views move the values being edited into the document, and show the document again.
    static constexpr int StoreHint = 1, ReloadHint = 2;
    /// Calls OnUpdate of every view but the sender.
    void UpdateAllViews(CView* sender, int hint = 0, CHint* object = nullptr);
    /// The content changed: marks the document modified, updates all views but the sender, and gives the sender the
    /// focus back. Every command of the undo stack calls it (CDocumentCommand).
    virtual void UpdateAll(CView* sender = nullptr, int hint = ReloadHint, CHint* object = nullptr);
    /// The whole content has become another: lines that views know are there no more, though their like may be.
    void ContentReplaced() { ++m_contents; }
    int Contents() const { return m_contents; } // how many it has had
    /// A step that is being undone or redone shows here; told (Reveal) when the step is complete.
    void StepShows(const ChangePlace& place) { m_stepShows = place; }
    /// Tells the user in passing.
    void Say(const CString& text) { emit Said(text); }
    const std::vector<CView*>& Views() const { return m_views; }
    void AddView(CView* view);
    void RemoveView(CView* view);

    QUndoStack& UndoStack() const { return *m_undo; }
    /// What steps have done to lines since the last save.
    CKsUnsavedChanges& UnsavedChanges() const { return *m_unsaved; }
    CMultiDocTemplate* GetDocTemplate() const { return m_template; }

signals:
    void TitleChanged(); // path, title or modified flag
    void FileGoneChanged();
    void PathNameChanged(const CString& oldPath, const CString& newPath);
    /// A step was undone or redone; the view brings what it changed into view.
    void Reveal(const ChangePlace& place);
    /// What was done, for the status bar.
    void Said(const CString& text);

protected:
    /// In the user's language, when nothing may be changed.
    virtual CString WhyReadOnly() const { return {}; }
    /// Tells why OnSaveDocument could not write. When DoSave has called it, the user is told when it is over, and may
    /// choose another name at once.
    void TellNotSaved(const CString& why);

private:
    friend class CMultiDocTemplate;
    void StepMade(int index);
    bool SaveTo(const CString& target);

    CString m_path, m_title, m_whyNotSaved, m_beside;
    HDDateTime m_dateOfFile;
    int m_contents = 0;
    std::vector<CView*> m_views;
    QUndoStack* m_undo = nullptr; // child object
    std::unique_ptr<CKsUnsavedChanges> m_unsaved;
    CMultiDocTemplate* m_template = nullptr;
    bool m_modified = false, m_executing = false;
    bool m_named = false; // SetPathName was called during a save
    std::optional<ChangePlace> m_stepShows;
    int m_steps = 0; // the undo stack's index, as last heard
};
