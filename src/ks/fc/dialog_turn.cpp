#include "ks/fc/dialog_turn.h"

#include <QApplication>
#include <QDialog>
#include <QTimer>

void KsShowInTurn(QDialog* dialog)
{
    const auto* before = qobject_cast<const QDialog*>(QApplication::activeModalWidget());
    if (!before || before == dialog) {
        dialog->show();
        dialog->raise();
        dialog->activateWindow();
        return;
    }
    // When what its end brings about is over: that may be another one.
    QObject::connect(
        before, &QDialog::finished, dialog,
        [dialog] { QTimer::singleShot(0, dialog, [dialog] { KsShowInTurn(dialog); }); }, Qt::SingleShotConnection);
}
