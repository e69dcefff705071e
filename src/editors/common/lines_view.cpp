#include "editors/common/lines_view.h"

#include "editors/common/lines_table.h"
#include "ks/fc/message_box.h"

#include <QHeaderView>
#include <QLineEdit>
#include <QScopedValueRollback>
#include <QStyledItemDelegate>
#include <algorithm>

/// Knows the open editor, and leaves what is being typed alone when the document changes meanwhile.
class CLinesDelegate : public QStyledItemDelegate
{
public:
    explicit CLinesDelegate(CLinesView* view) : QStyledItemDelegate(view), m_view(view) {}
    QWidget* createEditor(QWidget* parent, const QStyleOptionViewItem& option, const QModelIndex& index) const override
    {
        m_view->m_editor = QStyledItemDelegate::createEditor(parent, option, index);
        m_view->m_kept = false;
        return m_view->m_editor;
    }
    void setEditorData(QWidget* editor, const QModelIndex& index) const override
    {
        const auto* field = qobject_cast<QLineEdit*>(editor);
        if (!field || !field->isModified())
            QStyledItemDelegate::setEditorData(editor, index);
    }

private:
    CLinesView* m_view;
};

CLinesView::CLinesView(CLinesTable* model, const QString& name)
{
    setObjectName(name);
    setItemDelegate(new CLinesDelegate(this));
    setModel(model);
    setAlternatingRowColors(true);
    setSelectionBehavior(QAbstractItemView::SelectRows);
    horizontalHeader()->setHighlightSections(false);
    horizontalHeader()->setStretchLastSection(true);
    verticalHeader()->setDefaultSectionSize(fontMetrics().height() + 8);
    connect(model, &CLinesTable::Refused, this, &CLinesView::Refused);
    connect(model, &CLinesTable::modelReset, this, &CLinesView::WidenColumns);
}

void CLinesView::GoTo(int row, int column)
{
    const QModelIndex at = model()->index(row, column);
    constexpr auto line = QItemSelectionModel::ClearAndSelect | QItemSelectionModel::Rows;
    selectionModel()->setCurrentIndex(at, at.isValid() ? line : QItemSelectionModel::Clear);
    if (at.isValid())
        scrollTo(at);
}

// ---- editing -----------------------------------------------------------------------------------

bool CLinesView::Store()
{
    if (!m_editor || m_telling)
        return !m_editor;
    commitData(m_editor);
    if (m_kept) {
        Tell();
        return false;
    }
    if (m_editor)
        closeEditor(m_editor, QAbstractItemDelegate::NoHint);
    return true;
}

void CLinesView::commitData(QWidget* editor)
{
    if (m_telling) // the message took the focus from the editor
        return;
    const QScopedValueRollback committing(m_committing, true);
    m_kept = false;
    QTableView::commitData(editor);
    WidenColumns();
}

/// What was refused stays in its editor; Escape gives it up.
void CLinesView::closeEditor(QWidget* editor, QAbstractItemDelegate::EndEditHint hint)
{
    if (editor == m_editor && (m_kept || m_telling) && hint != QAbstractItemDelegate::RevertModelCache)
        return;
    if (editor == m_editor) {
        m_editor = nullptr;
        m_kept = false;
        m_refusal.clear();
    }
    QTableView::closeEditor(editor, hint);
}

/// A message in the middle of a change of focus would be in its way, so it comes after it.
void CLinesView::Refused(const QString& message)
{
    m_kept = m_committing;
    if (std::exchange(m_refusal, message).isEmpty())
        QMetaObject::invokeMethod(this, &CLinesView::Tell, Qt::QueuedConnection);
}

void CLinesView::Tell()
{
    if (m_refusal.isEmpty() || m_telling)
        return;
    const QString message = std::exchange(m_refusal, {});
    {
        const QScopedValueRollback telling(m_telling, true);
        KsMessageBox(message, QMessageBox::Ok, this);
    }
    if (!m_editor || !m_kept)
        return;
    const QModelIndex at = indexAt(m_editor->geometry().center());
    if (at.isValid() && at != currentIndex())
        GoTo(at.row(), at.column());
    scrollTo(currentIndex());
    m_editor->setFocus();
}

void CLinesView::mousePressEvent(QMouseEvent* event)
{
    if (Store())
        QTableView::mousePressEvent(event);
}

// ---- columns -----------------------------------------------------------------------------------

void CLinesView::FitColumns()
{
    for (int column = 0; column < model()->columnCount(); ++column)
        setColumnWidth(column, horizontalHeader()->minimumSectionSize());
    WidenColumns();
}

/// Narrower ones only: the user may have made some wide.
void CLinesView::WidenColumns()
{
    constexpr int most = 360, margin = 14, rowsMeasured = 20'000;
    const int rows = std::min(model()->rowCount(), rowsMeasured);
    for (int column = 0; column < model()->columnCount(); ++column) {
        int width = horizontalHeader()->sectionSizeHint(column);
        const bool box = model()->index(0, column).data(Qt::CheckStateRole).isValid();
        const int beside = margin + (box ? style()->pixelMetric(QStyle::PM_IndicatorWidth) + margin : 0);
        for (int row = 0; row < rows; ++row) {
            const QString text = model()->index(row, column).data().toString();
            width = std::max(width, fontMetrics().horizontalAdvance(text) + beside);
        }
        if (columnWidth(column) < std::min(width, most))
            setColumnWidth(column, std::min(width, most));
    }
}
