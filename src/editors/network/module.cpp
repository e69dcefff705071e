#include "editors/network/module.h"

#include "editors/network/import_branches.h"
#include "editors/network/view.h"
#include "files/extensions.h"
#include "grid/grid_texts.h"

#include <QCoreApplication>

namespace {

struct NetworkTexts
{
    Q_DECLARE_TR_FUNCTIONS(NetworkTexts)
};

CString DocumentStrings()
{
    const QStringList strings{"Kvr_Help.chm",
                              NetworkTexts::tr("Network"),
                              NetworkTexts::tr("KVR River Network"),
                              NetworkTexts::tr("KVR River Network") + QStringLiteral(" (*%1)").arg(NetworkExtension),
                              QLatin1String(NetworkExtension),
                              "Network.Document",
                              "Network Document"};
    return strings.join(u'\n');
}

std::vector<CKsToolBarButton> Buttons()
{
    std::vector<CKsToolBarButton> buttons{
        {NetworkCommand::FitAll, ":/network/fit.svg", NetworkTexts::tr("Shows the whole network on the map\nShow All")},
        {NetworkCommand::ZoomIn, ":/network/zoom_in.svg", NetworkTexts::tr("Enlarges the map\nZoom In")},
        {NetworkCommand::ZoomOut, ":/network/zoom_out.svg", NetworkTexts::tr("Makes the map smaller\nZoom Out")}};
    if (CanImport())
        buttons.insert(buttons.begin(), {NetworkCommand::Import, ":/network/import.svg",
                                         NetworkTexts::tr("Reads lines of a GIS file as branches\nImport Branches")});
    return buttons;
}

} // namespace

const KsSingleEditor& NetworkEditor()
{
    static const KsSingleEditor editor{
        .texts = "Kavo0_nw",
        .load = &GridTexts::Load,
        .documentResource = 5953,
        .bitmap = 5965,
        .documentStrings = DocumentStrings,
        .classes = {[] { return new CNetworkDoc; }, [] { return new CKsMDIChildWnd; }, [] { return new CNetworkView; }},
        .name = [] { return NetworkTexts::tr("River Network"); },
        .toolBarName = [] { return NetworkTexts::tr("KVR Network Tools"); },
        .buttons = Buttons};
    return editor;
}
