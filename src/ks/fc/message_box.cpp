#include "ks/fc/message_box.h"

#include <QApplication>
#include <QLabel>
#include <utility>

static KsMessageBoxHandler g_handler;
static CKsKeptMessages* g_keeper = nullptr; // the innermost one

QMessageBox::StandardButton KsMessageBox(const CString& text, QMessageBox::StandardButtons buttons, QWidget* parent,
                                         const CString& details, QMessageBox::StandardButton defaultButton)
{
    if (g_keeper && buttons == QMessageBox::Ok) {
        g_keeper->m_texts << text;
        return QMessageBox::Ok;
    }
    if (const auto handler = g_handler)
        return handler(text, buttons);
    QMessageBox box(buttons == QMessageBox::Ok ? QMessageBox::Warning : QMessageBox::Question,
                    QCoreApplication::applicationName(), text, buttons, parent ? parent : QApplication::activeWindow());
    box.setDefaultButton(defaultButton);
    box.setTextFormat(Qt::PlainText); // file names may hold anything
    box.setInformativeText(details);
    if (auto* label = box.findChild<QLabel*>(QStringLiteral("qt_msgbox_informativelabel")))
        label->setTextFormat(Qt::PlainText);
    return QMessageBox::StandardButton(box.exec());
}

KsMessageBoxHandler KsSetMessageBoxHandler(KsMessageBoxHandler handler)
{
    return std::exchange(g_handler, std::move(handler));
}

CKsKeptMessages::CKsKeptMessages() : m_outer(std::exchange(g_keeper, this)) {}

CKsKeptMessages::~CKsKeptMessages()
{
    g_keeper = m_outer;
}
