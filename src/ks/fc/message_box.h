// The one way to show a message box, so that a test can answer it.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QMessageBox>
#include <functional>

class QWidget;

/// Shows a modal message with the given buttons and returns the one pressed. The title is the application's name;
/// `details` stand below the text; Enter presses `defaultButton`.
KS_API QMessageBox::StandardButton KsMessageBox(const CString& text,
                                                QMessageBox::StandardButtons buttons = QMessageBox::Ok,
                                                QWidget* parent = nullptr, const CString& details = {},
                                                QMessageBox::StandardButton defaultButton = QMessageBox::NoButton);

using KsMessageBoxHandler =
    std::function<QMessageBox::StandardButton(const CString& text, QMessageBox::StandardButtons buttons)>;
/// Answers message boxes instead of the user; an empty handler gives them back to the user. Returns the old one.
KS_API KsMessageBoxHandler KsSetMessageBoxHandler(KsMessageBoxHandler handler);
