// The one way to show a message box, so that a test can answer it.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QMessageBox>
#include <QStringList>
#include <functional>

class QWidget;

/// Shows a modal message with the given buttons and returns the one pressed. The title is the application's name;
/// `details` stand below the text; Enter presses `defaultButton`. Of a text too long for a screen the beginning and the
/// last lines are shown, and how many lines are left out.
KS_API QMessageBox::StandardButton KsMessageBox(const CString& text,
                                                QMessageBox::StandardButtons buttons = QMessageBox::Ok,
                                                QWidget* parent = nullptr, const CString& details = {},
                                                QMessageBox::StandardButton defaultButton = QMessageBox::NoButton);

/// While it lives, messages that ask nothing are kept instead of shown, so that they can be told together. Questions
/// are asked at once. The innermost one keeps.
class KS_API CKsKeptMessages
{
public:
    CKsKeptMessages();
    ~CKsKeptMessages();
    CKsKeptMessages(const CKsKeptMessages&) = delete;
    CKsKeptMessages& operator=(const CKsKeptMessages&) = delete;
    const QStringList& Texts() const { return m_texts; }

private:
    friend QMessageBox::StandardButton KsMessageBox(const CString&, QMessageBox::StandardButtons, QWidget*,
                                                    const CString&, QMessageBox::StandardButton);
    QStringList m_texts;
    CKsKeptMessages* m_outer;
};

using KsMessageBoxHandler =
    std::function<QMessageBox::StandardButton(const CString& text, QMessageBox::StandardButtons buttons)>;
/// Answers message boxes instead of the user; an empty handler gives them back to the user. Returns the old one.
KS_API KsMessageBoxHandler KsSetMessageBoxHandler(KsMessageBoxHandler handler);
