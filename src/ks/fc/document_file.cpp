#include "ks/fc/document_file.h"

#include "base/utf8_path.h"
#include "files/structure.h"
#include "files/temporary_file.h"
#include "ks/fc/file_name.h"
#include "ks/fc/message_box.h"
#include "ks/fc/shown_text.h"
#include "ks/fc/syntax_error.h"
#include "ks/fc/system_reason.h"

#include <QDir>
#include <QFileInfo>
#include <algorithm>
#include <new>

namespace {

CString NameOf(const CString& path)
{
    return KsVisibleText(QFileInfo(path).fileName());
}

CString Native(const std::string& path)
{
    return QDir::toNativeSeparators(QString::fromStdString(path));
}

/// What went wrong with a file, in the user's language.
CString Sentence(const Error& error)
{
    if (!error.code)
        return QString::fromStdString(error.message);
    const QString what = error.reading ? CKsDocumentFile::tr("Could not read \"%1\": %2.")
                                       : CKsDocumentFile::tr("Could not write \"%1\": %2.");
    QString text = what.arg(Native(error.path), KsSystemReason(error.code));
    if (!error.kept.empty())
        text += u'\n' + CKsDocumentFile::tr("The new content is complete in \"%1\".").arg(Native(error.kept));
    return text;
}

CString LostWords(const LostMetadata& lost)
{
    QStringList text;
    for (const LostPart& part : LostParts)
        if (lost.*part.member)
            text << CKsDocumentFile::tr(part.name);
    return text.join(CKsDocumentFile::tr(", "));
}

/// What the copy of a file that somebody has changed will be called. It stands beside the file that links lead to.
CString DisplacedName(const CString& path)
{
    auto target = QFileInfo(path).filesystemFilePath();
    FileStatus status;
    FollowLinks(PlatformFile::Native(), target, status);
    return NameOf(QString::fromStdString(FreeCopyName(Utf8FromPath(target), DisplacedSuffix)));
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
    m_seen = StatusBehind(path.toStdString());
    FileVersion version;
    const Result<TqlStructure> structure = ParseFile(path.toStdString(), &m_error, &version);
    // What cannot be parsed has a content, too, that somebody may mend.
    if (structure || !VersionOfFile(PlatformFile::Native(), QFileInfo(path).filesystemFilePath(), version))
        m_version = version;
    if (!structure)
        return;
    LoadReport report(structure.value().Get());
    load(structure.value().Get(), report);
    m_findings = report.Take();
}

void CKsDocumentFile::Know(const CString& path, const FileVersion& version)
{
    *this = {};
    m_path = m_savedAs = path;
    m_version = version;
}

void CKsDocumentFile::LookForLeftBehind(bool isLocked)
{
    if (isLocked)
        m_report.leftBehind = NameLeftBehind(m_path.toStdString());
    m_report.unfinished = UnfinishedSaves(m_path.toStdString());
}

/// Whether the file stands, under its present spelling, where a save to `target` writes.
Result<bool> CKsDocumentFile::IsReplacedBy(const CString& target) const
{
    if (m_path.isEmpty())
        return false;
    PlatformFile& platform = PlatformFile::Native();
    const auto path = QFileInfo(m_path).filesystemFilePath();
    FileStatus status;
    std::error_code error = platform.Status(path, status);
    // One file may be reached by several paths, and be saved by another than it was opened by.
    bool replaces = !error && status.kind != FileStatus::Kind::None && m_savedAs == target;
    if (!error && !replaces && status.kind != FileStatus::Kind::None)
        error = IsSameFile(platform, path, QFileInfo(target).filesystemFilePath(), replaces);
    return error ? Result<bool>(NotWritten(target.toStdString(), error)) : replaces;
}

/// What a copy of the file is called; null when nothing has to be kept.
const char* CKsDocumentFile::CopySuffix() const
{
    return IsUnreadable() ? "unreadable" : !m_findings.empty() ? "original" : nullptr;
}

bool CKsDocumentFile::MayReplace(const CString& target) const
{
    const char* const suffix = CopySuffix();
    const Result<bool> replaces = IsReplacedBy(target);
    if (!suffix || !replaces || !replaces.value()) // what is not known is no question; writing will say it
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

Result<void> CKsDocumentFile::KeepCopy()
{
    const auto kept = KeepOriginal(m_path.toStdString(), CopySuffix());
    if (!kept)
        return kept.error();
    m_keptCopy = QString::fromStdString(kept.value().path);
    if (!m_version) // of a file that could not be read before
        m_version = kept.value().version;
    return {};
}

WriteAnswer CKsDocumentFile::Ask(const WriteQuestion& question)
{
    const CString path = QString::fromStdString(question.path), name = NameOf(path);
    constexpr auto YesNo = QMessageBox::Yes | QMessageBox::No;
    const auto agreed = [](QMessageBox::StandardButton button) {
        return button == QMessageBox::Yes ? WriteAnswer::Yes : WriteAnswer::Cancel;
    };
    switch (question.kind) {
    case WriteQuestion::ChangedOutside:
        if (m_mayReplaceOthers)
            return WriteAnswer::Yes;
        return agreed(KsMessageBox(
            tr("Another program has changed %1 since it was read or saved here.\nSaving writes what is shown instead. "
               "As it is now the file stays in a copy beside it, %2.\nSave?")
                .arg(name, DisplacedName(path)),
            YesNo));
    case WriteQuestion::LosesMetadata:
        return agreed(KsMessageBox(
            tr("Not everything about %1 can be kept: %2.\nSave?").arg(name, LostWords(question.lost)), YesNo));
    case WriteQuestion::HardLinks:
        break;
    }
    if (!m_otherNames) {
        const auto button = KsMessageBox(tr("%1 is one of %2 names of the same file (hard links).\n"
                                            "Shall the file have the new content under all its names?\n"
                                            "No: only %1 gets it, and becomes a file of its own.")
                                             .arg(name)
                                             .arg(question.names),
                                         YesNo | QMessageBox::Cancel);
        if (button != QMessageBox::Yes && button != QMessageBox::No)
            return WriteAnswer::Cancel;
        m_otherNames = button == QMessageBox::Yes ? WriteAnswer::Yes : WriteAnswer::No;
    }
    return *m_otherNames;
}

Result<void> CKsDocumentFile::Save(const CString& target, const KsFileWriter& write)
{
    const Result<bool> replaces = IsReplacedBy(target);
    if (!replaces)
        return replaces.error();
    if (replaces.value() && CopySuffix() && m_keptCopy.isEmpty())
        if (const Result<void> kept = KeepCopy(); !kept)
            return kept;
    const Result<CString> entry = replaces.value() ? m_path : KsExistingEntry(target);
    if (!entry)
        return entry.error();
    // Where the file system tells the spellings apart, the file is written under its old one and then renamed: so it
    // remains the same entry, be it a link or a file with an owner, a mode and attributes of its own, and there are
    // never two of it. Elsewhere both spellings are one file already.
    bool same = entry.value() == target;
    if (!same)
        if (const std::error_code error =
                IsSameFile(PlatformFile::Native(), QFileInfo(entry.value()).filesystemFilePath(),
                           QFileInfo(target).filesystemFilePath(), same))
            return NotWritten(target.toStdString(), error);
    SafeFileOptions options;
    if (replaces.value())
        options.expected = m_version;
    if (!same)
        options.renameTo = target.toStdString();
    options.ask = [this](const WriteQuestion& question) { return Ask(question); };
    const std::optional<WriteAnswer> answered = m_otherNames;
    Result<WriteReport> saved = write((same ? target : entry.value()).toStdString(), options);
    if (!saved) {
        m_otherNames = answered; // nothing came of what was said this time
        return saved.error();
    }
    CKsDocumentFile written;
    written.m_report = std::move(saved.value()); // it is saved: nothing may ask for memory any more
    written.m_version = written.m_report.version;
    written.m_savedAs = target;
    written.m_path = written.m_report.notRenamed ? entry.value() : target;
    try {
        written.m_seen = StatusBehind(written.m_path.toStdString());
    } catch (const std::bad_alloc&) { // then it looks like another file, and is read to see that it is not
    }
    if (replaces.value()) {
        written.m_keptCopy = m_keptCopy;
        written.m_otherNames = m_otherNames;
    }
    if (!same && !written.m_report.notRenamed)
        written.m_renamed = tr("%1 is now %2").arg(NameOf(entry.value()), NameOf(target));
    *this = std::move(written);
    return {};
}

CString CKsDocumentFile::WhyNoMemory(const CString& path)
{
    return tr("Could not write \"%1\": %2.")
        .arg(QDir::toNativeSeparators(path), KsSystemReason(std::make_error_code(std::errc::not_enough_memory)));
}

bool CKsDocumentFile::Write(const CString& target, const KsFileWriter& write)
{
    m_whyNotWritten.clear();
    try {
        if (const Result<void> saved = Save(target, write); !saved) {
            if (saved.error().code != std::errc::operation_canceled)
                m_whyNotWritten = Sentence(saved.error());
            return false;
        }
    } catch (const std::bad_alloc&) {
        m_whyNotWritten = WhyNoMemory(target);
        return false;
    }
    if (m_report.notRenamed) // it is saved, and keeps its name
        KsMessageBox(tr("The changes are saved in %1, which could not be renamed to %2: %3.")
                         .arg(NameOf(m_path), NameOf(m_savedAs), KsSystemReason(m_report.notRenamed)));
    return true;
}

CString CKsDocumentFile::NotesOn(const CString& path, const WriteReport& report)
{
    QStringList notes;
    if (report.unconfirmed)
        notes << tr("%1 is saved, but the disk has not confirmed it: %2. Should the power fail soon, the file may be "
                    "found as it was before.")
                     .arg(NameOf(path), KsSystemReason(report.unconfirmed));
    if (!report.displaced.empty() && report.unknown)
        notes << tr("What %1 held just before is kept in %2: whether another program had written to it could not be "
                    "seen (%3).")
                     .arg(NameOf(path), NameOf(QString::fromStdString(report.displaced)),
                          KsSystemReason(report.unknown));
    else if (!report.displaced.empty())
        notes << tr("What another program had written to %1 is kept in %2.")
                     .arg(NameOf(path), NameOf(QString::fromStdString(report.displaced)));
    for (const std::string& left : report.leftBehind)
        notes << tr("A save of %1 was cut off. What another program may have written to it just before is kept in %2.")
                     .arg(NameOf(path), NameOf(QString::fromStdString(left)));
    for (const std::string& whole : report.unfinished)
        notes << tr("A save of %1 was cut off while the file was written over: it may be half old and half new. The "
                    "whole "
                    "new content is in %2.")
                     .arg(NameOf(path), NameOf(QString::fromStdString(whole)));
    if (report.lost.Any())
        notes << tr("Not kept of %1 as it was before: %2.").arg(NameOf(path), LostWords(report.lost));
    return notes.join(u'\n');
}
