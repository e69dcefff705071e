#include "module/data_exchange.h"

#include "data/hd_file.h"
#include "document/list_rows.h"
#include "grid/row_commands.h"
#include "ks/fc/file_name.h"
#include "ks/fc/message_box.h"
#include "module/data_tables.h"
#include "module/kavo0_hd.h"
#include "module/sheet.h"
#include "module/view.h"
#include "pages/framework/page.h"

#include <QPointer>
#include <QScopedValueRollback>
#include <QUndoStack>
#include <cmath>
#include <optional>

namespace {

void Log(const char* why)
{
    qDebug("HD data exchange: %s; nothing is done", why);
}

/// The content of a file that is only looked at.
std::optional<HD_Parameters> ReadFile(const CString& path)
{
    if (!CKavo0_hdDoc::HasExtension(path)) {
        Log("the file is none of this editor's");
        return {};
    }
    auto content = LoadHDFile(KsExistingSpelling(path).toStdString());
    if (content)
        return std::move(content.value());
    Log(content.error().message.c_str());
    return {};
}

bool IsReady(const CKavo0_hdDoc& document)
{
    if (document.IsExecuting()) {
        Log("the document is being opened or saved");
        return false;
    }
    for (const CView* view : document.Views()) {
        const auto* window = CKsMDIChildWnd::Of(view);
        if (window && window->IsClosing()) {
            Log("the document is being closed");
            return false;
        }
    }
    return true;
}

/// The view as one of this editor's that can serve a request.
CKavo0_hdView* Ready(CView* view)
{
    auto* served = qobject_cast<CKavo0_hdView*>(view);
    if (!served || !served->GetDocument() || !served->ActivePage()) {
        Log("the view is none of this editor's, or has no document");
        return nullptr;
    }
    return IsReady(*served->GetDocument()) ? served : nullptr;
}

/// The document of the file in this program, opened if need be. A file that is open already is never opened again:
/// the two would overwrite each other. A new window is one of the shell's own template, as if the user had opened it.
CKsDoc* OpenFile(const CString& path, CKsMDIFrameWnd& frame)
{
    CMultiDocTemplate* documents = nullptr;
    for (CMultiDocTemplate* each : CMultiDocTemplate::All()) {
        if (CKsDoc* document = each->FindDocument(path))
            return document;
        if (!documents && each->ResourceId() == HDEditor().documentResource)
            documents = each;
    }
    if (!ReadFile(path))
        return nullptr;
    if (!documents) {
        documents = CKavo0_hd::CreateMainDlg();
        documents->setParent(&frame);
    }
    return documents->OpenDocumentFile(&frame, path);
}

CKavo0_hdView* ViewOfFile(const CString& path)
{
    auto* frame = dynamic_cast<CKsMDIFrameWnd*>(KsMainWindow());
    const CKsDoc* document = frame && !path.isEmpty() ? OpenFile(path, *frame) : nullptr;
    if (!document || document->Views().empty()) {
        Log("there is neither a view nor a file");
        return nullptr;
    }
    return Ready(document->Views().front());
}

const CKvr_CBE_ModelDataItem* FirstItem(const CObList* items)
{
    const auto* item =
        items && !items->empty() ? dynamic_cast<const CKvr_CBE_ModelDataItem*>(items->front().get()) : nullptr;
    if (!item)
        Log("there is no item of model data");
    else if (!FindDataTable(item->type))
        Log("the item's type is unknown");
    else
        return item;
    return nullptr;
}

/// A request under way, at a view with its document.
struct Exchange
{
    const CKvr_CBE_ModelDataItem& item;
    const HDDataTable& table;
    CKavo0_hdView& view;
    CKavo0_hdDoc& document;
    CGenList& list;
    bool mayLeave = true; // the page in front has stored what was being typed there, and lets go
    CString message{};    // for the user, when all is done

    /// Shows the window and the table's tab; otherwise leaves the message.
    bool Show(Str refusal)
    {
        if (auto* window = CKsMDIChildWnd::Of(&view))
            window->BringToFront();
        if (IsShown() || (mayLeave && view.Sheet()->SetActivePage(table.tab)))
            return mayLeave;
        message = LoadString(refusal);
        return false;
    }
    /// Row of the first record at exactly the item's place; GetCount() for none.
    std::size_t Find() const
    {
        const std::string branch = item.branch.toStdString();
        std::size_t row = 0;
        while (row < list.GetCount() &&
               (list.GetAt(row).RiverName != branch || list.GetAt(row).Chainage != item.chainage))
            ++row;
        if (row == list.GetCount())
            Log("there is no line at the item's place");
        return row;
    }
    bool IsShown() const { return view.Sheet()->currentIndex() == table.tab; }
    /// The page in front when it shows the list.
    CGenPropertyPage* ListPage() const
    {
        auto* page = view.ActivePage();
        return page->GetList() == &list ? page : nullptr;
    }
};

void Insert(Exchange& exchange)
{
    if (exchange.item.branch.isEmpty() || !std::isfinite(exchange.item.chainage))
        return Log("the item has no branch or no chainage");
    const bool shown = exchange.Show(exchange.table.inserted);

    const auto rows = MakeListRows(exchange.list);
    auto lines = rows->NewRows(1);
    auto& record = *static_cast<HD_RiverPos*>(lines->At(0));
    record.RiverName = exchange.item.branch.toStdString();
    record.Chainage = exchange.item.chainage;
    if (exchange.table.fill)
        exchange.table.fill(record, exchange.document.Parameters().Global, exchange.item);
    InsertLines(exchange.document, rows, rows->Count(), std::move(lines));
    if (auto* page = shown ? exchange.ListPage() : nullptr)
        page->GotoLine(int(exchange.list.GetCount()));
}

void Delete(Exchange& exchange)
{
    // A line is not taken away under what somebody cannot finish typing into that table.
    if (!exchange.mayLeave && exchange.ListPage())
        return Log("what is being typed in the table can neither be stored nor left");
    const std::size_t row = exchange.Find();
    if (row == exchange.list.GetCount())
        return;
    exchange.Show(exchange.table.deleted);
    const auto rows = MakeListRows(exchange.list);
    DeleteLines(exchange.document, rows, row, 1);
}

void Select(Exchange& exchange)
{
    const std::size_t row = exchange.Find();
    if (row == exchange.list.GetCount() || !exchange.Show(exchange.table.selected))
        return;
    if (auto* page = exchange.view.ActivePage(); page->GetGrid())
        page->GotoLine(int(row) + 1);
}

/// Whoever is editing is asked before anything changes. The page in front may refuse to be left; what the request then
/// does is its own matter. One change is made at a time: who hears of it, or of a window that comes to the front, might
/// ask for another one while the table of the first is half changed.
void Serve(const CString& path, CView* view, const CObList* items, void (*meet)(Exchange& exchange))
{
    static bool isBusy = false;
    if (isBusy)
        return Log("a request inside a request");
    QPointer<CKavo0_hdView> served;
    CString message;
    {
        const QScopedValueRollback busy(isBusy, true);
        const auto* item = FirstItem(items);
        if (!item)
            return;
        served = view ? Ready(view) : ViewOfFile(path);
        if (!served)
            return;
        if (meet != &Select && !served->GetDocument()->MayChange())
            return Log("the document may not be changed");
        const bool mayLeave = served->MayLeave(KsLeave::Page);
        if (!served || !Ready(served)) // the question may have taken its time
            return;
        CKavo0_hdDoc& document = *served->GetDocument();
        const HDDataTable& table = *FindDataTable(item->type);
        Exchange exchange{*item, table, *served, document, table.list(document.Parameters()), mayLeave};
        meet(exchange);
        message = exchange.message;
    }
    // By now others may ask again: those that hear of the change do so at once.
    if (served && served->GetDocument())
        served->GetDocument()->TellChanges();
    if (!message.isEmpty())
        KsMessageBox(message, QMessageBox::Ok, served);
}

} // namespace

std::unique_ptr<CObList> ItemsOf(const CString& path, CKsDoc* document, MakeItems make)
{
    if (auto* open = qobject_cast<CKavo0_hdDoc*>(document))
        return IsReady(*open) ? make(open->Parameters()) : nullptr;
    auto content = ReadFile(path);
    return content ? make(*content) : nullptr;
}

CObList* CKavo0_hd::GetData(const CString& path, CView* view)
{
    if (!view)
        return ItemsOf(path, nullptr, &DataItems).release();
    const auto* served = qobject_cast<CKavo0_hdView*>(view);
    if (served && served->GetDocument())
        return ItemsOf({}, served->GetDocument(), &DataItems).release();
    Log("the view is none of this editor's, or has no document");
    return nullptr;
}

void CKavo0_hd::InsertData(const CString& path, CView* view, CObList* items)
{
    Serve(path, view, items, &Insert);
}

void CKavo0_hd::DeleteData(const CString& path, CView* view, CObList* items)
{
    Serve(path, view, items, &Delete);
}

void CKavo0_hd::ChangeData(const CString&, CView*, CObList*) {}

void CKavo0_hd::SelectData(const CString& path, CView* view, CObList* items)
{
    Serve(path, view, items, &Select);
}
