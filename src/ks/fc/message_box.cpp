#include "ks/fc/message_box.h"

#include <QApplication>
#include <QLabel>
#include <utility>

namespace {
KsMessageBoxHandler& Handler()
{
    static KsMessageBoxHandler handler;
    return handler;
}

CKsKeptMessages* keeper = nullptr; // the innermost one

QMessageBox::Icon IconFor(QMessageBox::StandardButtons buttons)
{
    return buttons == QMessageBox::Ok ? QMessageBox::Warning : QMessageBox::Question;
}
} // namespace

QMessageBox::StandardButton KsMessageBox(const CString& text, QMessageBox::StandardButtons buttons, QWidget* parent,
                                         const CString& details, QMessageBox::StandardButton defaultButton)
{
    if (keeper && buttons == QMessageBox::Ok) {
        keeper->m_texts << text;
        return QMessageBox::Ok;
    }
    if (const auto handler = Handler())
        return handler(text, buttons);
    QMessageBox box(IconFor(buttons), QCoreApplication::applicationName(), text, buttons,
                    parent ? parent : QApplication::activeWindow());
    box.setDefaultButton(defaultButton);
    box.setTextFormat(Qt::PlainText); // file names may hold anything
    box.setInformativeText(details);
    if (auto* label = box.findChild<QLabel*>(QStringLiteral("qt_msgbox_informativelabel")))
        label->setTextFormat(Qt::PlainText);
    return QMessageBox::StandardButton(box.exec());
}

KsMessageBoxHandler KsSetMessageBoxHandler(KsMessageBoxHandler handler)
{
    return std::exchange(Handler(), std::move(handler));
}

CKsKeptMessages::CKsKeptMessages() : m_outer(std::exchange(keeper, this)) {}

CKsKeptMessages::~CKsKeptMessages()
{
    keeper = m_outer;
}
