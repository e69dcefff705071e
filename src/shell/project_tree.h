// The open projects and their files, in a window at the side of the frame.
#pragma once

#include "shell/projects.h"

#include <QDockWidget>
#include <QIcon>
#include <functional>

class QTreeWidget;
class QTreeWidgetItem;

/// A file of a project, as the tree shows it.
struct CMemberState
{
    enum Kind
    {
        Closed,
        Open,
        Missing, // the file is not there
        Unknown  // no editor reads it
    };
    Kind kind = Closed;
    bool modified = false;
    QString elsewhere{}; // the other project that the open file belongs to
    QString wayOut{};    // from the project's folder to a file that does not stand in it
    QIcon icon;
};

class CProjectTree : public QDockWidget
{
    Q_OBJECT
public:
    explicit CProjectTree(QWidget* parent);

    /// Shows the projects as they are now; `state` is asked for each file.
    using State = std::function<CMemberState(const CProject& project, const QString& path)>;
    void Show(const CProjects& projects, const State& state);

signals:
    /// The user wants to see a file: double click or Enter.
    void MemberChosen(CProjectHandle project, const QString& path);
    void CloseProjectChosen(CProjectHandle project);

protected:
    void changeEvent(QEvent* event) override;

private:
    void ShowMenu(const QPoint& position);
    void AddMember(QTreeWidgetItem& project, const QString& path, const CMemberState& state);

    QTreeWidget* m_tree; // child
};
