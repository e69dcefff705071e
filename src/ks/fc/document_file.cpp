#include "ks/fc/document_file.h"

#include "files/structure.h"
#include "ks/fc/file_name.h"
#include "ks/fc/message_box.h"
#include "ks/fc/syntax_error.h"
#include "ks/fc/system_reason.h"

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
    const QString what = error.reading ? CKsDocumentFile::tr("Could not read \"%1\": %2.")
                                       : CKsDocumentFile::tr("Could not write \"%1\": %2.");
    QString text = what.arg(native(error.path), KsSystemReason(error.code));
    if (!error.kept.empty())
        text += u'\n' + CKsDocumentFile::tr("The new content is complete in \"%1\".").arg(native(error.kept));
    KsMessageBox(text);
}

} // namespace

CString CKsDocumentFile::Error() const
{
    return KsSyntaxErrorText(m_error);
}

CString CKsDocumentFile::WhyNothing() const
{
    if (m_findings.empty() || m_findings.front().kind != Finding::NoTarget)
        return Error();
    return tr("%1 is no file of this kind: it has no section [%2].")
        .arg(NameOf(m_path), QString::fromStdString(m_findings.front().section));
}

void CKsDocumentFile::Read(const CString& path, const CString& savedAs,
                           const std::function<void(tqlHandle, LoadReport&)>& load)
{
    *this = {};
    m_path = path;
    m_savedAs = savedAs;
    const Result<TqlStructure> structure = ParseFile(path.toStdString(), &m_error);
    if (!structure)
        return;
    LoadReport report(structure.value().Get());
    load(structure.value().Get(), report);
    m_findings = report.Take();
}

/// Whether the file stands, under its present spelling, where a save to `target` writes.
bool CKsDocumentFile::IsReplacedBy(const CString& target) const
{
    // One file may be reached by several paths, and be saved by another than it was opened by.
    return !m_path.isEmpty() && QFileInfo::exists(m_path) &&
           (m_savedAs == target || SameFile(m_path.toStdString(), target.toStdString()));
}

/// What a save to `target` writes over: the file that was read, or one of that name in whatever case it is spelt. Of
/// two files that differ in their case only, `target` itself.
CString CKsDocumentFile::EntryFor(const CString& target) const
{
    if (IsReplacedBy(target))
        return m_path;
    const CString entry = KsExistingSpelling(target);
    return QFileInfo(entry).path() == QFileInfo(target).path() ? entry : target; // never in another folder
}

/// What a copy of the file is called; null when nothing has to be kept.
const char* CKsDocumentFile::CopySuffix() const
{
    return IsUnreadable() ? "unreadable" : !m_findings.empty() ? "original" : nullptr;
}

bool CKsDocumentFile::MayReplace(const CString& target) const
{
    const char* const suffix = CopySuffix();
    if (!suffix || !IsReplacedBy(target))
        return true;
    const CString copy = NameOf(QString::fromStdString(FreeCopyName(m_path.toStdString(), suffix)));
    const CString question =
        IsUnreadable() ? tr("%1 could not be read when it was opened; what is shown is not its content.\n"
                            "Saving replaces it. As it is now it stays in a copy beside it, %2.\nSave?")
                             .arg(NameOf(m_path), copy)
                       : tr("%1 holds values that were not taken as they stand (places: %2).\n"
                            "Saving writes what is shown instead. As it is now the file stays in a copy beside it, "
                            "%3.\nSave?")
                             .arg(NameOf(m_path))
                             .arg(m_findings.size())
                             .arg(copy);
    return KsMessageBox(question, QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes;
}

bool CKsDocumentFile::KeepCopy()
{
    const Result<std::string> kept = KeepOriginal(m_path.toStdString(), CopySuffix());
    if (kept)
        m_keptCopy = QString::fromStdString(kept.value());
    else
        Tell(kept.error());
    return bool(kept);
}

bool CKsDocumentFile::Write(const CString& target, const std::function<Result<void>(const std::string& path)>& write)
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
    if (const Result<void> saved = write(written); !saved) {
        Tell(saved.error());
        return false;
    }
    const Result<void> renamed = renames ? RenameFile(written, target.toStdString()) : Result<void>();
    const CString kept = replaces ? m_keptCopy : CString();
    *this = {};
    m_path = renamed ? target : entry;
    m_savedAs = target;
    m_keptCopy = kept;
    if (!renamed) // it is saved, and keeps its name
        KsMessageBox(tr("The changes are saved in %1, which could not be renamed to %2: %3.")
                         .arg(NameOf(entry), NameOf(target), KsSystemReason(renamed.error().code)));
    else if (renames)
        m_renamed = tr("%1 is now %2").arg(NameOf(entry), NameOf(target));
    return true;
}
