// Which of the problems are in sight, and in which order.
#pragma once

#include "rules/rule.h"

#include <QSortFilterProxyModel>

class CProblemsFilter : public QSortFilterProxyModel
{
    Q_OBJECT
public:
    explicit CProblemsFilter(QObject* parent);

    void Show(Severity severity, bool shown);
    /// Only rows with every word of the text, in whatever column.
    void ShowOnly(const QString& words);

protected:
    bool filterAcceptsRow(int row, const QModelIndex& parent) const override;

private:
    bool m_shown[3] = {true, true, true}; // by severity
    QStringList m_words;
};
