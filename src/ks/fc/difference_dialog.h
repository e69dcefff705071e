// The table of what differs between two contents of a document.
#pragma once

#include "files/difference.h"
#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QDialog>

/// Deletes itself when it is closed.
class KS_API CKsDifferenceDialog : public QDialog
{
    Q_OBJECT
public:
    struct Captions
    {
        CString title, before, after; // `before` and `after`: of the two contents
    };
    CKsDifferenceDialog(const Captions& captions, const Differences& differences, QWidget* parent);

    /// How much differs, in one sentence.
    static QString Summary(const Differences& differences);
};
