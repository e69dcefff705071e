// The one way to ask for a file name, so that a test can answer it.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <functional>

class QWidget;

struct KsFileQuestion
{
    bool save = false; // a name to write, otherwise a file that exists
    CString title;
    CString filters;   // "Name (*.ext);;..." as QFileDialog takes them
    CString proposal;  // path offered first: a file or a folder
    CString extension; // given to a name typed without one; with its point, may be empty
};

/// Asks the user for one file; empty when the user cancelled. Overwriting is the caller's question.
KS_API CString KsAskFileName(const KsFileQuestion& question, QWidget* parent = nullptr);

using KsFileDialogHandler = std::function<CString(const KsFileQuestion& question)>;
/// Answers instead of the user; an empty handler gives the questions back to the user. Returns the old one.
KS_API KsFileDialogHandler KsSetFileDialogHandler(KsFileDialogHandler handler);
