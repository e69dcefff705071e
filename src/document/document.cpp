#include "document/document.h"

#include "data/hd_file.h"
#include "document/purged_lines.h"
#include "files/extensions.h"
#include "grid/row_source.h"
#include "ks/fc/doc_command.h"
#include "ks/fc/message_box.h"
#include "res/strings.h"

#include <QDir>
#include <QFileInfo>
#include <QUndoStack>
#include <algorithm>

namespace {

constexpr int HDPackageKind = 8; // what this editor's packages call themselves

/// The rows of defaults that are written although nobody has edited them, in their tables during a save only.
class FirstRows
{
public:
    FirstRows() = default;
    ~FirstRows()
    {
        for (const auto& rows : m_filled)
            rows->Drop(0, 1);
    }
    FirstRows(const FirstRows&) = delete;
    FirstRows& operator=(const FirstRows&) = delete;

    void Fill(const std::vector<CKavo0_hdDoc::ShownRows>& shown)
    {
        m_filled.reserve(shown.size()); // what is put in is noted, also when memory ends
        for (const auto& table : shown) {
            if (!table.writesFirstRow || !table.rows->IsEmpty())
                continue;
            table.rows->Put(0, table.rows->NewRows(1));
            m_filled.push_back(table.rows);
        }
    }

private:
    std::vector<std::shared_ptr<IRowSource>> m_filled;
};

} // namespace

/// Here, as each library has the date of its own objects.
HD_Parameters CKavo0_hdDoc::NewContent() const
{
    const DatedObjects dated(DateOfFile());
    return {};
}

CKavo0_hdDoc::CKavo0_hdDoc() : CKsProjectDoc(HDPackageKind), m_parameters(NewContent()) {}

bool CKavo0_hdDoc::HasExtension(const CString& path)
{
    // Mixed spellings are refused: the shell's file tables know these two.
    return path.endsWith(QLatin1String(SavedHDExtension)) || path.endsWith(QLatin1String(HDExtension));
}

BOOL CKavo0_hdDoc::OnOpenDocument(const CString& path)
{
    if (!CKsDoc::OnOpenDocument(path))
        return false;
    if (!HasExtension(path)) {
        KsMessageBox(LoadString(Str::UnsupportedFormat));
        return false;
    }
    ReadFile(path, [this](tqlHandle structure, LoadReport& report) { m_parameters.Load(structure, &report); });
    return true;
}

CString CKavo0_hdDoc::SavePathFor(const CString& path) const
{
    const QFileInfo info(path);
    return info.dir().filePath(info.completeBaseName() + QLatin1String(SavedHDExtension));
}

BOOL CKavo0_hdDoc::OnSaveDocument(const CString& path)
{
    if (!MayLeave())
        return false;
    const CString target = SavePathFor(path);
    UpdateAllViews(nullptr, CKsDoc::StoreHint);
    if (!MayReplace(target, path) || !m_file.MayReplace(target))
        return false;

    auto purged = std::make_unique<CPurgedLines>(*this);
    if (!WriteData(target, *purged)) {
        purged->PutBack(); // what is in memory stays as the user left it
        UpdateAllViews(nullptr, CKsDoc::ReloadHint);
        return false;
    }
    const QString dropped = purged->Summary();
    if (!purged->IsEmpty())
        UndoStack().push(purged.release());
    FileWritten();
    UpdateAllViews(nullptr, CKsDoc::ReloadHint);
    SetModifiedFlag(false);
    QString saved = dropped.isEmpty() ? LoadString(Str::Saved) : LoadString(Str::SavedDropping).arg(dropped);
    if (const std::size_t unwritten = UnwrittenSetups(); unwritten > 0)
        saved += QStringLiteral("   ") + LoadCounted(unwritten, Str::SetupNotWritten, Str::SetupsNotWritten);
    Say(m_file.Renamed().isEmpty() ? saved : saved + QStringLiteral("   ") + m_file.Renamed());
    return true;
}

bool CKavo0_hdDoc::MayReplace(const CString& target, const CString& path)
{
    // Only a plain save whose name changes case can meet a file nobody was asked about: Save As has asked already.
    if (path != GetPathName() || path == target || !QFileInfo::exists(target) ||
        IsSameFile(path.toStdString(), target.toStdString()))
        return true;
    const CString question =
        LoadString(Str::ReplaceOtherSpelling).arg(QFileInfo(target).fileName(), QFileInfo(path).fileName());
    return KsMessageBox(question, QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes;
}

/// Set-ups of encroachment that hold too little for the file.
std::size_t CKavo0_hdDoc::UnwrittenSetups() const
{
    const auto& setups = m_parameters.EncroachList;
    std::size_t unwritten = 0;
    for (std::size_t setup = 0; setup < setups.GetCount(); ++setup)
        unwritten += !CGenMetaList<HDEncroach>::IsWorthKeeping(setups.GetAt(setup));
    return unwritten;
}

/// Writes the whole content but for what is purged, which stays out; on failure the user has been told and the file is
/// what it was.
bool CKavo0_hdDoc::WriteData(const CString& path, CPurgedLines& purged)
{
    FirstRows defaults;
    return WriteFile(path, [&](const std::string& written, const SafeFileOptions& options) {
        purged.TakeOut();
        defaults.Fill(m_rowsShown);
        return SaveHDFile(m_parameters, written, {.file = options});
    });
}

void CKavo0_hdDoc::AtSave(ShownRows shown)
{
    const auto sameTable = [&](const ShownRows& known) { return known.rows->Data() == shown.rows->Data(); };
    if (std::ranges::none_of(m_rowsShown, sameTable))
        m_rowsShown.push_back(std::move(shown));
}

Result<std::string> CKavo0_hdDoc::ContentText() const
{
    std::string text = HDFileText(m_parameters, true);
    if (text.empty())
        return NoText();
    return text;
}

std::unique_ptr<QUndoCommand> CKavo0_hdDoc::MakeContentStep(tqlHandle structure, LoadReport& report,
                                                            const CString& text)
{
    HD_Parameters read = NewContent();
    read.Load(structure, &report);
    return std::make_unique<CReplaceContent<HD_Parameters>>(*this, text, m_parameters, std::move(read));
}

void CKavo0_hdDoc::DeleteContents()
{
    UndoStack().clear();
    m_rowsShown.clear();
    m_parameters.RemoveAllRecords();
    CKsDoc::DeleteContents();
}
