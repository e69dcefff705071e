#include "module/kavo0_hd.h"

#include "ks/language/language.h"
#include "document/document.h"
#include "grid/grid_texts.h"
#include "module/frame.h"
#include "module/view.h"
#include "res/strings.h"

#include <QDir>

namespace {

KsResourceHandle g_languageModule = nullptr;
std::vector<QPointer<CMultiDocTemplate>> g_templates; // those that are gone included

constexpr int ToolBarCommands[] = {Command::Search, Command::SearchAgain};

CKsToolBarButton Button(int command)
{
    return {command, command == Command::Search ? ":/kavo0_hd/search.svg" : ":/kavo0_hd/search_again.svg",
            LoadString(command)};
}

} // namespace

static void InitResources()
{
    Q_INIT_RESOURCE(kavo0_hd);
}

void LoadModuleResources()
{
    InitResources();
    KsLangLoadResDll("Kavo0_hd", &g_languageModule, 0);
    GridTexts::Load();
    KsMessage::ProjectMapChanged(); // registered from the start, so that its number is known to everybody
}

void FreeModuleResources()
{
    KsLangFreeResDll(g_languageModule);
    g_languageModule = nullptr;
}

CMultiDocTemplate* CKavo0_hd::CreateMainDlg()
{
    auto* documents = new CMultiDocTemplate(Resource::Document, [] { return LoadString(Str::DocumentTemplate); },
                                            {[]() -> CKsDoc* { return new CKavo0_hdDoc; },
                                             []() -> CKsMDIChildWnd* { return new CDlgFrame; },
                                             []() -> CView* { return new CKavo0_hdView; }});
    std::erase(g_templates, nullptr);
    g_templates.emplace_back(documents);
    return documents;
}

std::vector<CMultiDocTemplate*> CKavo0_hd::Templates()
{
    std::vector<CMultiDocTemplate*> templates;
    for (const auto& documents : g_templates) {
        if (documents)
            templates.push_back(documents);
    }
    return templates;
}

BOOL CKavo0_hd::InitToolBar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId)
{
    if (!bar || !bar->Create(frame, style, controlId))
        return false;
    std::vector<CKsToolBarButton> buttons;
    for (const int command : ToolBarCommands)
        buttons.push_back(Button(command));
    if (!bar->LoadToolBar(buttons))
        return false;
    bar->setObjectName("kavo0_hdToolBar");
    bar->setWindowTitle(LoadString(Str::ToolBarName).trimmed());
    bar->SetBarStyle(bar->GetBarStyle() | CBRS_TOOLTIPS | CBRS_FLYBY | CBRS_SIZE_DYNAMIC);
    bar->EnableDocking(CBRS_ALIGN_ANY);
    return true;
}
