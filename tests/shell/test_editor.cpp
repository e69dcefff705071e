// An editor of one-line texts (*.tst). What its views hear is left in their property "log", so that a test need not
// link it.
#include "ks/fc/doc_template.h"
#include "ks/fc/frames.h"
#include "ks/fc/message_box.h"
#include "ks/fc/package.h"
#include "ks/fc/plugin.h"

#include <QFile>
#include <QLineEdit>
#include <QUndoStack>
#include <QVBoxLayout>

namespace {

class TestDoc : public CKsDoc
{
public:
    BOOL OnOpenDocument(const CString& path) override
    {
        if (!CKsDoc::OnOpenDocument(path))
            return false;
        QFile file(path);
        const bool isOdd = file.open(QIODevice::ReadOnly) && file.readAll() == "odd";
        if (isOdd)
            KsMessageBox("This is no text.");
        return !isOdd;
    }
    BOOL OnSaveDocument(const CString& path) override
    {
        QFile file(path);
        const bool saved = file.open(QIODevice::WriteOnly) && file.write("saved") == 5;
        SetModifiedFlag(!saved);
        return saved;
    }
};

LRESULT Send(unsigned message, WPARAM request, CView* view, std::intptr_t project)
{
    CKSComm_Package package;
    package.view = request == KsRequest::DataChanged ? nullptr : view;
    package.text = view->GetDocument()->GetPathName();
    package.project = project;
    return KsSendMessage(KsMainWindow(), message, request, reinterpret_cast<LPARAM>(&package));
}

class TestView : public CView, public CCommandTarget
{
public:
    TestView()
    {
        auto* layout = new QVBoxLayout(this);
        layout->addWidget(new QLineEdit("text"));
    }
    ~TestView() override
    {
        Send(KsMessage::SwitchBoard(), KsRequest::LeaveProject, this, Project());
        Send(KsMessage::BetweenEditors(), KsRequest::DataChanged, this, Project());
    }
    std::intptr_t Project() const { return property("project").toLongLong(); }
    void OnInitialUpdate() override
    {
        setProperty("project", qlonglong(Send(KsMessage::SwitchBoard(), KsRequest::JoinProject, this, 0)));
    }
    void OnActivateView(bool activate, CView* activated, CView*) override
    {
        if (activate || activated)
            Send(activate ? KsMessage::ShowToolbar() : KsMessage::HideToolbar(), 0, this, 0);
    }
    LRESULT WindowProc(unsigned message, WPARAM wParam, LPARAM lParam) override
    {
        const auto* package = reinterpret_cast<const CKSComm_Package*>(lParam);
        const char* name = message == KsMessage::BetweenEditors()      ? "between"
                           : message == KsMessage::ProjectManagement() ? "project"
                                                                       : "other";
        setProperty("log", property("log").toStringList()
                               << QString("%1 %2 %3").arg(name).arg(wParam).arg(package->project));
        return 0;
    }
    bool OnCommand(int id) override
    {
        if (id == 1)
            GetDocument()->UndoStack().push(new QUndoCommand("insert line"));
        if (id == 2)
            Send(KsMessage::BetweenEditors(), KsRequest::DataChanged, this, Project());
        return true;
    }
    bool IsCommandEnabled(int id) const override { return id == 1 || id == 2; }
    std::vector<CKsMenuCommand> LinesMenu() const override
    {
        return {{1, "&Insert", QKeySequence(Qt::CTRL | Qt::Key_I)}, {}, {2, "Tell"}, {3, "Impossible"}};
    }
    std::vector<CKsMenuCommand> EditMenu() const override
    {
        return {{1, "Insert Too", QKeySequence(Qt::CTRL | Qt::Key_C)}, {3, "Impossible", QKeySequence(Qt::Key_F2)}};
    }
};

} // namespace

extern "C" {

int KsGetNumDocTemplates()
{
    return 1;
}

CMultiDocTemplate* KsGetDocTemplatePtr(int index)
{
    if (index != 0)
        return nullptr;
    return new CMultiDocTemplate(
        1, "No_Help.chm\nTest\nTest texts\nTest texts (*.tst)\n.tst\nTest.Document\nTest",
        {[] { return new TestDoc; }, [] { return new CKsMDIChildWnd; }, []() -> CView* { return new TestView; }});
}

BOOL KsGetEditorString(CString* text)
{
    if (text)
        *text = "Test Editor";
    return text != nullptr;
}

int KsGetBitmapId()
{
    return 1;
}

int KsGetNumToolbars()
{
    return 1;
}

BOOL KsGetToolbarString(CString* text, int index)
{
    if (index == 0)
        *text = " Test Tools";
    return index == 0;
}

BOOL KsInitToolbar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId, unsigned index)
{
    if (index > 0 || !bar->Create(frame, style, controlId) || !bar->LoadToolBar({{1, "", "Inserts\nInsert"}}))
        return false;
    bar->EnableDocking(CBRS_ALIGN_ANY);
    return true;
}

CKsToolBarEx* KsCreateToolbar(CKsMDIFrameWnd* frame, unsigned style, unsigned controlId, int index)
{
    auto bar = std::make_unique<CKsToolBarEx>();
    return KsInitToolbar(bar.get(), frame, style, controlId, unsigned(index)) ? bar.release() : nullptr;
}

} // extern "C"
