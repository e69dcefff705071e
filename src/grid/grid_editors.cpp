#include "grid/grid_editors.h"

#include "grid/bounds.h"
#include "grid/digits_mark.h"
#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "grid/grid_input.h"
#include "grid/grid_keys.h"
#include "grid/grid_model.h"
#include "grid/grid_texts.h"
#include "grid/name_offers.h"
#include "grid/saved_mark.h"
#include "grid/typing.h"

#include <QApplication>
#include <QComboBox>
#include <QElapsedTimer>
#include <QKeyEvent>
#include <QLineEdit>
#include <QMdiSubWindow>
#include <QPainter>
#include <QScopedValueRollback>
#include <QTimer>

namespace {

constexpr int DropDownHeight = 500; // pixels

QString TextOf(const QWidget* editor)
{
    const auto* list = qobject_cast<const QComboBox*>(editor);
    return list ? list->currentText() : static_cast<const QLineEdit*>(editor)->text();
}

/// The whole of a document's view, where there is room for what a cell offers.
QWidget* ViewAround(QWidget* widget)
{
    while (!widget->isWindow() && widget->parentWidget() && !qobject_cast<QMdiSubWindow*>(widget->parentWidget()))
        widget = widget->parentWidget();
    return widget;
}

/// Also when the widget is a window of its own, like the pop-up of a list.
bool IsPartOf(const QWidget* widget, const QWidget* whole)
{
    while (widget && widget != whole)
        widget = widget->parentWidget();
    return widget;
}

QLineEdit* MakeLineEdit(const GridControl& control, QWidget* parent)
{
    auto* edit = new QLineEdit(parent);
    edit->setFrame(false);
    if (control.kind == CellKind::Number || control.kind == CellKind::Integer)
        edit->setAlignment(Qt::AlignRight);
    if (!control.upperCase)
        return edit;
    QObject::connect(edit, &QLineEdit::textEdited, edit, [edit](const QString& text) {
        const QString upper = text.toUpper();
        if (upper == text)
            return;
        const int cursor = edit->cursorPosition() + int(upper.size() - text.size());
        edit->setText(upper);
        edit->setCursorPosition(cursor);
    });
    return edit;
}

/// The branch names of the network, to choose from; another name can still be typed.
QWidget* MakeBranchList(const QStringList& names, QWidget* parent, QWidget* view)
{
    auto* list = new QComboBox(parent);
    list->setEditable(true);
    list->setLineEdit(MakeLineEdit(Control::Text, list));
    list->setInsertPolicy(QComboBox::NoInsert);
    list->addItems(names);
    list->setMaxVisibleItems(DropDownHeight / list->fontMetrics().lineSpacing());
    new CNameOffers(list, view);
    return list;
}

/// A list whose entries are found by their letters, blanks among them: only a first blank opens it.
class CChoiceList : public QComboBox
{
public:
    using QComboBox::QComboBox;

protected:
    void keyPressEvent(QKeyEvent* event) override
    {
        const bool isTyping = m_typed.isValid() && m_typed.elapsed() < QApplication::keyboardInputInterval();
        const bool isLetter = !event->text().isEmpty() && event->text().at(0).isPrint();
        if (isLetter && (isTyping || event->key() != Qt::Key_Space))
            m_typed.start();
        if (!isTyping || event->key() != Qt::Key_Space)
            return QComboBox::keyPressEvent(event);
        QKeyEvent letter(QEvent::KeyPress, Qt::Key_nobreakspace, event->modifiers(), event->text());
        QComboBox::keyPressEvent(&letter);
    }

private:
    QElapsedTimer m_typed;
};

/// One of a column's entries, by pop-up, arrow keys or first letters; Backspace empties the cell.
QWidget* MakeChoice(const QStringList& entries, QWidget* parent)
{
    auto* list = new CChoiceList(parent);
    list->addItems(entries);
    // Opened by the mouse the entries are what the user wants to see next.
    if (QApplication::mouseButtons() != Qt::NoButton)
        QTimer::singleShot(0, list, &QComboBox::showPopup);
    return list;
}

QWidget* MakeEditor(const ColumnSpec& column, QWidget* parent)
{
    const bool isChoice = column.Kind() == CellKind::Choice || column.Kind() == CellKind::TextChoice;
    return isChoice ? MakeChoice(column.choices.entries(), parent) : MakeLineEdit(column.control, parent);
}

} // namespace

CGridDelegate::CGridDelegate(CGenGrid* grid) : QStyledItemDelegate(grid), m_grid(grid) {}

QWidget* CGridDelegate::createEditor(QWidget* parent, const QStyleOptionViewItem&, const QModelIndex& index) const
{
    const ColumnSpec& column = m_grid->Model()->Column(index.column());
    const bool offersNames = index.column() + 1 == m_grid->BranchNameColumn() && m_grid->Host();
    const QStringList names = offersNames ? m_grid->Host()->BranchNames() : QStringList();
    QWidget* editor = names.isEmpty() ? MakeEditor(column, parent) : MakeBranchList(names, parent, ViewAround(m_grid));
    editor->setObjectName(column.control.editorName);
    editor->setAccessibleName(column.header());
    editor->setAutoFillBackground(true);
    DropLineEnds(*editor);
    m_editor = editor;
    m_index = index;
    return editor;
}

void CGridDelegate::setEditorData(QWidget* editor, const QModelIndex& index) const
{
    // Once, when the editor opens: what is being typed outlives a reload of the rows.
    if (editor->property("opened").toBool())
        return;
    editor->setProperty("opened", true);
    const QString text = index.data(Qt::EditRole).toString();
    auto* list = qobject_cast<QComboBox*>(editor);
    if (!list) {
        static_cast<QLineEdit*>(editor)->setText(text);
    } else if (list->isEditable()) {
        list->setCurrentText(text);
        list->lineEdit()->selectAll();
    } else {
        if (!text.isEmpty() && list->findText(text) < 0)
            list->addItem(text); // one that is no entry is one as long as the editor is open
        list->setCurrentIndex(list->findText(text));
    }
}

void CGridDelegate::setModelData(QWidget* editor, QAbstractItemModel* model, const QModelIndex& index) const
{
    model->setData(index, TextOf(editor), Qt::EditRole);
}

void CGridDelegate::destroyEditor(QWidget* editor, const QModelIndex& index) const
{
    if (editor == m_editor)
        m_editor = nullptr;
    QStyledItemDelegate::destroyEditor(editor, index);
}

void CGridDelegate::PaintControl(QPainter* painter, const QStyleOptionViewItem& cell, const QModelIndex& index) const
{
    const ColumnSpec& column = m_grid->Model()->Column(index.column());
    const QStyle& style = *m_grid->style();
    const bool locked = m_grid->Model()->IsLocked(index.row(), index.column());
    QStyleOptionButton button;
    button.palette = cell.palette;
    button.state = cell.state & (QStyle::State_Enabled | QStyle::State_MouseOver);
    button.state.setFlag(QStyle::State_Enabled, cell.state.testFlag(QStyle::State_Enabled) && !locked);
    if (column.Kind() == CellKind::Flag) {
        // Styles shade the frame of a box from the window's color, which in dark palettes is that of an empty cell.
        if (cell.palette.color(QPalette::Base).lightness() < 128)
            button.palette.setColor(QPalette::Window, cell.palette.color(QPalette::Text));
        const QSize size(style.pixelMetric(QStyle::PM_IndicatorWidth, nullptr, m_grid),
                         style.pixelMetric(QStyle::PM_IndicatorHeight, nullptr, m_grid));
        button.rect = QStyle::alignedRect(cell.direction, Qt::AlignCenter, size, cell.rect);
        button.state |= index.data(Qt::CheckStateRole).toInt() == Qt::Checked ? QStyle::State_On : QStyle::State_Off;
        style.drawPrimitive(QStyle::PE_IndicatorCheckBox, &button, painter, m_grid);
    } else {
        button.rect = cell.rect.adjusted(1, 1, -1, -1);
        button.state |= QStyle::State_Raised;
        button.text = QStringLiteral("...");
        button.fontMetrics = cell.fontMetrics;
        style.drawControl(QStyle::CE_PushButton, &button, painter, m_grid);
    }
}

void CGridDelegate::PaintChange(QPainter* painter, const QStyleOptionViewItem& cell, const QModelIndex& index) const
{
    if (m_grid->Model()->Saved().Before(index.row(), index.column()))
        PaintCellMark(*painter, cell.rect, cell.palette, cell.state.testFlag(QStyle::State_Selected));
}

/// A text on its background. The style would lay it out as it does rich contents, which takes several times as long,
/// and a table repaints hundreds of cells at each step of scrolling.
void CGridDelegate::PaintText(QPainter* painter, const QStyleOptionViewItem& cell, const QModelIndex& index) const
{
    const QVariant background = index.data(Qt::BackgroundRole);
    if (background.isValid())
        painter->fillRect(cell.rect, qvariant_cast<QBrush>(background));
    QString text = index.data(Qt::DisplayRole).toString();
    if (text.isEmpty())
        return;
    const int margin = m_grid->style()->pixelMetric(QStyle::PM_FocusFrameHMargin, nullptr, m_grid) + 1;
    const QRect inside = cell.rect.adjusted(margin, 0, -margin, 0);
    int width = cell.fontMetrics.horizontalAdvance(text);
    if (width > inside.width()) {
        text = cell.fontMetrics.elidedText(text, cell.textElideMode, inside.width());
        width = cell.fontMetrics.horizontalAdvance(text);
    }
    const bool isRight = m_grid->Model()->Column(index.column()).IsNumeric();
    const int x = isRight ? inside.right() + 1 - width : inside.left();
    const int y = inside.top() + (inside.height() - cell.fontMetrics.height() + 1) / 2 + cell.fontMetrics.ascent();
    const bool enabled = cell.state.testFlag(QStyle::State_Enabled);
    const QVariant own = enabled ? index.data(Qt::ForegroundRole) : QVariant();
    painter->setPen(own.isValid()
                        ? qvariant_cast<QBrush>(own).color()
                        : cell.palette.color(enabled ? QPalette::Normal : QPalette::Disabled, QPalette::Text));
    painter->drawText(x, y, text);
}

void CGridDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const
{
    constexpr QStyle::State special = QStyle::State_Selected | QStyle::State_HasFocus | QStyle::State_MouseOver;
    const bool isText = !m_grid->Model()->Column(index.column()).ActsAtOnce();
    if (isText) {
        if (!(option.state & special) && option.direction == Qt::LeftToRight)
            PaintText(painter, option, index);
        else
            QStyledItemDelegate::paint(painter, option, index);
        if (m_grid->Model()->HidesDigits(index.row(), index.column()))
            PaintDigitsMark(*painter, option.rect, option.palette, option.state.testFlag(QStyle::State_Selected));
        PaintChange(painter, option, index);
        return;
    }
    QStyleOptionViewItem cell = option;
    initStyleOption(&cell, index);
    cell.features &= ~QStyleOptionViewItem::HasCheckIndicator; // drawn centred below
    m_grid->style()->drawControl(QStyle::CE_ItemViewItem, &cell, painter, m_grid);
    PaintControl(painter, cell, index);
    PaintChange(painter, option, index);
}

bool CGridDelegate::editorEvent(QEvent* event, QAbstractItemModel*, const QStyleOptionViewItem& option,
                                const QModelIndex& index)
{
    if (!m_grid->Model()->Column(index.column()).ActsAtOnce())
        return false;
    switch (event->type()) {
    case QEvent::MouseButtonRelease: {
        const auto* mouse = static_cast<QMouseEvent*>(event);
        if (mouse->button() != Qt::LeftButton || !option.rect.contains(mouse->position().toPoint()))
            return false;
        break;
    }
    case QEvent::KeyPress:
        if (static_cast<QKeyEvent*>(event)->key() != Qt::Key_Space)
            return false;
        break;
    default:
        return event->type() == QEvent::MouseButtonDblClick; // the second release acts
    }
    m_grid->ActOn(index.row() + 1, index.column() + 1);
    return true;
}

QString CGridDelegate::Refusal() const
{
    return m_grid->Model()->Refusal(m_index.row(), m_index.column(), TextOf(m_editor));
}

const QWidget* CGridDelegate::TypedInto() const
{
    const bool isTyped = m_editor && m_index.isValid() && TextOf(m_editor) != m_index.data(Qt::EditRole).toString();
    return isTyped ? m_editor.data() : nullptr;
}

CString CGridDelegate::TypedPlace() const
{
    return m_grid->PlaceText(m_index);
}

CString CGridDelegate::Typed() const
{
    return TextOf(m_editor);
}

bool CGridDelegate::Enter()
{
    CGridModel& model = *m_grid->Model();
    const QSignalBlocker nobodyLooks(model);
    if (!model.setData(m_index, TextOf(m_editor), Qt::EditRole))
        return false;
    model.Store(BlankRule::Fill);
    return true;
}

bool CGridDelegate::Commit()
{
    if (!m_editor || !m_index.isValid())
        return true;
    if (m_telling)
        return false;
    QWidget* editor = m_editor;
    const QString refusal = Refusal();
    if (refusal.isEmpty()) {
        m_editor = nullptr; // closing takes the focus, which would commit again
        emit commitData(editor);
        emit closeEditor(editor);
        return true;
    }
    const QScopedValueRollback telling(m_telling, true);
    const ColumnSpec& column = m_grid->Model()->Column(m_index.column());
    TellRefusal(*editor, refusal,
                RefusalDetails(m_grid->PlaceText(m_index), TextOf(editor), BoundsText(column.bounds, column.style),
                               column.UnitSymbol()));
    return false;
}

/// Nobody asked before the focus went. A value is taken at once; a text that is none is told when the focus has
/// arrived.
void CGridDelegate::LostFocus(const QEvent* event)
{
    const auto reason = static_cast<const QFocusEvent*>(event)->reason();
    const QWidget* focus = QApplication::focusWidget();
    // The editor stays while another window or its own pop-up is in front, and a click into the grid is the grid's to
    // judge: it commits before the current cell moves.
    const bool inGrid = IsPartOf(focus, m_grid);
    if (StaysBeingEdited(reason) || inGrid || !m_grid->Host() || m_telling || !m_editor || !m_index.isValid())
        return;
    if (Refusal().isEmpty()) {
        Commit();
        m_grid->StoreEditedLine(BlankRule::Fill);
        return;
    }
    QTimer::singleShot(0, m_editor, [this] {
        if (!m_grid->isVisible() || !m_grid->isEnabled())
            emit closeEditor(m_editor); // what took the focus took the table away: the cell keeps its value
        else if (!m_editor->hasFocus())
            Commit();
    });
}

bool CGridDelegate::eventFilter(QObject* object, QEvent* event)
{
    if (object != m_editor)
        return QStyledItemDelegate::eventFilter(object, event);
    switch (event->type()) {
    case QEvent::FocusOut:
        LostFocus(event);
        return false;
    case QEvent::Wheel: // scrolls the table; an entry is taken on purpose only
        event->ignore();
        return true;
    case QEvent::ShortcutOverride:
    case QEvent::KeyPress: {
        const auto& pressed = *static_cast<QKeyEvent*>(event);
        auto* list = qobject_cast<QComboBox*>(m_editor);
        if (list && !list->isEditable() && pressed.key() == Qt::Key_Backspace && event->type() == QEvent::KeyPress) {
            list->setCurrentIndex(-1);
            return true;
        }
        const GridKey* key = FindGridKey(pressed);
        if (!key || !key->whileEditing)
            break;
        event->accept();
        if (event->type() == QEvent::KeyPress && Commit())
            m_grid->Input().Run(key->action);
        return true;
    }
    default:
        break;
    }
    return QStyledItemDelegate::eventFilter(object, event);
}
