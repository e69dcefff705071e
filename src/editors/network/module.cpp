#include "editors/network/module.h"

#include "editors/network/import_branches.h"
#include "editors/network/view.h"
#include "files/extensions.h"
#include "grid/grid_texts.h"
#include "ks/fc/doc_template.h"
#include "ks/language/language.h"

#include <QCoreApplication>

namespace {

struct NetworkTexts
{
    Q_DECLARE_TR_FUNCTIONS(NetworkTexts)
};

KsResourceHandle g_texts = nullptr;

/// In the user's language of the moment.
CString TemplateStrings()
{
    const QStringList strings{QStringLiteral("Kvr_Help.chm"),
                              NetworkTexts::tr("Network"),
                              NetworkTexts::tr("KVR River Network"),
                              NetworkTexts::tr("KVR River Network (*.kvnw)"),
                              QLatin1String(NetworkExtension),
                              QStringLiteral("Network.Document"),
                              QStringLiteral("Network Document")};
    return strings.join(u'\n');
}

} // namespace

static void InitResources()
{
    Q_INIT_RESOURCE(network); // stands in a static library
}

void NetworkModule::LoadResources()
{
    InitResources();
    KsLangLoadResDll("Kavo0_nw", &g_texts, 0);
    GridTexts::Load();
}

void NetworkModule::FreeResources()
{
    KsLangFreeResDll(g_texts);
    g_texts = nullptr;
}

CMultiDocTemplate* NetworkModule::CreateTemplate()
{
    return new CMultiDocTemplate(DocumentResource, &TemplateStrings,
                                 {[]() -> CKsDoc* { return new CNetworkDoc; }, [] { return new CKsMDIChildWnd; },
                                  []() -> CView* { return new CNetworkView; }});
}

CString NetworkModule::EditorName()
{
    return NetworkTexts::tr("River Network");
}

CString NetworkModule::ToolBarName()
{
    return NetworkTexts::tr("KVR Network Tools");
}

bool NetworkModule::InitToolBar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId)
{
    if (!bar || !bar->Create(frame, style, controlId))
        return false;
    std::vector<CKsToolBarButton> buttons{
        {NetworkCommand::FitAll, ":/network/fit.svg", NetworkTexts::tr("Shows the whole network on the map\nShow All")},
        {NetworkCommand::ZoomIn, ":/network/zoom_in.svg", NetworkTexts::tr("Enlarges the map\nZoom In")},
        {NetworkCommand::ZoomOut, ":/network/zoom_out.svg", NetworkTexts::tr("Makes the map smaller\nZoom Out")}};
    if (CanImport())
        buttons.insert(buttons.begin(), {NetworkCommand::Import, ":/network/import.svg",
                                         NetworkTexts::tr("Reads lines of a GIS file as branches\nImport Branches")});
    if (!bar->LoadToolBar(buttons))
        return false;
    bar->setWindowTitle(ToolBarName());
    bar->SetBarStyle(bar->GetBarStyle() | CBRS_TOOLTIPS | CBRS_FLYBY | CBRS_SIZE_DYNAMIC);
    bar->EnableDocking(CBRS_ALIGN_ANY);
    return true;
}
