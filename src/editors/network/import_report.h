// What an import would do, or did, in words.
#pragma once

#include "editors/network/import_branches.h"

class QDialogButtonBox;
class QPlainTextEdit;
class QWidget;

/// Everything an import is about.
struct CImport
{
    QString file; // its name
    const CGisLayer* layer = nullptr;
    CGisSystem target; // not known: the file's numbers are taken as metres
    CGisMap map;
    CImportPlan plan;
};

struct CImportReport
{
    QString text;         // coordinates, lengths, completeness; lines left out, lines changed and branches, all by name
    QStringList warnings; // of these: what is imported may not be what the user means
};
CImportReport ReportOf(const CImport& import, const CNetwork& network);

/// A text to read, and to copy with a button more.
QPlainTextEdit* MakeReportField(QDialogButtonBox& buttons);
/// Shows what was imported.
void ShowImportReport(const QString& report, QWidget* parent);
