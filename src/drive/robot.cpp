#include "drive/robot.h"

#include "shell/main_frame.h"

#include <QAction>
#include <QApplication>
#include <QDialog>
#include <QDir>
#include <QHeaderView>
#include <QMenu>
#include <QMenuBar>
#include <QTableView>
#include <QTest>
#include <QTimer>
#include <algorithm>
#include <cstdio>

Robot::Robot(CMainFrame& frame, QString pictureFolder) : m_frame(frame), m_folder(std::move(pictureFolder))
{
    QDir().mkpath(m_folder);
}

QWidget* Robot::Control(int number)
{
    const QString suffix = QLatin1Char('_') + QString::number(number);
    for (QWidget* widget : m_frame.findChildren<QWidget*>()) {
        if (widget->objectName().endsWith(suffix) && widget->isVisible())
            return widget;
    }
    Verify(false, QStringLiteral("control %1 is on the page").arg(number));
    return nullptr;
}

void Robot::Key(QWidget* target, int key, Qt::KeyboardModifiers modifiers)
{
    if (target)
        QTest::keyClick(target, Qt::Key(key), modifiers);
    Settle();
}

void Robot::Type(QWidget* target, const QString& text)
{
    if (target)
        QTest::keyClicks(target, text);
    Settle();
}

QWidget* Robot::Focus()
{
    // The window may have lost the activation to a dialog that is gone; nobody else gives it back without a display.
    if (!QApplication::focusWidget()) {
        m_frame.activateWindow();
        Settle();
    }
    return QApplication::focusWidget() ? QApplication::focusWidget() : m_frame.focusWidget();
}

void Robot::KeyToFocus(int key, Qt::KeyboardModifiers modifiers)
{
    Key(Focus(), key, modifiers);
}

void Robot::TypeToFocus(const QString& text)
{
    // A character at a time: the first one opens the cell's editor, which then has the focus.
    for (const QChar c : text)
        QTest::keyClick(Focus(), c.toLatin1());
    Settle();
}

void Robot::Click(QWidget* widget, const QPoint& place)
{
    QTest::mouseClick(widget, Qt::LeftButton, {}, place);
    Settle();
}

void Robot::ClickCell(QTableView* table, int row, int column)
{
    const QModelIndex index = table->model()->index(row, column);
    table->scrollTo(index);
    QTest::mouseClick(table->viewport(), Qt::LeftButton, {}, table->visualRect(index).center());
    Settle();
}

void Robot::ClickRowHeader(QTableView* table, int row)
{
    QHeaderView* header = table->verticalHeader();
    table->scrollTo(table->model()->index(row, 0));
    const QPoint place(header->width() / 2, header->sectionViewportPosition(row) + header->sectionSize(row) / 2);
    QTest::mouseClick(header->viewport(), Qt::LeftButton, {}, place);
    Settle();
}

void Robot::ClickMiddle(QWidget* widget)
{
    if (widget)
        Click(widget, widget->rect().center());
}

/// The menu that holds an entry, or null.
static QMenu* MenuOf(const CMainFrame& frame, const QAction* entry)
{
    const auto menus = frame.findChildren<QMenu*>();
    const auto found =
        std::find_if(menus.begin(), menus.end(), [&](const QMenu* menu) { return menu->actions().contains(entry); });
    return found == menus.end() ? nullptr : *found;
}

bool Robot::ClickEntry(QMenu* menu, QAction* entry)
{
    if (!menu || !menu->isVisible() || !entry->isVisible() || !entry->isEnabled())
        return false;
    const QPoint place = menu->actionGeometry(entry).center();
    QTest::mouseMove(menu, place);
    Click(menu, place);
    return true;
}

bool Robot::OpenMenu(QMenu* menu)
{
    QMenuBar* bar = m_frame.menuBar();
    if (bar->actions().contains(menu->menuAction()))
        Click(bar, bar->actionGeometry(menu->menuAction()).center());
    else if (QMenu* outer = MenuOf(m_frame, menu->menuAction()); !outer || !OpenMenu(outer))
        return false;
    else
        ClickEntry(outer, menu->menuAction());
    return QTest::qWaitFor([menu] { return menu->isVisible(); });
}

void Robot::CloseMenus()
{
    while (QWidget* menu = QApplication::activePopupWidget())
        Key(menu, Qt::Key_Escape);
}

void Robot::Choose(const char* action)
{
    auto* entry = m_frame.findChild<QAction*>(QString::fromLatin1(action));
    QMenu* menu = entry ? MenuOf(m_frame, entry) : nullptr;
    const bool chosen = menu && OpenMenu(menu) && ClickEntry(menu, entry);
    Verify(chosen, QStringLiteral("the command %1 is offered").arg(action));
    if (!chosen)
        CloseMenus();
}

bool Robot::ChooseFrom(QMenu* menu, const std::function<bool(const QString& text)>& matches)
{
    if (OpenMenu(menu)) {
        for (QAction* entry : menu->actions()) {
            if (matches(entry->text().remove(u'&')) && ClickEntry(menu, entry))
                return true;
        }
    }
    CloseMenus();
    return false;
}

void Robot::WithDialog(const std::function<void()>& open, const std::function<void(QDialog&)>& answer)
{
    bool answered = false;
    QTimer poll;
    QObject::connect(&poll, &QTimer::timeout, [&] {
        auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
        if (!dialog || !dialog->isVisible())
            return;
        poll.stop();
        answered = true;
        answer(*dialog);
    });
    poll.start(20);
    open();
    Settle();
    Verify(answered, "the dialog was shown");
}

void Robot::Settle()
{
    QCoreApplication::sendPostedEvents();
    QTest::qWait(10);
}

void Robot::Did(const QString& what)
{
    std::printf("  %s\n", qPrintable(what));
}

void Robot::Verify(bool fact, const QString& what)
{
    ++m_verified;
    if (!fact)
        ++m_failures;
    std::printf("    %s %s\n", fact ? "verified:" : "FAILED:  ", qPrintable(what));
}

void Robot::Picture(const QString& name)
{
    Settle();
    const QString path = m_folder + QLatin1Char('/') + name + QLatin1String(".png");
    if (m_frame.grab().save(path))
        m_pictures << path;
    else
        Verify(false, QStringLiteral("the picture %1 could be written").arg(path));
}
