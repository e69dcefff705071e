#include "grid/filter_fields.h"

#include "grid/frozen_columns.h"
#include "grid/gen_grid.h"
#include "grid/grid_header.h"
#include "grid/grid_texts.h"
#include "grid/row_filter.h"
#include "ks/fc/doc.h"
#include "ks/units/edit_fields.h"

#include <QAction>
#include <QKeyEvent>
#include <QLineEdit>
#include <QMenu>
#include <QPainter>
#include <QSignalBlocker>
#include <algorithm>

namespace {

constexpr int MostTexts = 500; // that a field offers

/// A triangle that points down, to be seen on light and dark.
QIcon DownIcon(const QPalette& colours)
{
    QPixmap picture(16, 16);
    picture.fill(Qt::transparent);
    QPainter painter(&picture);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(colours.color(QPalette::Text));
    painter.drawPolygon(QPolygonF({{3, 6}, {13, 6}, {8, 11}}));
    painter.end();
    return picture;
}

/// What it does not need is no key of the grid below it.
class CFilterField : public QLineEdit
{
public:
    using QLineEdit::QLineEdit;

protected:
    void keyPressEvent(QKeyEvent* event) override
    {
        QLineEdit::keyPressEvent(event);
        event->accept();
    }
};

bool OffersTexts(const ColumnSpec& column)
{
    return column.Kind() == CellKind::Text || column.Kind() == CellKind::TextChoice;
}

} // namespace

CFilterFields::CFilterFields(CGenGrid& grid, CGridHeader& header) : QObject(&header), m_grid(grid), m_header(header)
{
    for (auto changed : {&QAbstractItemModel::columnsInserted, &QAbstractItemModel::columnsRemoved})
        connect(grid.Model(), changed, this, [this] {
            if (m_shown)
                Make();
        });
}

int CFilterFields::Height() const
{
    return m_shown && !m_fields.empty() ? m_fields.front()->sizeHint().height() : 0;
}

int CFilterFields::ColumnOf(const QObject* field) const
{
    const auto found = std::ranges::find(m_fields, field);
    return found == m_fields.end() ? -1 : int(found - m_fields.begin());
}

void CFilterFields::Make()
{
    const int columns = m_grid.ColumnCount();
    while (int(m_fields.size()) > columns) {
        delete m_fields.back();
        m_fields.pop_back();
    }
    while (int(m_fields.size()) < columns) {
        const int column = int(m_fields.size());
        auto* field = new CFilterField(&m_header);
        field->setObjectName(QStringLiteral("filter%1").arg(column + 1));
        field->installEventFilter(this);
        connect(field, &QLineEdit::textChanged, this, &CFilterFields::Typed);
        if (OffersTexts(m_grid.Model()->Column(column))) {
            auto* offer = field->addAction(DownIcon(m_header.palette()), QLineEdit::TrailingPosition);
            connect(offer, &QAction::triggered, this, [this, column] { OfferTexts(column); });
        }
        m_fields.push_back(field);
    }
    ShowTexts();
    for (QLineEdit* field : m_fields)
        field->setVisible(m_shown);
    Place();
    emit m_header.geometriesChanged();
}

void CFilterFields::Place()
{
    if (!m_shown)
        return;
    const CFrozenColumns& frozen = m_grid.Frozen();
    const int height = Height();
    for (int column = 0; column < std::min(m_header.count(), int(m_fields.size())); ++column) {
        QLineEdit& field = *m_fields[std::size_t(column)];
        const QRect below(m_header.sectionViewportPosition(column), m_header.height() - height,
                          m_header.sectionSize(column), height);
        field.setGeometry(frozen.Seen(below, column));
    }
}

/// In the fields what the lines are filtered by.
void CFilterFields::ShowTexts()
{
    const CGridModel& model = *m_grid.Model();
    for (std::size_t i = 0; i < m_fields.size(); ++i) {
        QLineEdit& field = *m_fields[i];
        const ColumnSpec& column = model.Column(int(i));
        const QSignalBlocker quiet(field);
        const QString text = model.Filters().value(qsizetype(i));
        if (field.text() != text) {
            field.setText(text);
            field.setCursorPosition(0);
        }
        field.setAccessibleName(GridTexts::tr("Filter of %1").arg(column.header()));
        const QString refusal = CCellFilter(column, text).Refusal();
        field.setToolTip(!refusal.isEmpty()    ? refusal
                         : OffersTexts(column) ? GridTexts::tr("Text that the cells contain; =text for the whole cell, "
                                                               "\"\" for empty ones. Alt+Down shows what there is.")
                                               : GridTexts::tr("12.5, >5, <=3, 2..7, =4, !=4, \"\" for empty cells"));
        QPalette colours = field.palette();
        colours.setColor(QPalette::Text,
                         refusal.isEmpty() ? m_header.palette().color(QPalette::Text) : QColor(Qt::red));
        field.setPalette(colours);
        KsShowHint(field, GridTexts::tr("Filter"));
    }
}

void CFilterFields::Typed()
{
    QStringList texts;
    QString refusal;
    for (int column = 0; column < int(m_fields.size()); ++column) {
        texts << m_fields[std::size_t(column)]->text();
        const QString why = CCellFilter(m_grid.Model()->Column(column), texts.back()).Refusal();
        refusal = refusal.isEmpty() ? why : refusal;
    }
    m_grid.ChangeView([&](CGridModel& model) { model.Filter(texts); });
    if (!refusal.isEmpty() && m_grid.Model()->Document())
        m_grid.Model()->Document()->Say(refusal);
}

void CFilterFields::Enter(int column)
{
    m_shown = true;
    Make();
    if (column < 0 || m_fields.empty())
        return;
    QLineEdit& field = *m_fields[std::size_t(std::min(column, int(m_fields.size()) - 1))];
    field.setFocus(Qt::OtherFocusReason);
    field.selectAll();
}

void CFilterFields::Leave()
{
    if (HaveFocus())
        m_grid.setFocus(Qt::OtherFocusReason);
    m_shown = false;
    for (QLineEdit* field : m_fields)
        field->hide();
    m_grid.ChangeView([](CGridModel& model) { model.Filter({}); });
    emit m_header.geometriesChanged();
}

bool CFilterFields::HaveFocus() const
{
    return std::ranges::any_of(m_fields, [](const QLineEdit* field) { return field->hasFocus(); });
}

/// What the cells of the column hold: one of them is filtered by at once.
void CFilterFields::OfferTexts(int column)
{
    QLineEdit& field = *m_fields[std::size_t(column)];
    QMenu menu(&field);
    menu.addAction(GridTexts::tr("All"), &field, &QLineEdit::clear);
    menu.addSeparator();
    const CGridModel& model = *m_grid.Model();
    const QStringList texts = model.Rows() ? TextsOf(*model.Rows(), model.Column(column), MostTexts) : QStringList();
    for (const QString& text : texts) {
        const QString condition = text.isEmpty() ? QStringLiteral("\"\"") : u'=' + text;
        QString shown = text.isEmpty() ? GridTexts::tr("(empty)") : text;
        menu.addAction(shown.replace(u'&', QStringLiteral("&&")), &field, [&field, condition] {
            field.setText(condition);
            field.setCursorPosition(0); // where it is longer than the field its beginning says more
        });
    }
    menu.exec(field.mapToGlobal(QPoint(0, field.height())));
}

bool CFilterFields::KeyPressed(int column, int key)
{
    QLineEdit& field = *m_fields[std::size_t(column)];
    switch (key) {
    case Qt::Key_Escape:
        if (field.text().isEmpty())
            Leave();
        else
            field.clear();
        return true;
    case Qt::Key_Return:
    case Qt::Key_Enter:
    case Qt::Key_Down:
        if (m_grid.CurrentRow() == 0 && m_grid.RowCount() > 0)
            m_grid.SetCurrentCell(m_grid.Model()->FixedRows() + 1, column + 1);
        m_grid.setFocus(Qt::OtherFocusReason);
        return true;
    default:
        return false;
    }
}

/// Of the fields. What is being typed into a cell is stored or refused before a field takes the keys.
bool CFilterFields::eventFilter(QObject* object, QEvent* event)
{
    const int column = ColumnOf(object);
    if (column < 0)
        return QObject::eventFilter(object, event);
    switch (event->type()) {
    case QEvent::MouseButtonPress:
        return !m_grid.CommitEditor();
    case QEvent::FocusIn:
        m_grid.StoreEditedLine();
        if (m_grid.RowCount() > 0)
            m_grid.scrollTo(m_grid.Model()->index(std::max(0, m_grid.rowAt(0)), column));
        return false;
    case QEvent::FocusOut:
        static_cast<QLineEdit*>(object)->home(false);
        return false;
    case QEvent::KeyPress: {
        const auto& pressed = *static_cast<QKeyEvent*>(event);
        if (pressed.key() == Qt::Key_Down && pressed.modifiers().testFlag(Qt::AltModifier)) {
            if (OffersTexts(m_grid.Model()->Column(column)))
                OfferTexts(column);
            return true;
        }
        return KeyPressed(column, pressed.key());
    }
    default:
        return false;
    }
}
