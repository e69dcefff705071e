#include "editors/cross_sections/module.h"

#include "editors/cross_sections/view.h"
#include "files/extensions.h"
#include "grid/grid_texts.h"
#include "ks/fc/doc_template.h"
#include "ks/language/language.h"

#include <QCoreApplication>

namespace {

struct CrossSectionTexts
{
    Q_DECLARE_TR_FUNCTIONS(CrossSectionTexts)
};

KsResourceHandle g_texts = nullptr;

/// In the user's language of the moment.
CString TemplateStrings()
{
    const QStringList strings{QStringLiteral("Kvr_Help.chm"),
                              CrossSectionTexts::tr("Sections"),
                              CrossSectionTexts::tr("KVR Cross Sections"),
                              CrossSectionTexts::tr("KVR Cross Sections (*.kvxs)"),
                              QLatin1String(CrossSectionExtension),
                              QStringLiteral("CrossSections.Document"),
                              QStringLiteral("CrossSections Document")};
    return strings.join(u'\n');
}

} // namespace

static void InitResources()
{
    Q_INIT_RESOURCE(cross_sections); // stands in a static library
}

void CrossSectionModule::LoadResources()
{
    InitResources();
    KsLangLoadResDll("Kavo0_xs", &g_texts, 0);
    GridTexts::Load();
}

void CrossSectionModule::FreeResources()
{
    KsLangFreeResDll(g_texts);
    g_texts = nullptr;
}

CMultiDocTemplate* CrossSectionModule::CreateTemplate()
{
    return new CMultiDocTemplate(DocumentResource, &TemplateStrings,
                                 {[]() -> CKsDoc* { return new CCrossSectionDoc; }, [] { return new CKsMDIChildWnd; },
                                  []() -> CView* { return new CCrossSectionView; }});
}

CString CrossSectionModule::EditorName()
{
    return CrossSectionTexts::tr("Cross Sections");
}

CString CrossSectionModule::ToolBarName()
{
    return CrossSectionTexts::tr("KVR Cross Section Tools");
}

bool CrossSectionModule::InitToolBar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId)
{
    if (!bar || !bar->Create(frame, style, controlId))
        return false;
    const bool loaded =
        bar->LoadToolBar({{CrossSectionCommand::Previous, ":/cross_sections/previous.svg",
                           CrossSectionTexts::tr("Shows the cross section above\nPrevious Cross Section")},
                          {CrossSectionCommand::Next, ":/cross_sections/next.svg",
                           CrossSectionTexts::tr("Shows the cross section below\nNext Cross Section")},
                          {0, "", {}},
                          {Command::InsertLine, ":/cross_sections/insert.svg",
                           CrossSectionTexts::tr("Adds a cross section or a point below the current one\nInsert Line")},
                          {Command::DeleteLine, ":/cross_sections/delete.svg",
                           CrossSectionTexts::tr("Deletes the selected cross sections or points\nDelete Lines")}});
    if (!loaded)
        return false;
    bar->setWindowTitle(ToolBarName());
    bar->SetBarStyle(bar->GetBarStyle() | CBRS_TOOLTIPS | CBRS_FLYBY | CBRS_SIZE_DYNAMIC);
    bar->EnableDocking(CBRS_ALIGN_ANY);
    return true;
}
