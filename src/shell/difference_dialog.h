// The table of what differs between a file and what was recovered.
#pragma once

#include "files/difference.h"

#include <QDialog>

/// Deletes itself when it is closed.
class CDifferenceDialog : public QDialog
{
    Q_OBJECT
public:
    /// `name`: of the document, for the user.
    CDifferenceDialog(const QString& name, const Differences& differences, QWidget* parent);

    /// How much differs, in one sentence.
    static QString Summary(const Differences& differences);
};
