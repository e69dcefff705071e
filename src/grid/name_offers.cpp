#include "grid/name_offers.h"

#include <QComboBox>
#include <QKeyEvent>
#include <QLineEdit>
#include <algorithm>

namespace {

constexpr int MostRows = 12; // in sight at a time

} // namespace

CNameOffers::CNameOffers(QComboBox* list, QWidget* view) : QListWidget(view), m_list(list)
{
    hide();
    setFocusPolicy(Qt::NoFocus);
    setFocusProxy(list); // a click here leaves the focus where the user types
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    list->setCompleter(nullptr); // it would complete in the cell, where a name that starts another could not be typed
    list->installEventFilter(this);
    connect(list->lineEdit(), &QLineEdit::textEdited, this, &CNameOffers::Offer);
    connect(list, &QObject::destroyed, this, &QObject::deleteLater);
    connect(this, &QListWidget::itemPressed, this, [this](const QListWidgetItem* item) {
        Take(row(item));
        hide();
    });
}

void CNameOffers::Offer(const QString& typed)
{
    clear();
    for (int entry = 0; !typed.isEmpty() && entry < m_list->count(); ++entry) {
        const QString name = m_list->itemText(entry);
        if (name.startsWith(typed, Qt::CaseInsensitive) && name.size() > typed.size())
            addItem(name);
    }
    setVisible(count() > 0);
    if (count() > 0)
        Place();
}

/// Below the cell, or above it where there is more room.
void CNameOffers::Place()
{
    const int wanted = sizeHintForRow(0) * std::min(count(), MostRows) + 2 * frameWidth();
    const QPoint top = m_list->mapTo(parentWidget(), QPoint());
    const int below = parentWidget()->height() - top.y() - m_list->height();
    const bool isBelow = below >= std::min(wanted, top.y());
    const int height = std::min(wanted, isBelow ? below : top.y());
    setGeometry(top.x(), isBelow ? top.y() + m_list->height() : top.y() - height, m_list->width(), height);
    raise();
}

void CNameOffers::Take(int row)
{
    setCurrentRow(row);
    if (currentItem())
        m_list->lineEdit()->setText(currentItem()->text());
}

bool CNameOffers::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::FocusOut || event->type() == QEvent::Hide)
        hide();
    if (event->type() == QEvent::KeyPress && isVisible()) {
        const int key = static_cast<QKeyEvent*>(event)->key();
        if (key == Qt::Key_Down || key == Qt::Key_Up) {
            Take(std::clamp(currentRow() + (key == Qt::Key_Down ? 1 : -1), 0, count() - 1));
            return true;
        }
    }
    return QListWidget::eventFilter(object, event);
}
