// A paste that is doubtful asks; this answers.
#pragma once

#include <QApplication>
#include <QDialog>
#include <QTableView>
#include <QTimer>

/// Cancels the dialog that the next paste brings up, if it does. What it lists as not fitting, a line each, joins
/// `listed`, and is there as an empty text where nothing is listed.
inline void CancelPaste(QObject& context, QStringList& listed)
{
    QTimer::singleShot(0, &context, [&listed] {
        auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
        if (!dialog)
            return;
        QStringList lines;
        for (const auto* list : dialog->findChildren<QTableView*>()) {
            for (int row = 0; list->accessibleName() == "What does not fit" && row < list->model()->rowCount(); ++row) {
                QStringList texts;
                for (int column = 0; column < list->model()->columnCount(); ++column)
                    texts << list->model()->index(row, column).data().toString();
                lines << texts.join('|');
            }
        }
        listed << (lines.isEmpty() ? QStringList(QString()) : lines);
        dialog->reject();
    });
}
