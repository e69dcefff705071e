// What a document has to say of its file: what could not be taken from it, and what became of it at the last save.
#include "ks/fc/file_notice.h"

#include "ks/fc/file_bar.h"
#include "ks/fc/file_name.h"
#include "ks/fc/project_doc.h"
#include "ks/fc/system_reason.h"

/// Of a folder, in which the lock would stand.
static CString WhyNoLock(std::error_code why)
{
    const bool hasNone = why == std::errc::operation_not_supported || why == std::errc::function_not_supported ||
                         why == std::errc::no_lock_available;
    const bool isTaken = why == std::errc::file_exists || why == std::errc::is_a_directory ||
                         why == std::errc::too_many_symbolic_link_levels;
    return hasNone   ? CKsFileBar::tr("its file system has no locks")
           : isTaken ? CKsFileBar::tr("another file has the name of the lock")
                     : KsSystemReason(why);
}

void CKsProjectDoc::AddNoticeSource(KsNoticeSource source)
{
    m_noticeSources.push_back(std::move(source));
    emit FileStateChanged();
}

std::vector<KsFileNotice> CKsProjectDoc::Notices()
{
    std::vector<KsFileNotice> notices;
    UseNotice(notices);
    for (const KsNoticeSource& source : m_noticeSources)
        source(notices);
    OwnNotice(notices);
    return notices;
}

void CKsProjectDoc::UseNotice(std::vector<KsFileNotice>& notices)
{
    const CString name = KsShownFileName(m_file.Path());
    const KsNoticeAction copy{CKsFileBar::tr("Edit a Copy..."), [this](CKsFileBar&) { EditCopy(); }};
    if (IsInUse() && m_use.IsFree()) {
        notices.push_back(
            {CKsFileBar::tr("%1 can be edited now: it is no longer in use by %2. What has been written to "
                            "it meanwhile is read first.")
                 .arg(name, m_use.Holder()),
             {{CKsFileBar::tr("Edit"), [this](CKsFileBar&) { EditFreed(); }}, copy}});
    } else if (IsInUse()) {
        notices.push_back({CKsFileBar::tr("%1 is in use by %2. Here it can be looked at and copied, not changed.")
                               .arg(name, m_use.Holder()),
                           {copy}});
    } else if (const CString rival = m_use.Rival(); !rival.isEmpty()) {
        notices.push_back({CKsFileBar::tr("%1 is in use by %2, too: the lock that kept others out was removed. Here it "
                                          "can be saved when he has let go of it, or under another name.")
                               .arg(name, rival),
                           {copy}});
    } else if (m_use.WhyNone() && !m_isUseClosed) {
        notices.push_back(
            {CKsFileBar::tr("Other programs cannot be told that %1 is in use here: %2. Nobody else should "
                            "change it now.")
                 .arg(name, WhyNoLock(m_use.WhyNone())),
             {},
             [this] {
                 m_isUseClosed = true;
                 emit FileStateChanged();
             }});
    }
}

void CKsProjectDoc::OwnNotice(std::vector<KsFileNotice>& notices)
{
    const CString name = KsShownFileName(m_file.Path());
    const auto close = [this] {
        m_isNoticeClosed = true;
        emit FileStateChanged();
    };
    if (m_file.IsUnreadable()) {
        KsFileNotice notice{CKsFileBar::tr("%1 could not be read. What is shown here are default values, not its "
                                           "content.\n%2")
                                .arg(name, m_file.Error())};
        if (m_showsDefaults)
            notice.actions = {{CKsFileBar::tr("Edit Default Values"), [this](CKsFileBar&) { EditUnreadable(); }}};
        notices.push_back(std::move(notice));
    }
    if (m_isNoticeClosed)
        return;
    if (!m_file.Findings().empty())
        notices.push_back({CKsFileBar::tr("Values of %1 that were not taken as they stand: %2. A save keeps the file "
                                          "as it is in a copy.")
                               .arg(name)
                               .arg(m_file.Findings().size()),
                           {{CKsFileBar::tr("Show List..."), [](CKsFileBar& bar) { bar.ShowList(); }}},
                           close});
    QStringList notes{m_file.SaveNotes()};
    if (!m_file.KeptCopy().isEmpty())
        notes << CKsFileBar::tr("The file as it was before this save is kept in %1.")
                     .arg(KsShownFileName(m_file.KeptCopy()));
    notes.removeAll(QString());
    if (!notes.isEmpty())
        notices.push_back({notes.join(u'\n'), {}, close});
}
