#include "module/kavo0_hd.h"

#include "document/document.h"
#include "grid/grid_texts.h"
#include "module/view.h"
#include "profile/profile_texts.h"
#include "res/strings.h"

namespace {

CKsToolBarButton Button(int command, const char* icon)
{
    return {command, icon, LoadString(command)};
}

} // namespace

static void Load()
{
    Q_INIT_RESOURCE(kavo0_hd); // stands in a static library
    GridTexts::Load();
    ProfileTexts::Load();
    KsMessage::ProjectMapChanged(); // registered from the start, so that its number is known to everybody
}

const KsSingleEditor& HDEditor()
{
    static const KsSingleEditor editor{
        .texts = "Kavo0_hd",
        .load = &Load,
        .documentResource = 4953,
        .bitmap = 4965,
        .documentStrings = [] { return LoadString(Str::DocumentTemplate); },
        .classes = {[] { return new CKavo0_hdDoc; }, [] { return new CDlgFrame; }, [] { return new CKavo0_hdView; }},
        .name = [] { return LoadString(Str::EditorName); },
        .toolBarName = [] { return LoadString(Str::ToolBarName); },
        .buttons = []() -> std::vector<CKsToolBarButton> {
            return {Button(Command::Search, ":/kavo0_hd/search.svg"),
                    Button(Command::SearchAgain, ":/kavo0_hd/search_again.svg")};
        }};
    return editor;
}

CMultiDocTemplate* CKavo0_hd::CreateMainDlg()
{
    return HDEditor().CreateTemplate();
}

BOOL CKavo0_hd::InitToolBar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId)
{
    return HDEditor().InitToolBar(bar, frame, style, controlId);
}
