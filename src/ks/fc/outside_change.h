// What other programs do to the file of an open document, and what the user may do about it.
#pragma once

#include "ks/fc/file_notice.h"
#include "ks/fc/file_watch.h"

#include <QCoreApplication>

class CKsProjectDoc;
class QWidget;

/// Part of a document; its notice stands above the document's views as long as the file is not what the document knows.
/// Nothing is done without the user: what is shown stays until a choice is made, and a save asks again.
class CKsOutsideChange : public QObject
{
    Q_OBJECT
public:
    explicit CKsOutsideChange(CKsProjectDoc& document);

    /// Begins to follow the file; a document that is only read never does.
    void Watch();
    /// The document and its file are the same now.
    void Expect();
    const KsFileSight& Sight() const { return m_watch->Sight(); }

    // What the user may do when another content stands in the file.
    void Reload();
    /// What differs between what is shown and the file.
    void Compare(QWidget* parent);
    /// Saves what is shown under another name, which is proposed, and goes on there.
    void KeepBoth();
    void Overwrite();

private:
    void Append(std::vector<KsFileNotice>& notices);
    KsFileNotice OtherContent();
    CString Name() const;
    void Refresh();

    CKsProjectDoc& m_document; // the parent
    CKsFileWatch* m_watch;     // child
    CString m_whyNotReloaded;
    bool m_isWatching = false;
    bool m_isClosed = false; // the user has read it
};
