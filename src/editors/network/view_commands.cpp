// The commands of the network's view, and the import.
#include "editors/network/import_branches.h"
#include "editors/network/import_dialog.h"
#include "editors/network/view.h"
#include "ks/fc/file_dialog.h"
#include "ks/fc/message_box.h"

#include <QFileInfo>
#include <QTableView>

namespace {
constexpr double ZoomStep = 1.4;
} // namespace

std::vector<CKsMenuCommand> CNetworkView::LinesMenu() const
{
    std::vector<CKsMenuCommand> menu;
    if (CanImport()) {
        menu.push_back({NetworkCommand::Import, tr("I&mport Branches..."),
                        QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_I), tr("Reads lines of a GIS file as branches")});
        menu.emplace_back();
    }
    menu.push_back(
        {NetworkCommand::InsertLine, tr("&Insert Line"), {}, tr("Adds a line to the channel of the branch")});
    menu.push_back(
        {NetworkCommand::DeleteLine, tr("&Delete Lines"), {}, tr("Deletes the selected lines of the table")});
    menu.emplace_back();
    menu.push_back({NetworkCommand::FitAll, tr("Show &All"), {}, tr("Shows the whole network on the map")});
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
        return CanImport();
    case NetworkCommand::InsertLine:
        return m_branches->currentIndex().isValid();
    case NetworkCommand::DeleteLine:
        return FocusTable() && FocusTable()->selectionModel()->hasSelection();
    case NetworkCommand::FitAll:
    case NetworkCommand::ZoomIn:
    case NetworkCommand::ZoomOut:
        return !Document()->Network().branches.empty();
    default:
        return false;
    }
}

bool CNetworkView::OnCommand(int id)
{
    if (!IsCommandEnabled(id))
        return false;
    switch (id) {
    case NetworkCommand::Import:
        AskForImport();
        break;
    case NetworkCommand::InsertLine:
        InsertLine();
        break;
    case NetworkCommand::DeleteLine:
        DeleteLines();
        break;
    case NetworkCommand::FitAll:
        m_map->FitAll();
        break;
    case NetworkCommand::ZoomIn:
        m_map->Zoom(ZoomStep);
        break;
    case NetworkCommand::ZoomOut:
        m_map->Zoom(1 / ZoomStep);
        break;
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
    const CGisFile file = ReadGisFile(path);
    if (!file.error.isEmpty()) {
        KsMessageBox(file.error, QMessageBox::Ok, this);
        return;
    }
    CImportDialog dialog(QFileInfo(path).fileName(), file, this);
    if (dialog.exec() != QDialog::Accepted)
        return;
    QStringList notes;
    auto branches =
        MakeBranches(file.layers[std::size_t(dialog.Layer())], dialog.Fields(), Document()->Network(), notes);
    const auto first = static_cast<int>(Document()->Network().branches.size());
    Document()->AppendBranches(std::move(branches), tr("Import Branches"));
    m_branches->setCurrentIndex(m_branchTable->index(first, 0));
    m_map->FitAll();
    constexpr qsizetype most = 12; // lines of a message
    if (notes.size() > most)
        notes = notes.mid(0, most) << tr("... and %1 more.").arg(notes.size() - most);
    if (!notes.isEmpty())
        KsMessageBox(tr("The branches were imported:") + u'\n' + notes.join(u'\n'), QMessageBox::Ok, this);
}
