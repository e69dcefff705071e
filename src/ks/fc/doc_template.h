// What an editor offers the shell: how to make a document with its frame and view.
#pragma once

#include "ks/fc/doc.h"

#include <QPointer>
#include <functional>
#include <memory>
#include <vector>

class CKsMDIChildWnd;
class CKsMDIFrameWnd;

/// A document template. The shell owns it; it owns its open documents, which are its children. A document is deleted
/// when its last window has closed.
class KS_API CMultiDocTemplate : public QObject
{
    Q_OBJECT
public:
    /// The seven lines of a template string.
    enum DocStringIndex
    {
        windowTitle,
        docName,
        fileNewName,
        filterName,
        filterExt,
        regFileTypeId,
        regFileTypeName
    };

    struct Classes
    {
        std::function<CKsDoc*()> document;
        std::function<CKsMDIChildWnd*()> frame;
        std::function<CView*()> view;
    };

    /// The seven fields, separated by line breaks. They are asked for whenever one is needed, so that names and file
    /// filters are in the user's language, which may change.
    using Strings = std::function<CString()>;
    CMultiDocTemplate(int resourceId, Strings strings, Classes classes);
    /// For an editor that has one language.
    CMultiDocTemplate(int resourceId, const CString& strings, Classes classes);
    ~CMultiDocTemplate() override;

    /// All that exist, in the order of their making.
    static const std::vector<CMultiDocTemplate*>& All();
    int ResourceId() const { return m_resourceId; }
    CString GetDocString(DocStringIndex index) const;
    /// Whether the template's extension fits, whatever its case.
    bool MatchesExtension(const CString& path) const;
    /// The template's entry for a file dialog, with the extension in lower and upper case.
    CString FileDialogFilter() const;

    /// Opens `path` (a new untitled document when empty) in a new window of the frame. Null when it failed; the
    /// document has told the user why. A file that is open already is brought to the front instead. `frame` is not
    /// null.
    CKsDoc* OpenDocumentFile(CKsMDIFrameWnd* frame, const CString& path);

    /// What OpenDocumentFile would read, without a window and without a word to the user; null when it failed. The
    /// document is the caller's.
    std::unique_ptr<CKsDoc> ReadDocument(const CString& path);
    /// Everything in a file - of a new document when the path is empty - as the editor writes it, for a comparison: what
    /// is written otherwise in the file is no difference. An error when it cannot be read.
    Result<std::string> ContentOf(const CString& path);
    /// The open document of a file; null when there is none.
    CKsDoc* FindDocument(const CString& path) const;

signals:
    void DocumentOpened(CKsDoc* document); // loaded or new; it has no window yet
    void DocumentShown(CKsDoc* document);  // in its window, which may have been there before
    void DocumentClosing(CKsDoc* document);

private:
    friend class CKsMDIChildWnd;
    std::unique_ptr<CKsDoc> LoadDocument(const CString& path, bool hold);
    CKsDoc* Open(CKsMDIFrameWnd* frame, const CString& path);
    CKsDoc* FindOpen(const CString& path) const;
    bool ShowDocument(CKsDoc* document, CKsMDIFrameWnd* frame);
    void CloseDocument(CKsDoc* document);
    QList<CKsDoc*> Documents() const { return findChildren<CKsDoc*>(Qt::FindDirectChildrenOnly); }

    int m_resourceId;
    Strings m_strings;
    Classes m_classes;
    int m_untitled = 0;
};
