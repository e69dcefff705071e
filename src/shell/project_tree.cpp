#include "shell/project_tree.h"

#include "ks/fc/shown_text.h"

#include <QDir>
#include <QEvent>
#include <QFileInfo>
#include <QHeaderView>
#include <QMenu>
#include <QTreeWidget>

namespace {

constexpr int HandleRole = Qt::UserRole, PathRole = Qt::UserRole + 1; // the path is that of a member

CProjectHandle HandleOf(const QTreeWidgetItem& item)
{
    return item.data(0, HandleRole).toLongLong();
}

} // namespace

CProjectTree::CProjectTree(QWidget* parent) : QDockWidget(parent), m_tree(new QTreeWidget(this))
{
    setObjectName(QStringLiteral("projectTree"));
    setWidget(m_tree);
    m_tree->setHeaderHidden(true);
    m_tree->setContextMenuPolicy(Qt::CustomContextMenu);
    m_tree->setUniformRowHeights(true);
    m_tree->setTextElideMode(Qt::ElideMiddle); // of a path both ends count
    connect(m_tree, &QTreeWidget::itemActivated, this, [this](QTreeWidgetItem* item) {
        if (item->parent())
            emit MemberChosen(HandleOf(*item), item->data(0, PathRole).toString());
    });
    connect(m_tree, &QTreeWidget::customContextMenuRequested, this, &CProjectTree::ShowMenu);
    QEvent translate(QEvent::LanguageChange);
    changeEvent(&translate);
}

void CProjectTree::Show(const CProjects& projects, const State& state)
{
    const QTreeWidgetItem* current = m_tree->currentItem();
    const QString path = current ? current->data(0, PathRole).toString() : QString();
    m_tree->clear();
    for (const auto& project : projects.All()) {
        auto* root = new QTreeWidgetItem(m_tree, {KsVisibleText(project->name)});
        root->setData(0, HandleRole, qlonglong(project->handle));
        root->setToolTip(0, KsVisibleText(QDir::toNativeSeparators(project->path)));
        for (const QString& member : project->members)
            AddMember(*root, member, state(*project, member));
        root->setExpanded(true);
        for (int i = 0; i < root->childCount(); ++i)
            if (root->child(i)->data(0, PathRole).toString() == path)
                m_tree->setCurrentItem(root->child(i));
    }
}

void CProjectTree::AddMember(QTreeWidgetItem& project, const QString& path, const CMemberState& state)
{
    QString text = KsVisibleText(state.wayOut.isEmpty() ? QFileInfo(path).fileName() : state.wayOut);
    if (state.modified)
        text += u'*';
    if (state.kind == CMemberState::Missing)
        text = tr("%1 (missing)").arg(text);
    else if (state.kind == CMemberState::Unknown)
        text = tr("%1 (no editor)").arg(text);
    else if (!state.elsewhere.isEmpty())
        text =
            tr("%1 (in %2)").arg(text, KsVisibleText(state.elsewhere)); // the tree is narrow; the tip says it in full
    auto* item = new QTreeWidgetItem(&project, {text});
    item->setData(0, HandleRole, project.data(0, HandleRole));
    item->setData(0, PathRole, path);
    item->setIcon(0, state.icon);
    QString tip = KsVisibleText(QDir::toNativeSeparators(path));
    if (!state.elsewhere.isEmpty())
        tip = tr("%1: open in the project %2").arg(tip, KsVisibleText(state.elsewhere));
    if (!state.wayOut.isEmpty())
        tip += u'\n' + tr("This file is outside the project's folder.");
    item->setToolTip(0, tip);
    QFont font = m_tree->font();
    font.setBold(state.kind == CMemberState::Open && state.elsewhere.isEmpty());
    item->setFont(0, font);
    if (state.kind == CMemberState::Missing || state.kind == CMemberState::Unknown)
        item->setForeground(0, palette().color(QPalette::Disabled, QPalette::Text));
}

void CProjectTree::ShowMenu(const QPoint& position)
{
    const QTreeWidgetItem* item = m_tree->itemAt(position);
    if (!item)
        return;
    // The item may be gone when the menu is answered: the tree is filled anew whenever a document changes.
    const CProjectHandle handle = HandleOf(*item);
    const QString path = item->data(0, PathRole).toString();
    QMenu menu(this);
    if (!path.isEmpty())
        menu.addAction(tr("&Open"), this, [this, handle, path] { emit MemberChosen(handle, path); });
    menu.addAction(tr("&Close Project"), this, [this, handle] { emit CloseProjectChosen(handle); });
    menu.exec(m_tree->viewport()->mapToGlobal(position));
}

void CProjectTree::changeEvent(QEvent* event)
{
    QDockWidget::changeEvent(event);
    if (event->type() != QEvent::LanguageChange)
        return;
    setWindowTitle(tr("Project"));
    m_tree->setAccessibleName(tr("Files of the project"));
}
