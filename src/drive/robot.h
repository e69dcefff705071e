// Hands and eyes for driving the program: finds controls by number, types, clicks, takes pictures, keeps a record of
// what was verified.
#pragma once

#include <QString>
#include <QStringList>
#include <functional>

class CMainFrame;
class QAction;
class QDialog;
class QMenu;
class QTableView;
class QWidget;

class Robot
{
public:
    /// Pictures go into `pictureFolder`, which is created.
    Robot(CMainFrame& frame, QString pictureFolder);

    CMainFrame& Frame() const { return m_frame; }

    /// The visible control whose object name ends with "_<number>"; the failure is recorded when there is none.
    QWidget* Control(int number);
    template <typename T>
    T* Control(int number)
    {
        return qobject_cast<T*>(Control(number));
    }

    void Key(QWidget* target, int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier);
    void Type(QWidget* target, const QString& text);
    /// Whatever has the focus: the cell editor that typing opened, or the grid itself.
    void KeyToFocus(int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier);
    void TypeToFocus(const QString& text);
    void Click(QWidget* widget, const QPoint& place);
    void ClickCell(QTableView* table, int row, int column);
    void ClickRowHeader(QTableView* table, int row);
    void ClickMiddle(QWidget* widget);
    /// Chooses a menu entry with the mouse, opening the menus on the way to it; by object name.
    void Choose(const char* action);
    /// The same for an entry of a menu that is filled as it opens; whether one was there.
    bool ChooseFrom(QMenu* menu, const std::function<bool(const QString& text)>& matches);
    /// Carries out `open`, which shows a modal dialog, and hands the dialog to `answer`.
    void WithDialog(const std::function<void()>& open, const std::function<void(QDialog&)>& answer);
    void Settle();

    void Did(const QString& what);
    void Verify(bool fact, const QString& what);
    void Picture(const QString& name);

    int Failures() const { return m_failures; }
    int Verified() const { return m_verified; }
    const QStringList& Pictures() const { return m_pictures; }

private:
    QWidget* Focus();
    bool ClickEntry(QMenu* menu, QAction* entry);
    bool OpenMenu(QMenu* menu);
    void CloseMenus();

    CMainFrame& m_frame;
    QString m_folder;
    QStringList m_pictures;
    int m_verified = 0, m_failures = 0;
};
