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

/// A remark about the import as a whole.
struct CImportRemark
{
    QString text;
    bool warning = false; // what is imported may not be what the user means
};

/// What is to be said of coordinates, lengths and completeness.
std::vector<CImportRemark> ImportRemarks(const CImport& import, const CNetwork& network);
/// Remarks, lines left out, lines changed and branches, all by name.
QString ImportReport(const CImport& import, const CNetwork& network);

/// A text to read, and to copy with a button more.
QPlainTextEdit* MakeReportField(QDialogButtonBox& buttons);
/// Shows what was imported.
void ShowImportReport(const QString& report, QWidget* parent);
