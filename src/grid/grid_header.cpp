#include "grid/grid_header.h"

#include "grid/gen_grid.h"
#include "grid/grid_texts.h"
#include "grid/lines_view.h"
#include "grid/row_filter.h"
#include "ks/fc/doc.h"

#include <QAction>
#include <QContextMenuEvent>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QPainter>
#include <QScrollBar>
#include <QSignalBlocker>
#include <QStyle>
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

CGridHeader::CGridHeader(CGenGrid& grid) : QHeaderView(Qt::Horizontal, &grid), m_grid(grid), m_count(new QLabel(&grid))
{
    setSectionsClickable(true);
    setHighlightSections(false);
    m_count->hide();
    m_count->setObjectName(QStringLiteral("shownLines"));
    connect(this, &QHeaderView::sectionDoubleClicked, this,
            [this](int column) { LinesView::SortByClick(m_grid, column); });
    connect(this, &QHeaderView::sectionResized, this, &CGridHeader::PlaceFields);
    connect(grid.horizontalScrollBar(), &QScrollBar::valueChanged, this, &CGridHeader::PlaceFields);
    connect(grid.Model(), &CGridModel::ViewChanged, this, [this] {
        if (!m_fieldsShown && m_grid.Model()->Shown().IsFiltered())
            EnterFilter(-1);
        ShowTexts();
        ShowCount();
        viewport()->update();
    });
    for (auto changed : {&QAbstractItemModel::columnsInserted, &QAbstractItemModel::columnsRemoved})
        connect(grid.Model(), changed, this, [this] {
            if (m_fieldsShown)
                MakeFields();
        });
    connect(grid.Model(), &QAbstractItemModel::dataChanged, this, &CGridHeader::ShowCount);
}

// ---- what is painted ---------------------------------------------------------------------------

int CGridHeader::FieldHeight() const
{
    return m_fieldsShown && !m_fields.empty() ? m_fields.front()->sizeHint().height() : 0;
}

QSize CGridHeader::sizeHint() const
{
    const QSize headers = QHeaderView::sizeHint();
    return {headers.width(), headers.height() + FieldHeight()};
}

void CGridHeader::initStyleOptionForIndex(QStyleOptionHeader* option, int column) const
{
    QHeaderView::initStyleOptionForIndex(option, column);
    if (const QString unit = m_grid.Model()->Column(column).UnitLine(); !unit.isEmpty())
        option->text += u'\n' + unit;
    const auto& keys = m_grid.Model()->SortedBy();
    const auto key = std::ranges::find(keys, column, &SortKey::column);
    if (key != keys.end())
        option->sortIndicator = key->descending ? QStyleOptionHeader::SortUp : QStyleOptionHeader::SortDown;
}

/// Room for the unit's line.
QSize CGridHeader::sectionSizeFromContents(int column) const
{
    QSize size = QHeaderView::sectionSizeFromContents(column);
    if (!m_grid.Model()->Column(column).UnitLine().isEmpty())
        size.rheight() += fontMetrics().lineSpacing();
    return size;
}

void CGridHeader::paintSection(QPainter* painter, const QRect& rect, int column) const
{
    QHeaderView::paintSection(painter, rect.adjusted(0, 0, 0, -FieldHeight()), column);
}

void CGridHeader::contextMenuEvent(QContextMenuEvent* event)
{
    const int column = logicalIndexAt(event->pos());
    if (column >= 0 && m_grid.CommitEditor())
        LinesView::ShowMenu(m_grid, column, event->globalPos());
}

void CGridHeader::ShowCount()
{
    const CGridModel& model = *m_grid.Model();
    const bool isFiltered = model.Shown().IsFiltered();
    if (isFiltered) {
        const int fixed = model.FixedRows();
        m_count->setText(
            GridTexts::tr("%1 of %2 shown").arg(model.StoredRows() - fixed).arg(int(model.Rows()->Count()) - fixed));
    }
    if (m_count->isVisibleTo(&m_grid) == isFiltered)
        return;
    if (isFiltered) {
        QFont font = m_grid.font(); // that fits beside a scroll bar
        font.setPixelSize(std::min(m_grid.fontMetrics().ascent(),
                                   style()->pixelMetric(QStyle::PM_ScrollBarExtent, nullptr, &m_grid) - 4));
        m_count->setFont(font);
        m_grid.addScrollBarWidget(m_count, Qt::AlignLeft);
    }
    m_count->setVisible(isFiltered);
    m_grid.setHorizontalScrollBarPolicy(isFiltered ? Qt::ScrollBarAlwaysOn : Qt::ScrollBarAsNeeded);
}

// ---- the fields --------------------------------------------------------------------------------

int CGridHeader::ColumnOf(const QObject* field) const
{
    const auto found = std::ranges::find(m_fields, field);
    return found == m_fields.end() ? -1 : int(found - m_fields.begin());
}

void CGridHeader::MakeFields()
{
    const int columns = m_grid.ColumnCount();
    while (int(m_fields.size()) > columns) {
        delete m_fields.back();
        m_fields.pop_back();
    }
    while (int(m_fields.size()) < columns) {
        const int column = int(m_fields.size());
        auto* field = new CFilterField(this);
        field->setObjectName(QStringLiteral("filter%1").arg(column + 1));
        field->installEventFilter(this);
        QPalette colours = palette(); // a theme may have one for hints that nobody sees
        QColor hint = colours.color(QPalette::Text);
        hint.setAlphaF(0.6F);
        colours.setColor(QPalette::PlaceholderText, hint);
        field->setPalette(colours);
        connect(field, &QLineEdit::textChanged, this, &CGridHeader::Typed);
        if (OffersTexts(m_grid.Model()->Column(column))) {
            auto* offer = field->addAction(DownIcon(palette()), QLineEdit::TrailingPosition);
            connect(offer, &QAction::triggered, this, [this, column] { OfferTexts(column); });
        }
        m_fields.push_back(field);
    }
    ShowTexts();
    for (QLineEdit* field : m_fields)
        field->setVisible(m_fieldsShown);
    PlaceFields();
    emit geometriesChanged();
}

void CGridHeader::PlaceFields()
{
    if (!m_fieldsShown)
        return;
    const int height = FieldHeight();
    for (int column = 0; column < std::min(count(), int(m_fields.size())); ++column)
        m_fields[std::size_t(column)]->setGeometry(sectionViewportPosition(column), this->height() - height,
                                                   sectionSize(column), height);
}

void CGridHeader::resizeEvent(QResizeEvent* event)
{
    QHeaderView::resizeEvent(event);
    PlaceFields();
}

void CGridHeader::changeEvent(QEvent* event)
{
    QHeaderView::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        ShowTexts();
        ShowCount();
    }
}

/// In the fields what the lines are filtered by.
void CGridHeader::ShowTexts()
{
    const CGridModel& model = *m_grid.Model();
    for (std::size_t i = 0; i < m_fields.size(); ++i) {
        QLineEdit& field = *m_fields[i];
        const ColumnSpec& column = model.Column(int(i));
        const QSignalBlocker quiet(field);
        const QString text = model.Filters().value(qsizetype(i));
        if (field.text() != text)
            field.setText(text);
        field.setAccessibleName(GridTexts::tr("Filter of %1").arg(column.header()));
        field.setPlaceholderText(GridTexts::tr("Filter"));
        const QString refusal = CCellFilter(column, text).Refusal();
        field.setToolTip(!refusal.isEmpty()    ? refusal
                         : OffersTexts(column) ? GridTexts::tr("Text that the cells contain; =text for the whole cell, "
                                                               "\"\" for empty ones. Alt+Down shows what there is.")
                                               : GridTexts::tr("12.5, >5, <=3, 2..7, =4, !=4, \"\" for empty cells"));
        QPalette colours = palette();
        if (!refusal.isEmpty())
            colours.setColor(QPalette::Text, Qt::red);
        field.setPalette(colours);
    }
}

void CGridHeader::Typed()
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

void CGridHeader::EnterFilter(int column)
{
    m_fieldsShown = true;
    MakeFields();
    if (column < 0 || m_fields.empty())
        return;
    QLineEdit& field = *m_fields[std::size_t(std::min(column, int(m_fields.size()) - 1))];
    field.setFocus(Qt::OtherFocusReason);
    field.selectAll();
}

void CGridHeader::LeaveFilter()
{
    if (IsTypingFilter())
        m_grid.setFocus(Qt::OtherFocusReason);
    m_fieldsShown = false;
    for (QLineEdit* field : m_fields)
        field->hide();
    m_grid.ChangeView([](CGridModel& model) { model.Filter({}); });
    emit geometriesChanged();
}

bool CGridHeader::IsTypingFilter() const
{
    return std::ranges::any_of(m_fields, [](const QLineEdit* field) { return field->hasFocus(); });
}

/// What the cells of the column hold: one of them is filtered by at once.
void CGridHeader::OfferTexts(int column)
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
        menu.addAction(shown.replace(u'&', QStringLiteral("&&")), &field,
                       [&field, condition] { field.setText(condition); });
    }
    menu.exec(field.mapToGlobal(QPoint(0, field.height())));
}

bool CGridHeader::KeyPressed(int column, int key)
{
    QLineEdit& field = *m_fields[std::size_t(column)];
    switch (key) {
    case Qt::Key_Escape:
        if (field.text().isEmpty())
            LeaveFilter();
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
bool CGridHeader::eventFilter(QObject* object, QEvent* event)
{
    const int column = ColumnOf(object);
    if (column < 0)
        return QHeaderView::eventFilter(object, event);
    switch (event->type()) {
    case QEvent::MouseButtonPress:
        return !m_grid.CommitEditor();
    case QEvent::FocusIn:
        m_grid.StoreEditedLine();
        if (m_grid.RowCount() > 0)
            m_grid.scrollTo(m_grid.Model()->index(std::max(0, m_grid.rowAt(0)), column));
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
