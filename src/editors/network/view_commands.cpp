// The commands of the network's view, and the import.
#include "editors/network/import_dialog.h"
#include "editors/network/view.h"
#include "grid/grid_widths.h"
#include "grid/lines_view.h"
#include "ks/fc/file_dialog.h"
#include "ks/fc/message_box.h"

#include <QFileInfo>
#include <algorithm>
#include <iterator>

namespace {
/// What a file holds instead of lines; empty when it has some.
QString WhyNoLines(const QString& name, const CGisFile& file)
{
    QStringList layers;
    for (const CGisLayer& layer : file.layers) {
        if (layer.Lines() > 0)
            return {};
        QString text = QStringLiteral("%1: %2 (%3)")
                           .arg(layer.name, GeometryText(layer.geometry), QString::number(layer.features.size()));
        const auto damaged = std::ranges::find_if_not(layer.features, &QString::isEmpty, &CGisFeature::error);
        if (damaged != layer.features.end())
            text += QStringLiteral(" - ") + damaged->error;
        layers << (text + u' ' + layer.errors.join(u' ')).trimmed();
    }
    return CNetworkView::tr("%1 holds no lines. Its layers, with their geometry and the number of features:")
               .arg(name) +
           u'\n' + layers.join(u'\n');
}
} // namespace

std::vector<CKsMenuCommand> CNetworkView::LinesMenu() const
{
    std::vector<CKsMenuCommand> menu;
    if (CanImport()) {
        menu.push_back({NetworkCommand::Import, tr("I&mport Branches..."),
                        QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_I), tr("Reads lines of a GIS file as branches")});
        menu.emplace_back();
    }
    menu.push_back({Command::InsertLine, tr("&Insert Line"), {}, tr("Adds a line to the channel of the branch")});
    std::ranges::move(CGridCommands::LineMenu(), std::back_inserter(menu));
    menu.push_back({Command::DeleteLine,
                    CGridCommands::DeleteText(LinesOrNull(), tr("&Delete Lines")),
                    {},
                    tr("Deletes the selected lines of the table")});
    menu.push_back(CGridCommands::ClearEntry(LinesOrNull()));
    menu.emplace_back();
    std::ranges::move(CGridCommands::CellMenu(), std::back_inserter(menu));
    menu.emplace_back();
    std::ranges::move(CGridSearch::MenuCommands(), std::back_inserter(menu));
    menu.emplace_back();
    std::ranges::move(LinesView::MenuCommands(), std::back_inserter(menu));
    menu.emplace_back();
    menu.push_back({NetworkCommand::FitAll, tr("Sho&w All"), {}, tr("Shows the whole network on the map")});
    menu.push_back({NetworkCommand::ZoomIn, tr("&Zoom In"), {}, tr("Enlarges the map")});
    menu.push_back({NetworkCommand::ZoomOut, tr("Zoom &Out"), {}, tr("Makes the map smaller")});
    return menu;
}

bool CNetworkView::IsCommandEnabled(int id) const
{
    if (!m_map)
        return false;
    switch (id) {
    case NetworkCommand::Import:
        return CanImport() && !Document()->IsReadOnly();
    case Command::InsertLine:
        return CurrentLine() >= 0 && !Document()->IsReadOnly();
    case Command::DeleteLine: // the key means something else on the map
        return HasFocus(Lines()) && CTablesView::IsCommandEnabled(id);
    case NetworkCommand::FitAll:
    case NetworkCommand::ZoomIn:
    case NetworkCommand::ZoomOut:
        return !Document()->Network().branches.empty();
    default:
        return CTablesView::IsCommandEnabled(id);
    }
}

bool CNetworkView::OnCommand(int id)
{
    if (!IsCommandEnabled(id))
        return false;
    switch (id) {
    case NetworkCommand::Import:
        if (MayLeave(KsLeave::Field))
            AskForImport();
        break;
    case NetworkCommand::FitAll:
        m_map->FitAll();
        break;
    case NetworkCommand::ZoomIn:
        m_map->Zoom(CNetworkMap::ZoomStep);
        break;
    case NetworkCommand::ZoomOut:
        m_map->Zoom(1 / CNetworkMap::ZoomStep);
        break;
    default:
        return CTablesView::OnCommand(id);
    }
    return true;
}

void CNetworkView::AskForImport()
{
    KsFileQuestion question;
    question.title = tr("Import Branches");
    question.filters =
        tr("GIS files (%1)").arg(QStringLiteral("*.geojson *.json *.gpkg *.shp *.gml *.kml *.dxf *.tab")) +
        QStringLiteral(";;") + tr("All files (*)");
    question.proposal = QFileInfo(Document()->GetPathName()).path();
    const QString path = KsAskFileName(question, this);
    if (!path.isEmpty())
        Import(path);
}

void CNetworkView::Import(const QString& path)
{
    QString reason;
    const CGisLibrary* library = GisLibrary(reason);
    const CGisFile file = library ? library->Read(path) : CGisFile{{}, reason};
    const QString name = QFileInfo(path).fileName();
    if (const QString error = file.error.isEmpty() ? WhyNoLines(name, file) : file.error; !error.isEmpty()) {
        KsMessageBox(error, QMessageBox::Ok, this);
        return;
    }
    CImportDialog dialog(name, file, *library, Document()->Network(), this);
    if (dialog.exec() != QDialog::Accepted)
        return;
    const QString report = ReportOf(dialog.Import(), Document()->Network()).text;
    const auto first = int(Document()->Network().branches.size());
    Document()->AppendBranches(dialog.Import().plan.branches, dialog.NetworkSystem(), tr("Import Branches"));
    Branches()->ShowLine(first + 1, BranchName + 1);
    Branches()->Widths().MakeRoom();
    m_map->FitAll();
    ShowImportReport(report, this);
}
