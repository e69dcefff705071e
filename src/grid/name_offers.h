// Names offered below an editable drop-down list while the user types into it.
#pragma once

#include <QListWidget>
#include <QPointer>

class QComboBox;

/// A plain child of the view and no pop-up: it neither takes keys away from what is being typed, however fast, nor the
/// first click that goes elsewhere. A name is taken with the arrow keys or a click, never by itself.
class CNameOffers : public QListWidget
{
public:
    /// Offers the entries of `list`, which is about to be shown in `view`; goes with it.
    CNameOffers(QComboBox* list, QWidget* view);

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    void Offer(const QString& typed);
    void Place();
    void Take(int row);

    QPointer<QComboBox> m_list;
};
