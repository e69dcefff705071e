// The cell editors and the delegate that opens them.
#pragma once

#include "ks/fc/typed_text.h"

#include <QPointer>
#include <QStyledItemDelegate>

class CGenGrid;

/// Opens the editor that a column asks for, and keeps it open while its text is no value of the column.
class CGridDelegate : public QStyledItemDelegate, private CKsTypedText
{
    Q_OBJECT
public:
    explicit CGridDelegate(CGenGrid* grid);

    /// The open editor, null when there is none.
    QWidget* Editor() const { return m_editor; }
    /// Takes the open editor's text and closes it. A text that the cell refuses is reported, and the editor stays; then
    /// false.
    bool Commit();

    QWidget* createEditor(QWidget* parent, const QStyleOptionViewItem& option, const QModelIndex& index) const override;
    void setEditorData(QWidget* editor, const QModelIndex& index) const override;
    void setModelData(QWidget* editor, QAbstractItemModel* model, const QModelIndex& index) const override;
    void destroyEditor(QWidget* editor, const QModelIndex& index) const override;
    void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override;
    /// A click or the space bar on a check box or push button.
    bool editorEvent(QEvent* event, QAbstractItemModel* model, const QStyleOptionViewItem& option,
                     const QModelIndex& index) override;

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    void LostFocus(const QEvent* event);
    const QWidget* TypedInto() const override;
    CString TypedPlace() const override;
    CString Typed() const override;
    bool Enter() override;
    QString Refusal() const; // of the open editor's text
    void PaintText(QPainter* painter, const QStyleOptionViewItem& cell, const QModelIndex& index) const;
    void PaintChange(QPainter* painter, const QStyleOptionViewItem& cell, const QModelIndex& index) const;
    void PaintControl(QPainter* painter, const QStyleOptionViewItem& cell, const QModelIndex& index) const;

    CGenGrid* m_grid;
    mutable QPointer<QWidget> m_editor;
    mutable QPersistentModelIndex m_index;
    bool m_telling = false;
};
