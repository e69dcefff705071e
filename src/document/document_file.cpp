#include "document/document_file.h"

#include "data/hd_file.h"
#include "ks/fc/file_name.h"
#include "ks/fc/message_box.h"
#include "ks/fc/syntax_error.h"
#include "ks/fc/system_reason.h"
#include "res/strings.h"

#include <QDir>
#include <QFileInfo>

namespace {

CString NameOf(const CString& path)
{
    return QFileInfo(path).fileName();
}

/// What went wrong with a file, in the user's language.
void Tell(const Error& error)
{
    if (!error.code) {
        KsMessageBox(QString::fromStdString(error.message));
        return;
    }
    const auto native = [](const std::string& path) { return QDir::toNativeSeparators(QString::fromStdString(path)); };
    QString text = LoadString(error.reading ? Str::CouldNotRead : Str::CouldNotWrite)
                       .arg(native(error.path), KsSystemReason(error.code));
    if (!error.kept.empty())
        text += u'\n' + LoadString(Str::ContentIsLeftIn).arg(native(error.kept));
    KsMessageBox(text);
}

} // namespace

CString CDocumentFile::SavePathFor(const CString& path)
{
    const QFileInfo info(path);
    return info.dir().filePath(info.completeBaseName() + QStringLiteral(".HDKV"));
}

bool CDocumentFile::IsUnreadable() const
{
    return m_error.code != TqlError::None;
}

CString CDocumentFile::Error() const
{
    return KsSyntaxErrorText(m_error);
}

void CDocumentFile::Read(const CString& path, HD_Parameters& parameters)
{
    *this = {};
    m_path = path;
    const Result<TqlStructure> structure = ParseFile(path.toStdString(), &m_error);
    if (!structure)
        return;
    LoadReport report(structure.value().Get());
    parameters.Load(structure.value().Get(), &report);
    m_findings = report.Take();
}

/// Whether the file stands, under its present spelling, where a save to `target` writes.
bool CDocumentFile::IsReplacedBy(const CString& target) const
{
    // One file may be reached by several paths, and be saved by another than it was opened by.
    return !m_path.isEmpty() && QFileInfo::exists(m_path) &&
           (SavePathFor(m_path) == target || SameFile(m_path.toStdString(), target.toStdString()));
}

/// What a save to `target` writes over: the file that was read, or one of that name in whatever case it is spelt. Of
/// two files that differ in their case only, `target` itself.
CString CDocumentFile::EntryFor(const CString& target) const
{
    if (IsReplacedBy(target))
        return m_path;
    const CString entry = KsExistingSpelling(target);
    return QFileInfo(entry).path() == QFileInfo(target).path() ? entry : target; // never in another folder
}

/// What a copy of the file is called; null when nothing has to be kept.
const char* CDocumentFile::CopySuffix() const
{
    return IsUnreadable() ? "unreadable" : !m_findings.empty() ? "original" : nullptr;
}

bool CDocumentFile::MayReplace(const CString& target) const
{
    const char* const suffix = CopySuffix();
    if (!suffix || !IsReplacedBy(target))
        return true;
    const CString copy = NameOf(QString::fromStdString(FreeCopyName(m_path.toStdString(), suffix)));
    const CString question =
        IsUnreadable() ? LoadString(Str::ReplaceUnreadable).arg(NameOf(m_path), copy)
                       : LoadString(Str::ReplaceNotTaken).arg(NameOf(m_path)).arg(m_findings.size()).arg(copy);
    return KsMessageBox(question, QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes;
}

bool CDocumentFile::KeepCopy()
{
    const Result<std::string> kept = KeepOriginal(m_path.toStdString(), CopySuffix());
    if (kept)
        m_keptCopy = QString::fromStdString(kept.value());
    else
        Tell(kept.error());
    return bool(kept);
}

bool CDocumentFile::Write(const HD_Parameters& parameters, const CString& target)
{
    const bool replaces = IsReplacedBy(target);
    if (replaces && CopySuffix() && m_keptCopy.isEmpty() && !KeepCopy())
        return false;
    // Where the file system tells the spellings apart, the file is written under its old one and then renamed: so it
    // remains the same entry, be it a link or a file with an owner, a mode and attributes of its own. Elsewhere both
    // spellings are one file already.
    const CString entry = EntryFor(target);
    const bool renames =
        entry != target && QFileInfo::exists(entry) && !SameFile(entry.toStdString(), target.toStdString());
    const std::string written = (renames ? entry : target).toStdString();
    if (const Result<void> saved = SaveHDFile(parameters, written); !saved) {
        Tell(saved.error());
        return false;
    }
    const Result<void> renamed = renames ? RenameFile(written, target.toStdString()) : Result<void>();
    const CString kept = replaces ? m_keptCopy : CString();
    *this = {};
    m_path = renamed ? target : entry;
    m_keptCopy = kept;
    if (!renamed) // it is saved, and keeps its name
        KsMessageBox(LoadString(Str::KeepsItsName)
                         .arg(NameOf(entry), NameOf(target), KsSystemReason(renamed.error().code)));
    else if (renames)
        m_renamed = LoadString(Str::FileIsNow).arg(NameOf(entry), NameOf(target));
    return true;
}
