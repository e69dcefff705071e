// The application object of the shell.
#pragma once

#include <QApplication>

/// Memory that ends while an event is met ends what the event asked for, and not the program: the user is told.
class CApplication : public QApplication
{
    Q_OBJECT
public:
    using QApplication::QApplication;
    bool notify(QObject* receiver, QEvent* event) override;

private:
    void TellLater();
    void Tell();

    bool m_tells = false;
};
