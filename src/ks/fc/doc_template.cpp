#include "ks/fc/doc_template.h"

#include "files/safe_file.h"
#include "ks/fc/file_name.h"
#include "ks/fc/frames.h"
#include "ks/fc/message_box.h"
#include "ks/fc/project_doc.h"
#include "ks/fc/system_reason.h"

#include <QDir>
#include <QFileInfo>
#include <QUndoStack>
#include <algorithm>
#include <new>

namespace {

std::vector<CMultiDocTemplate*>& Templates()
{
    static std::vector<CMultiDocTemplate*> templates;
    return templates;
}

bool IsClosing(const CKsDoc* document)
{
    const auto& views = document->Views();
    return !views.empty() && std::all_of(views.begin(), views.end(), [](const CView* view) {
        const auto* window = CKsMDIChildWnd::Of(view);
        return window && window->IsClosing();
    });
}

} // namespace

CMultiDocTemplate::CMultiDocTemplate(int resourceId, Strings strings, Classes classes)
    : m_resourceId(resourceId), m_strings(std::move(strings)), m_classes(std::move(classes))
{
    Templates().push_back(this);
}

CMultiDocTemplate::CMultiDocTemplate(int resourceId, const CString& strings, Classes classes)
    : CMultiDocTemplate(
          resourceId, [strings] { return strings; }, std::move(classes))
{
}

CMultiDocTemplate::~CMultiDocTemplate()
{
    while (!Documents().empty())
        CloseDocument(Documents().back());
    std::erase(Templates(), this);
}

const std::vector<CMultiDocTemplate*>& CMultiDocTemplate::All()
{
    return Templates();
}

CString CMultiDocTemplate::GetDocString(DocStringIndex index) const
{
    return m_strings().section(u'\n', index, index);
}

bool CMultiDocTemplate::MatchesExtension(const CString& path) const
{
    return KsHasExtension(path, GetDocString(filterExt));
}

CString CMultiDocTemplate::FileDialogFilter() const
{
    return KsFileFilter(GetDocString(filterName).section(QStringLiteral(" ("), 0, 0), GetDocString(filterExt));
}

CKsDoc* CMultiDocTemplate::FindDocument(const CString& path) const
{
    const CString key = KsFileKey(path);
    for (CKsDoc* document : Documents())
        if (!key.isEmpty() && KsFileKey(document->GetPathName()) == key && !IsClosing(document))
            return document;
    return nullptr;
}

/// By another name of the file, too (a hard link).
CKsDoc* CMultiDocTemplate::FindOpen(const CString& path) const
{
    if (CKsDoc* document = FindDocument(path))
        return document;
    for (CKsDoc* document : Documents())
        if (!IsClosing(document) && IsSameFile(document->GetPathName().toStdString(), path.toStdString()))
            return document;
    return nullptr;
}

std::unique_ptr<CKsDoc> CMultiDocTemplate::LoadDocument(const CString& path, bool hold)
{
    std::unique_ptr<CKsDoc> document(m_classes.document());
    if (!document)
        return nullptr;
    document->m_template = this;
    document->m_executing = true;
    if (hold && !path.isEmpty())
        document->HoldFile(path);
    const bool loaded = path.isEmpty() ? document->OnNewDocument() : document->OnOpenDocument(path);
    document->m_executing = false;
    if (!loaded)
        return nullptr;
    if (path.isEmpty())
        document->SetTitle(GetDocString(docName) + CString::number(++m_untitled));
    else
        document->SetPathName(path);
    return document;
}

bool CMultiDocTemplate::ShowDocument(CKsDoc* document, CKsMDIFrameWnd* frame)
{
    std::unique_ptr<CKsMDIChildWnd> window(m_classes.frame());
    std::unique_ptr<CView> view(m_classes.view());
    if (!window || !view)
        return false;
    document->AddView(view.get());
    if (!window->OnCreateClient(view.get()))
        return false;
    CView* shown = view.release(); // the window's from here on
    auto* child = window.release();
    frame->MdiArea().addSubWindow(child);
    shown->OnInitialUpdate();
    frame->ShowWindow(child); // at the size of what is in it now
    shown->setFocus();
    return true;
}

std::unique_ptr<CKsDoc> CMultiDocTemplate::ReadDocument(const CString& path)
{
    const CKsKeptMessages untold;
    const int untitled = m_untitled;
    auto document = LoadDocument(path, false);
    m_untitled = untitled;
    return document;
}

Result<std::string> CMultiDocTemplate::ContentOf(const CString& path)
{
    const auto document = ReadDocument(path);
    const auto* const read = dynamic_cast<const CKsProjectDoc*>(document.get());
    if (!document || (read && read->File().IsUnreadable()))
        return Error{};
    return document->ContentText();
}

CKsDoc* CMultiDocTemplate::OpenDocumentFile(CKsMDIFrameWnd* frame, const CString& path)
{
    const auto before = Documents();
    try {
        return Open(frame, path);
    } catch (const std::bad_alloc&) {
        for (CKsDoc* document : Documents())
            if (!before.contains(document)) // it has no window
                CloseDocument(document);
        KsMessageBox(CKsDoc::tr("%1 could not be opened.\n%2")
                         .arg(QDir::toNativeSeparators(path.isEmpty() ? GetDocString(docName) : path),
                              KsSystemSentence(std::make_error_code(std::errc::not_enough_memory))));
        return nullptr;
    }
}

CKsDoc* CMultiDocTemplate::Open(CKsMDIFrameWnd* frame, const CString& path)
{
    const CString absolute = path.isEmpty() ? path : KsExistingSpelling(QFileInfo(path).absoluteFilePath());
    if (CKsDoc* open = absolute.isEmpty() ? nullptr : FindOpen(absolute)) {
        if (auto* window = open->Views().empty() ? nullptr : CKsMDIChildWnd::Of(open->Views().front()))
            window->BringToFront();
        emit DocumentShown(open);
        return open;
    }
    auto loaded = LoadDocument(absolute, true);
    if (!loaded)
        return nullptr;
    CKsDoc* document = loaded.release();
    document->setParent(this);
    emit DocumentOpened(document);
    if (!ShowDocument(document, frame)) {
        CloseDocument(document);
        return nullptr;
    }
    emit DocumentShown(document);
    return document;
}

void CMultiDocTemplate::CloseDocument(CKsDoc* document)
{
    if (document->parent() != this)
        return;
    document->setParent(nullptr);
    emit DocumentClosing(document);
    document->OnCloseDocument();
    delete document;
}
