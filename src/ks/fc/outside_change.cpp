#include "ks/fc/outside_change.h"

#include "ks/fc/difference_dialog.h"
#include "ks/fc/doc_template.h"
#include "ks/fc/file_bar.h"
#include "ks/fc/file_name.h"
#include "ks/fc/message_box.h"
#include "ks/fc/project_doc.h"
#include "ks/fc/system_reason.h"
#include "ks/language/date_time.h"

#include <QApplication>
#include <QDateTime>
#include <QDir>
#include <QFileInfo>
#include <QLocale>

namespace {

CString TimeText(std::int64_t nanoseconds)
{
    return KsDateTimeText(QDateTime::fromMSecsSinceEpoch(nanoseconds / 1'000'000));
}

} // namespace

CKsOutsideChange::CKsOutsideChange(CKsProjectDoc& document)
    : QObject(&document), m_document(document), m_watch(new CKsFileWatch(this))
{
    connect(m_watch, &CKsFileWatch::Changed, this, [this] {
        m_isClosed = false;
        m_whyNotReloaded.clear();
        Refresh();
        emit m_document.FileGoneChanged();
    });
    connect(m_watch, &CKsFileWatch::HasMoreNames, &document, &CKsProjectDoc::FileHasMoreNames);
    // What a choice means depends on whether something is unsaved.
    connect(&document, &CKsDoc::TitleChanged, this, [this] {
        if (Sight().kind != KsFileSight::Known)
            Refresh();
    });
    document.AddNoticeSource([this](std::vector<KsFileNotice>& notices) { Append(notices); });
}

void CKsOutsideChange::Watch()
{
    if (std::exchange(m_isWatching, true))
        return;
    Expect();
}

void CKsOutsideChange::Expect()
{
    const CKsDocumentFile& file = m_document.File();
    m_whyNotReloaded.clear();
    if (m_isWatching && !file.Path().isEmpty())
        m_watch->Expect(file.Path(), file.Version(), file.Seen());
}

CString CKsOutsideChange::Name() const
{
    return KsShownFileName(m_document.File().Path());
}

void CKsOutsideChange::Refresh()
{
    emit m_document.FileStateChanged();
}

KsFileNotice CKsOutsideChange::OtherContent()
{
    KsFileNotice notice;
    const bool isReadOnly = m_document.IsReadOnly();
    notice.text = (isReadOnly ? tr("%1 was changed by another program (%2). What is shown is the content before.")
                   : m_document.IsModified()
                       ? tr("%1 was changed by another program (%2), and the changes made here are not saved. Reload "
                            "takes the file; undo brings back what is shown. Keep Both saves what is shown under "
                            "another name. Overwrite saves it here; the file as it is stays in a copy beside it.")
                       : tr("%1 was changed by another program (%2). What is shown is the content before. Reload takes "
                            "the file; undo brings back what is shown. Keep Both saves what is shown under another "
                            "name. Overwrite puts it back; the file as it is stays in a copy beside it."))
                      .arg(Name(), TimeText(Sight().time));
    if (!m_whyNotReloaded.isEmpty())
        notice.text +=
            u'\n' + tr("The file cannot be loaded as it is, and what is shown stays: %1").arg(m_whyNotReloaded);
    notice.actions = {{tr("Reload"), [this](CKsFileBar&) { Reload(); }},
                      {tr("Compare..."), [this](CKsFileBar& bar) { Compare(&bar); }}};
    if (!isReadOnly) {
        notice.actions.push_back({tr("Keep Both..."), [this](CKsFileBar&) { KeepBoth(); }});
        notice.actions.push_back({tr("Overwrite"), [this](CKsFileBar&) { Overwrite(); }});
    }
    return notice;
}

void CKsOutsideChange::Append(std::vector<KsFileNotice>& notices)
{
    if (m_isClosed || Sight().kind == KsFileSight::Known)
        return;
    KsFileNotice notice;
    const KsNoticeAction saveAs{tr("Save As..."), [this](CKsFileBar&) { m_document.DoSave({}); }};
    if (Sight().kind == KsFileSight::Other) {
        notice = OtherContent();
    } else if (Sight().kind == KsFileSight::Gone) {
        const bool hasFolder = QFileInfo(m_document.File().Path()).dir().exists();
        notice.text =
            (hasFolder ? tr("%1 was removed or renamed by another program (%2). What is shown is nowhere else "
                            "until it is saved again.")
                       : tr("The folder of %1 was removed or renamed by another program (%2). What is shown "
                            "can be saved under another name only."))
                .arg(Name(), TimeText(Sight().time));
        if (hasFolder && !m_document.IsInUse())
            notice.actions.push_back(
                {tr("Save Again"), [this](CKsFileBar&) { m_document.DoSave(m_document.GetPathName()); }});
        notice.actions.push_back(saveAs);
    } else {
        notice.text = tr("%1 cannot be read any more: %2. What is shown stays; to be safe save it under another name.")
                          .arg(Name(), KsSystemReason(Sight().why));
        notice.actions = {saveAs};
    }
    notice.close = [this] {
        m_isClosed = true;
        Refresh();
    };
    notices.push_back(std::move(notice));
}

void CKsOutsideChange::Reload()
{
    CString why;
    if (m_document.Reload(why) || why.isEmpty())
        return;
    m_whyNotReloaded = why;
    Refresh();
}

void CKsOutsideChange::Compare(QWidget* parent)
{
    if (!m_document.MayLeave()) // what is being typed is shown, too
        return;
    QApplication::setOverrideCursor(Qt::WaitCursor);
    Result<std::string> shown = m_document.ContentText();
    const CKsDatesOfFiles dates(m_document.DateOfFile());
    Result<std::string> there = m_document.GetDocTemplate()->ContentOf(m_document.File().Path());
    const auto differences =
        shown && there ? FindDifferences(std::move(shown.value()), std::move(there.value())) : std::nullopt;
    QApplication::restoreOverrideCursor();
    if (!differences) {
        KsMessageBox(tr("What differs is not known: the file cannot be read."));
        return;
    }
    (new CKsDifferenceDialog({tr("Changes of %1 by Another Program").arg(Name()), tr("Shown"), tr("In the file")},
                             *differences, parent))
        ->open();
}

void CKsOutsideChange::KeepBoth()
{
    m_document.DoSave({}, KsFreeFileName(m_document.GetPathName()));
}

void CKsOutsideChange::Overwrite()
{
    m_document.SaveOverOthers();
}
